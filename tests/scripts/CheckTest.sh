# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# project_with <script> <status>...: a project whose checks end so.
project_with() {
  mkdir -- "$project/scripts"
  cp -- "$root/scripts/check" "$root/scripts/common" "$project/scripts/"
  while [ $# -gt 0 ]; do
    printf '#!/bin/sh\necho "%s ran"\nexit %s\n' "$1" "$2" >"$project/scripts/$1"
    chmod +x -- "$project/scripts/$1"
    shift 2
  done
}

AllChecksRun() {
  project_with check-a 0 check-b 0
  expect_success "$project/scripts/check"
  expect_said "check-a ran"
  expect_said "check-b ran"
}

AFailedCheckIsNamedAndStopsNoOther() {
  project_with check-a 1 check-b 0 check-c 3
  expect_failure 1 "failed: check-a check-c" "$project/scripts/check"
  expect_said "check-b ran"
}

run_case "$@"
