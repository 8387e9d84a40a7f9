# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/system.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/system.sh"

# The run gets as far as the configuration.
expect_configured() {
  expect_failure 1 "configuring failed" "$project/run"
}

AWrongNumberOfFoldersIsAUsageError() {
  debian
  expect_failure 2 "usage: ./run" "$project/run" a b c d
  expect_one_line
  expect_failure 2 "usage: ./run" "$project/run" a b c d e f
  expect_one_line
}

WhereNothingIsMissingAptGetIsNotCalled() {
  debian
  expect_configured
  expect_calls ""
}

WhatIsMissingIsInstalled() {
  debian
  remove_package libicu-dev
  remove_package ccache
  expect_configured
  expect_said "installing ccache libicu-dev"
  expect_calls "apt-get install ccache libicu-dev"
}

APackageThatIsHalfInstalledIsMissing() {
  debian
  remove_package ccache
  stub dpkg-query <<<'sed "s/$/ installed/" "$WORK/installed"; echo ccache config-files'
  expect_configured
  expect_calls "apt-get install ccache"
}

TheListsAreRefreshedOnlyAfterAFailure() {
  debian
  remove_package ccache
  stub apt-get <<'END'
echo "apt-get $*" >>"$WORK/calls"
case " $* " in
  *" update "*) touch "$WORK/lists" ;;
  *)
    [ -e "$WORK/lists" ] || { echo "E: Unable to locate package ccache" >&2; exit 100; }
    echo ccache >>"$WORK/installed"
    ;;
esac
END
  expect_configured
  expect_calls $'apt-get install ccache\napt-get update\napt-get install ccache'
}

TheReasonOfAptGetIsGiven() {
  debian
  remove_package ccache
  stub apt-get <<<'echo "Reading..."; echo "E: Unable to locate package ccache" >&2; exit 100'
  expect_failure 1 \
    "run: apt-get could not install ccache: E: Unable to locate package ccache" "$project/run"
  expect_not_said "configuring"
}

AptGetThatOnlySaysItInstalledIsNotBelieved() {
  debian
  remove_package ccache
  stub apt-get </dev/null
  expect_failure 1 "still missing after apt-get: ccache" "$project/run"
}

AnOrdinaryUserInstallsThroughSudo() {
  debian
  user 1000
  remove_package ccache
  stub sudo <<<'echo "sudo" >>"$WORK/calls"; exec "$@"'
  expect_configured
  expect_calls $'sudo\napt-get install ccache'
}

ARefusalOfSudoIsGiven() {
  debian
  user 1000
  remove_package ccache
  stub sudo <<'END'
echo "sudo" >>"$WORK/calls"
echo "sudo: unable to resolve host" >&2
echo "sudo: a password is required" >&2
exit 1
END
  expect_failure 1 "could not install ccache: sudo: a password is required" "$project/run"
  expect_calls sudo
}

WithoutSudoAnOrdinaryUserIsTold() {
  debian
  user 1000
  remove_package ccache
  expect_failure 1 "there is no sudo: ccache" "$project/run"
  expect_one_line
  expect_calls ""
}

AnOrdinaryUserNeedsNoSudoWhereNothingIsMissing() {
  debian
  user 1000
  expect_configured
}

AnotherSystemIsTold() {
  debian
  rm -- "$work/bin/dpkg-query"
  expect_failure 1 "this is no Debian system" "$project/run"
  expect_one_line
}

AMissingAptGetIsTold() {
  debian
  remove_package ccache
  rm -- "$work/bin/apt-get"
  expect_failure 1 "there is no apt-get to install: ccache" "$project/run"
  expect_one_line
}

APathThatCMakeCannotTakeIsTold() {
  debian
  mv -- "$project" "$work/a;b"
  expect_failure 1 "CMake cannot build in a path that holds one of ; \" # \$ \\" "$work/a;b/run"
  expect_one_line
}

AMissingJavaCompilerIsTold() {
  debian
  rm -- "$work/bin/javac"
  unset JAVA_HOME
  expect_failure 1 "there is no Java compiler" "$project/run"
  expect_one_line
}

AJavaHomeWithoutACompilerIsLeftAside() {
  debian
  export JAVA_HOME=$work/no/such/place
  stub cmake <<<'echo "JAVA_HOME is ${JAVA_HOME-unset}"; exit 1'
  expect_failure 1 "JAVA_HOME is unset" "$project/run"
}

AFailedConfigurationIsShown() {
  debian
  expect_failure 1 "no compiler" "$project/run"
}

AFailedBuildIsTold() {
  debian
  stub cmake <<<'[ "$1" != --build ]'
  expect_failure 1 "building failed" "$project/run"
}

ABuildFolderOfAnotherPlaceIsConfiguredAnew() {
  debian
  add_file build/release/CMakeCache.txt <<<'CMAKE_HOME_DIRECTORY:INTERNAL=/another/place'
  stub cmake <<<'echo "cmake $*"; exit 1'
  expect_failure 1 "cmake --fresh --preset release" "$project/run"
}

ABareEnvironmentIsEnough() {
  local home
  home=$(getent passwd "$(id -u)" | cut -d : -f 6)
  debian
  stub cmake <<<'echo "home is $HOME."; exit 1'
  expect_failure 1 "home is $home." \
    env -i WORK="$work" PATH="$PATH" "$project/run"
}

run_case "$@"
