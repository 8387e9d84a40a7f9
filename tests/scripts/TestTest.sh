# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/system.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/system.sh"

ctest=$(type -P ctest)

# A system where all builds, and a build folder whose tests the standard input holds.
built() {
  debian
  stub ctest <<<"exec '$ctest' \"\$@\""
  stub cmake <<<'echo "cmake $*" >>"$WORK/calls"'
  add_file "build/${1:-release}/CTestTestfile.cmake"
}

AllTestsPassed() {
  built <<<$'add_test(one true)\nadd_test(two true)'
  expect_success "$project/test"
  expect_last_line "2 passed, 0 failed, 0 skipped"
}

AFailedTestFailsTheCommand() {
  built <<<$'add_test(one true)\nadd_test(two false)'
  expect_failure 1 "failed: two" "$project/test"
  expect_last_line "1 passed, 1 failed, 0 skipped"
}

AFailureThatOnlyCTestKnowsFailsTheCommand() {
  built <<<$'add_test(one true)'
  stub ctest <<<"'$ctest' \"\$@\"; exit 8"
  expect_failure 8 "1 passed, 0 failed, 0 skipped" "$project/test"
}

ASkippedTestDoesNot() {
  built <<'END'
add_test(one true)
add_test(two echo "[  SKIPPED ] no second volume")
set_tests_properties(two PROPERTIES SKIP_REGULAR_EXPRESSION "\\[  SKIPPED \\]")
END
  expect_success "$project/test"
  expect_said "skipped: two: no second volume"
  expect_last_line "1 passed, 0 failed, 1 skipped"
}

NoTestAtAllFailsTheCommand() {
  built </dev/null
  expect_failure 1 "No tests were found" "$project/test"
}

TheTestsCanBeSelected() {
  built <<<$'add_test(one true)\nadd_test(two false)'
  expect_success "$project/test" -R one
  expect_last_line "1 passed, 0 failed, 0 skipped"
}

ASelectionThatFitsNoTestFails() {
  built <<<$'add_test(one true)'
  expect_failure 1 "0 passed, 0 failed, 0 skipped" "$project/test" -R three
}

OldResultsAreNotTakenForNewOnes() {
  built <<<$'add_test(one true)'
  expect_success "$project/test"
  stub ctest <<<'exit 0'
  expect_failure 1 "ctest left no results" "$project/test"
}

APresetAndVariablesGoToCMake() {
  built asan <<<$'add_test(one true)'
  expect_success "$project/test" asan -DA=1 "-DB=2 3"
  expect_said "preset asan"
  grep -qxF "cmake --preset asan -DQORN_BUILD_TESTS=ON -DA=1 -DB=2 3" "$work/calls" ||
    fail "called: $(cat "$work/calls")"
}

AnotherCompilerIsConfiguredAnew() {
  debian
  echo libclang-rt-14-dev >>"$work/installed"
  stub java </dev/null
  stub clang++ </dev/null
  stub cmake <<<'echo "cmake $*"; exit 1'
  add_file build/asan/CMakeCache.txt <<END
CMAKE_HOME_DIRECTORY:INTERNAL=$project
Java_JAVA_EXECUTABLE:FILEPATH=$work/bin/java
CMAKE_CXX_COMPILER:FILEPATH=/usr/bin/g++
END
  expect_failure 1 "cmake --fresh --preset asan" "$project/test" asan -DCMAKE_CXX_COMPILER=clang++
  expect_failure 1 "cmake --preset asan" "$project/test" asan
  sed -i "s,/usr/bin/g++,$work/bin/clang++," "$project/build/asan/CMakeCache.txt"
  expect_failure 1 "cmake --preset asan" "$project/test" asan -DCMAKE_CXX_COMPILER=clang++
  sed -i "s,$work/bin/clang++,clang++," "$project/build/asan/CMakeCache.txt"
  expect_failure 1 "cmake --preset asan" "$project/test" asan -DCMAKE_CXX_COMPILER=clang++
}

AnythingElseIsAUsageError() {
  debian
  local argument
  for argument in other -R -D -Dx --help; do
    expect_failure 2 "usage: ./test" "$project/test" "$argument"
    expect_one_line
  done
}

TheTestsNeedTheirPackagesToo() {
  debian
  remove_package libgtest-dev
  remove_package shellcheck
  expect_failure 1 "configuring failed" "$project/test"
  expect_calls "apt-get install libgtest-dev shellcheck"
}

TheTestsWithClangNeedItsRuntime() {
  debian
  expect_failure 1 "configuring failed" "$project/test" asan -DCMAKE_CXX_COMPILER=clang++
  expect_calls "apt-get install libclang-rt-14-dev"
}

TheTestsWithLibcxxNeedItAndTheSourcesOfBoost() {
  debian
  printf '#!/bin/sh\necho "no sources for $1" >&2; exit 1\n' >"$project/scripts/fetch-boost"
  expect_failure 1 "no sources for $project/build/libcxx/boost" "$project/test" libcxx
  expect_calls "apt-get install libclang-rt-14-dev libc++-dev libc++abi-dev googletest xz-utils"
  expect_not_said "configuring"
}

run_case "$@"
