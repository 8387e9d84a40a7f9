# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# A project whose commands only say that they ran; the tests give three numbers.
project_with_commands() {
  mkdir -- "$project/scripts" "$project/.ci"
  cp -- "$root/.ci/run" "$project/.ci/"
  cp -- "$root/scripts/common" "$project/scripts/"
  command_that test <<<'echo "skipped: a: no volume"; echo "5 passed, 0 failed, 1 skipped"'
  command_that run <<<'echo called'
  command_that scripts/check <<<'echo checked'
  command_that scripts/docs <<<'echo documented'
  command_that scripts/reproduce <<<'echo reproduced'
  command_that scripts/install-office <<<'echo "skipped: office: no such package"'
  command_that scripts/check-headers <<<'echo "headers with $CXX"'
  command_that scripts/analyze <<<'echo analyzed'
}

command_that() {
  {
    echo '#!/bin/sh'
    cat
  } >"$project/$1"
  chmod +x -- "$project/$1"
}

AllStepsPass() {
  project_with_commands
  expect_success bash "$project/.ci/run"
  expect_said "headers with clang++"
  expect_said documented
  expect_not_said "failed step"
  [ "$(grep -c "^skipped: office: no such package" <<<"$output")" -eq 2 ] || fail "no reason in the summary"
  expect_last_line "15 passed, 0 failed, 3 skipped"
}

AFailedStepIsNamedAndStopsNoOther() {
  project_with_commands
  command_that test <<<'echo "3 passed, 1 failed, 0 skipped"; exit 1'
  command_that scripts/check <<<'exit 1'
  expect_failure 1 "failed step: checks" bash "$project/.ci/run"
  expect_said "failed step: tests, g++"
  expect_said called
  expect_said "headers with"
  expect_said analyzed
  expect_last_line "9 passed, 3 failed, 0 skipped"
}

AStepThatFailsBeforeItsTestsIsAFailure() {
  project_with_commands
  command_that test <<<'exit 1'
  expect_failure 1 "failed step: tests, g++" bash "$project/.ci/run"
  expect_last_line "0 passed, 0 failed, 0 skipped"
}

AClosedInputIsNoHindrance() {
  project_with_commands
  expect_success bash "$project/.ci/run" <&-
}

run_case "$@"
