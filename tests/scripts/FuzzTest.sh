# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/system.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/system.sh"

# target <name> <body>: a fuzz target that has been built, and does this.
target() {
  mkdir -p -- "$project/fuzz/corpus/$1" "$project/build/fuzz/fuzz"
  printf '#!/usr/bin/env bash\necho "%s $*" >>"$WORK/calls"\n%s\n' "$1" "$2" \
    >"$project/build/fuzz/fuzz/$1"
  chmod +x -- "$project/build/fuzz/fuzz/$1"
}

prepare() {
  debian
  printf '%s\n' clang libclang-rt-14-dev >>"$work/installed"
  stub cmake </dev/null
  remove_package openjdk-17-jdk-headless
  rm -- "$work/bin/javac"
  target FirstFuzz 'echo "#7 NEW cov: 12 ft: 3"; echo "stat::number_of_executed_units: 345"'
}

EachTargetIsToldOf() {
  prepare
  target SecondFuzz 'echo "#7 NEW cov: 6 ft: 3"'
  expect_success "$project/scripts/fuzz" 5
  expect_said "FirstFuzz                       345 runs     12 branches  nothing found"
  expect_said "SecondFuzz                        ? runs      6 branches  nothing found"
  expect_last_line "fuzz: nothing found"
  grep -q '^FirstFuzz -max_total_time=5 .*/fuzz/corpus/FirstFuzz$' "$work/calls" ||
    fail "not run for 5 seconds on its corpus: $(cat "$work/calls")"
}

AFindingFailsAndStopsNoOther() {
  prepare
  target BrokenFuzz 'exit 77'
  expect_failure 1 "FOUND, see" "$project/scripts/fuzz"
  expect_said "inputs that break a target lie in $project/build/fuzz/findings"
  expect_said "FirstFuzz                       345 runs     12 branches  nothing found"
}

OnlyMatchingTargetsRun() {
  prepare
  target BrokenFuzz 'exit 77'
  expect_success "$project/scripts/fuzz" 5 '^First'
  expect_not_said BrokenFuzz
}

ANameThatMatchesNothingFails() {
  prepare
  expect_failure 1 "no fuzz target matches Third" "$project/scripts/fuzz" 5 Third
}

AWrongTimeShowsTheUsage() {
  prepare
  local seconds
  for seconds in 0 -1 5s ''; do
    expect_failure 2 "usage: scripts/fuzz" "$project/scripts/fuzz" "$seconds"
  done
}

run_case "$@"
