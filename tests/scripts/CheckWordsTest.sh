# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# The words are put together here, so that this file holds none of them.
S=spec
P=Part

rejects() {
  add_file docs/a.md <<<"Before. $1 After."
  commit_all
  expect_failure 1 "docs/a.md:1" "$root/scripts/check-words" "$project"
}

accepts() {
  add_file docs/a.md <<<"Before. $1 After."
  commit_all
  expect_success "$root/scripts/check-words" "$project"
}

ANumberedChapterFails() { rejects "See ${P} 3.4."; }
NumberedChaptersFail() { rejects "see ${P,}s 3.4 and 3.5"; }
TheTextBehindFails() { rejects "as the $S says"; }
ItsFileFails() { rejects "in $S.md"; }
ItsDemandFails() { rejects "${S}ification demands it"; }
ItsAuthorityFails() { rejects "as ${S}ified"; }
ItsAuthorityInBriefFails() { rejects "four units, per $S"; }
APlaceOfOneMachineFails() { rejects "look into ""/wo""rk/x"; }
AThirdPlaceOfOneMachineFails() { rejects "look into ""/tmp/w""t-x"; }
AnotherPlaceOfOneMachineFails() { rejects "look into ""/fa""rm/x"; }

AFolderOfTheSameNameElsewherePasses() {
  accepts "/srv/wo""rk/x, \${root}/wo""rk/x, a/fa""rm/x"
}

OrdinaryWordsPass() { accepts "The special part of 3 specifications, in parts; the spectrum."; }

AnUntrackedFileIsSearched() {
  commit_all
  add_file new.txt <<<"the $S"
  expect_failure 1 "new.txt:1" "$root/scripts/check-words" "$project"
}

AFileNameFails() {
  add_file "$S.md" <<<"nothing"
  commit_all
  expect_failure 1 "found in a file's name" "$root/scripts/check-words" "$project"
}

ACommitMessageFails() {
  add_file a.txt <<<"nothing"
  commit_all_as "Add the reader

The order is the one of ${P} 5.1."
  commit_all_as "Another"
  expect_failure 1 "Add the reader" "$root/scripts/check-words" "$project"
  expect_not_said Another
}

AFolderWithoutARepositoryFails() {
  expect_failure 128 "not a git repository" "$root/scripts/check-words" "$project"
}

run_case "$@"
