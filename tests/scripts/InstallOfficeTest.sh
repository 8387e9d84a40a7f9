# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/system.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/system.sh"

TheOfficeIsInstalled() {
  debian
  expect_success "$project/scripts/install-office"
  expect_not_said skipped
  expect_calls "apt-get install libreoffice-core-nogui liblibreoffice-java ure-java"
}

AnOfficeThatIsThereIsLeftAlone() {
  debian
  printf '%s\n' libreoffice-core-nogui liblibreoffice-java ure-java >>"$work/installed"
  expect_success "$project/scripts/install-office"
  expect_calls ""
}

AnOfficeThatCannotBeHadIsSkippedWithTheReason() {
  debian
  stub apt-get <<<'echo "E: Unable to locate package ure-java" >&2; exit 100'
  expect_success "$project/scripts/install-office"
  expect_said "skipped: office: "
  expect_said "E: Unable to locate package ure-java"
  expect_one_line
}

NothingIsRemovedForIt() {
  debian
  expect_success "$project/scripts/install-office"
  grep -qF -- "-o APT::Get::Remove=false " "$work/calls" || fail "called: $(cat "$work/calls")"
}

run_case "$@"
