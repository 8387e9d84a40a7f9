# Sourced by the tests of the scripts. Each test is a function in a *Test.sh file, named after what
# it shows, and runs in a shell of its own with an empty folder to work in:
#
#     bash CheckFormatTest.sh AFileOutOfShapeFails
# shellcheck shell=bash

set -euo pipefail

# shellcheck disable=SC2034 # read by the tests
root=$(readlink -f -- "$(dirname -- "${BASH_SOURCE[0]}")/../..")
work=$(mktemp -d)
trap 'rm -rf -- "$work"' EXIT
# What a script works on; the name has all that a path may spring on it.
project="$work/a (clone): Größe's, 東京"
mkdir -- "$project"

# A git hook that runs the tests must not lend them its repository.
unset GIT_DIR GIT_WORK_TREE GIT_INDEX_FILE
export GIT_CONFIG_GLOBAL=/dev/null GIT_CONFIG_NOSYSTEM=1
export GIT_AUTHOR_NAME=Ada GIT_AUTHOR_EMAIL=ada@example.org
export GIT_COMMITTER_NAME=Ada GIT_COMMITTER_EMAIL=ada@example.org

# What is quoted is indented, so that no line of it is taken for one of this test.
fail() {
  printf 'FAILED: %s\n' "$*" >&2
  output=${output:-nothing}
  printf 'it said: %s\n' "${output//$'\n'/$'\n  '}" >&2
  exit 1
}

skip() {
  printf '[  SKIPPED ] %s\n' "$*"
  exit 0
}

# Runs the case that is named.
run_case() {
  [ "$(type -t -- "${1:-}")" = function ] || fail "there is no case ${1:-}"
  "$1"
}

# Runs a command; what it said is in `output`, both streams, and how it ended in `status`.
try() {
  status=0
  output=$("$@" 2>&1) || status=$?
}

expect_status() {
  [ "$status" -eq "$1" ] || fail "ended with $status, not $1"
}

expect_success() {
  try "$@"
  expect_status 0
}

# expect_failure <status> <text> <command>...: the command ends so and says the text.
expect_failure() {
  local expected=$1 text=$2
  shift 2
  try "$@"
  expect_status "$expected"
  expect_said "$text"
}

expect_said() {
  [[ $output == *"$1"* ]] || fail "not said: $1"
}

expect_not_said() {
  [[ $output != *"$1"* ]] || fail "said: $1"
}

expect_one_line() {
  [ "$(wc -l <<<"$output")" -eq 1 ] || fail "more than one line"
}

expect_last_line() {
  [ "$(tail -n 1 <<<"$output")" = "$1" ] || fail "the last line is not: $1"
}

# add_file <path in the project>: writes the standard input there.
add_file() {
  mkdir -p -- "$(dirname -- "$project/$1")"
  cat >"$project/$1"
}

# Makes the project a repository with all that lies in it.
commit_all() {
  commit_all_as "Add files"
}

# commit_all_as <message>
commit_all_as() {
  git -C "$project" init --quiet
  git -C "$project" add --all
  git -C "$project" commit --quiet --allow-empty --message "$1"
}
