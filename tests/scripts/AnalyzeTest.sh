# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# project_with <status of clang-tidy> <status of cppcheck>: nothing is installed or configured.
project_with() {
  mkdir -- "$project/scripts"
  cp -- "$root/scripts/analyze" "$root/scripts/common" "$project/scripts/"
  echo 'packages_test=(); install_packages() { :; }' \
    >"$project/scripts/packages"
  echo 'configure() { say "configured $*"; }' >"$project/scripts/build"
  printf '#!/bin/sh\necho "clang-tidy ran"\nexit %s\n' "$1" >"$project/scripts/analyze-clang-tidy"
  printf '#!/bin/sh\necho "cppcheck ran"\nexit %s\n' "$2" >"$project/scripts/analyze-cppcheck"
  chmod +x -- "$project"/scripts/analyze-*
}

BothToolsRun() {
  project_with 0 0
  expect_success "$project/scripts/analyze"
  expect_said "configured release"
  expect_said "clang-tidy ran"
  expect_said "cppcheck ran"
  expect_not_said "found something"
}

AFindingOfTheFirstIsAFailureAndStopsNotTheSecond() {
  project_with 123 0
  expect_failure 1 "clang-tidy found something" "$project/scripts/analyze"
  expect_said "cppcheck ran"
}

AFindingOfTheSecondIsAFailure() {
  project_with 0 1
  expect_failure 1 "cppcheck found something" "$project/scripts/analyze"
}

run_case "$@"
