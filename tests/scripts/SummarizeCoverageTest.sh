# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

add_file src/1Base/Sample/Sample.cpp <<'END'
#include "Macro.h"
int sample(int x) {
    CHECK(x);
    if (x > 3)
        return 1;
    if constexpr (sizeof(x) == 4)
        return 2;
    return 3;
}
END

# counts <x > 3: true> <false> <failed check> <passed check>: what llvm-cov tells of the sample in
# two instantiations, the second of which was never called.
counts() {
  cat >"$work/counts.json" <<END
{"data": [{
  "files": [
    {"filename": "$project/src/1Base/Sample/Sample.cpp",
     "summary": {"lines": {"count": 8, "covered": 6}}},
    {"filename": "/usr/include/c++/12/vector", "summary": {"lines": {"count": 99, "covered": 1}}}],
  "functions": [
    {"filenames": ["$project/src/1Base/Sample/Sample.cpp", "$project/src/1Base/Sample/Macro.h"],
     "branches": [[4, 9, 4, 14, $1, $2, 0, 0, 4], [6, 19, 6, 33, 0, 0, 0, 0, 4],
                  [1, 33, 1, 37, $3, $4, 1, 0, 4]],
     "regions": [[2, 19, 9, 2, 5, 0, 0, 0], [3, 5, 3, 10, 5, 0, 1, 1], [1, 33, 1, 37, 5, 1, 0, 0],
                 [4, 9, 4, 14, 5, 0, 0, 0], [6, 19, 6, 33, 5, 0, 0, 0]]},
    {"filenames": ["$project/src/1Base/Sample/Sample.cpp", "$project/src/1Base/Sample/Macro.h"],
     "branches": [[4, 9, 4, 14, 0, 0, 0, 0, 4], [6, 19, 6, 33, 0, 0, 0, 0, 4]],
     "regions": []},
    {"filenames": ["/usr/include/c++/12/vector"], "branches": [[1, 1, 1, 2, 0, 0, 0, 0, 4]],
     "regions": []}]}]}
END
}

summarize() {
  "$root/scripts/summarize-coverage" "$work/counts.json" --root "$project" "$@"
}

WhatIsAllTakenPasses() {
  counts 1 4 1 4
  expect_success summarize
  expect_said "1Base/Sample                     lines  75.0 % of      8   branches 100.0 % of      4"
  expect_said "0 branches are never taken"
}

AnUntakenBranchFails() {
  counts 0 5 1 4
  expect_failure 1 $'no reason: src/1Base/Sample/Sample.cpp:4\tif (x > 3)\tx > 3\ttrue' summarize
  expect_said "branches  75.0 % of      4"
}

ABranchInAMacroBelongsToItsUse() {
  counts 1 4 0 5
  expect_failure 1 $'no reason: src/1Base/Sample/Sample.cpp:3\tCHECK(x);\tCHECK\ttrue' summarize
}

AKnownReasonPasses() {
  counts 0 5 1 4
  printf '# a comment\n%s\tNo number is that large.\n' \
    $'src/1Base/Sample/Sample.cpp\tif (x > 3)\tx > 3\ttrue' |
    add_file tests/untaken-branches.tsv
  expect_success summarize
  expect_said "1 branches are never taken, 1 of them for a known reason"
}

AReasonThatNoBranchNeedsFails() {
  counts 1 4 1 4
  printf '%s\tNo number is that large.\n' \
    $'src/1Base/Sample/Sample.cpp\tif (x > 3)\tx > 3\ttrue' |
    add_file tests/untaken-branches.tsv
  expect_failure 1 $'needs no reason: src/1Base/Sample/Sample.cpp\tif (x > 3)' summarize
}

ARowWithoutAReasonIsRefused() {
  counts 0 5 1 4
  printf 'src/1Base/Sample/Sample.cpp\tif (x > 3)\tx > 3\ttrue\n' |
    add_file tests/untaken-branches.tsv
  expect_failure 1 "not four texts and a reason" summarize
}

TheTotalsGoIntoTheReadme() {
  counts 1 4 0 5
  # shellcheck disable=SC2016 # no command, but code in the text
  add_file README.md <<<'| lines and branches of `src/` that are reached | old | not tried |'
  try summarize --update
  expect_status 1
  grep -qF '| 75.0 % of 8 lines, 75.0 % of 4 branches | not tried |' "$project/README.md" ||
    fail "README.md: $(cat "$project/README.md")"
}

AReadmeWithoutTheRowIsRefused() {
  counts 1 4 1 4
  add_file README.md </dev/null
  expect_failure 1 "README.md has no row" summarize --update
}

run_case "$@"
