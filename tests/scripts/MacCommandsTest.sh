# The two commands on a Mac that is made up.
# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/system.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/system.sh"

# The command gets as far as the configuration.
expect_configured() {
  expect_failure 1 "configuring failed" "$project/$1"
}

expect_brew_calls() {
  [ "$(cat "$work/calls")" = "$1" ] || fail "called: $(cat "$work/calls")"
}

WhereNothingIsMissingBrewInstallsNothing() {
  macos
  expect_configured run
  expect_brew_calls ""
}

WhatIsMissingIsInstalledWithoutAnUpdate() {
  macos
  remove_package boost
  remove_package openjdk@17
  expect_configured run
  expect_said "installing boost openjdk@17"
  expect_brew_calls "brew install --formula boost openjdk@17, no update"
}

APackageWhoseNameOnlyBeginsAlikeIsAnother() {
  macos
  remove_package boost
  echo boost-python3 >>"$work/installed"
  expect_configured run
  expect_brew_calls "brew install --formula boost, no update"
}

TheTestsNeedTheirPackagesToo() {
  macos
  expect_configured test
  expect_brew_calls "brew install --formula googletest, no update"
}

ApplesCompilerNeedsNoPackage() {
  macos
  echo googletest >>"$work/installed"
  expect_failure 1 "configuring failed" "$project/test" asan -DCMAKE_CXX_COMPILER=clang++
  expect_brew_calls ""
}

APresetForLibcxxIsRefused() {
  macos
  expect_failure 1 "every preset uses libc++ on macOS" "$project/test" libcxx
  expect_one_line
  expect_brew_calls ""
}

HomebrewIsRefreshedOnlyAfterAFailure() {
  macos
  remove_package boost
  stub brew <<'END'
[ "$1" != list ] || exec cat "$WORK/installed"
echo "brew $1" >>"$WORK/calls"
case $1 in
  update) touch "$WORK/lists" ;;
  *)
    [ -e "$WORK/lists" ] || { echo "Error: boost: no bottle available!" >&2; exit 1; }
    echo boost >>"$WORK/installed"
    ;;
esac
END
  expect_configured run
  expect_brew_calls $'brew install\nbrew update\nbrew install'
}

TheReasonOfBrewIsGiven() {
  macos
  remove_package boost
  stub brew <<'END'
[ "$1" != list ] || exec cat "$WORK/installed"
echo "==> Fetching boost"
echo "Error: no space left"
exit 1
END
  expect_failure 1 "run: brew could not install boost: Error: no space left" "$project/run"
  expect_not_said "configuring"
}

BrewThatOnlySaysItInstalledIsNotBelieved() {
  macos
  remove_package boost
  stub brew <<<'[ "$1" != list ] || cat "$WORK/installed"'
  expect_failure 1 "still missing after brew: boost" "$project/run"
}

RootIsToldThatHomebrewRefusesIt() {
  macos
  user 0
  remove_package boost
  expect_failure 1 "Homebrew does not work for root" "$project/run"
  expect_said "install: boost"
  expect_one_line
  expect_brew_calls ""
}

RootNeedsNoHomebrewWhereNothingIsMissing() {
  macos
  user 0
  expect_configured run
}

AMissingHomebrewIsTold() {
  macos
  rm -- "$work/bin/brew"
  [ ! -x /usr/local/bin/brew ] || skip "there is a Homebrew on this system"
  expect_failure 1 "there is no Homebrew to install: cmake ninja boost openjdk@17" "$project/run"
  expect_one_line
}

MissingToolsOfAppleAreTold() {
  macos
  stub xcode-select <<<'echo "xcode-select: error: no developer tools were found" >&2; exit 2'
  expect_failure 1 "Apple's command line tools are missing" "$project/run"
  expect_said "this installs them: xcode-select --install"
  expect_one_line
}

TheTestsAreCounted() {
  local ctest
  ctest=$(type -P ctest)
  macos
  echo googletest >>"$work/installed"
  stub ctest <<<"exec '$ctest' \"\$@\""
  stub cmake </dev/null
  add_file build/release/CTestTestfile.cmake <<<$'add_test(one true)'
  expect_success "$project/test"
  expect_last_line "1 passed, 0 failed, 0 skipped"
}

run_case "$@"
