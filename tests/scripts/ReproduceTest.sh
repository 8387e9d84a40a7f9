# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# project_that <command>...: one whose package is a file that holds what the command prints, run in
# the project's folder.
project_that() {
  add_file CMakePresets.json <<'END'
{
  "version": 6,
  "configurePresets": [ {
    "name": "package", "generator": "Ninja", "binaryDir": "${sourceDir}/build/package"
  } ],
  "buildPresets": [ { "name": "package", "configurePreset": "package" } ]
}
END
  add_file make-package <<END
#!/bin/sh
$* >build/package/a.deb
END
  add_file CMakeLists.txt <<'END'
cmake_minimum_required(VERSION 3.25)
project(a LANGUAGES NONE)
add_custom_target(make ALL COMMAND sh make-package WORKING_DIRECTORY ${PROJECT_SOURCE_DIR})
add_custom_target(package)
END
  commit_all
}

expect_difference() {
  expect_failure 1 "two builds differ in:" "$root/scripts/reproduce" "$project"
  expect_said ./a.deb
}

TheSameBytesPass() {
  project_that cat make-package
  expect_success "$root/scripts/reproduce" "$project"
  expect_last_line "reproduce: 1 files are the same in both builds"
}

TheBuildsDateIsThatOfTheCommit() {
  project_that "date --date=@\$SOURCE_DATE_EPOCH --utc +%F"
  expect_success "$root/scripts/reproduce" "$project"
  expect_said "$(date --utc +%F | sha256sum | cut -d ' ' -f 1)"
  expect_success env SOURCE_DATE_EPOCH=86400 "$root/scripts/reproduce" "$project"
  expect_said "$(echo 1970-01-02 | sha256sum | cut -d ' ' -f 1)"
}

TheFolderIsNoticed() {
  project_that pwd
  expect_difference
}

TheTimeIsNoticed() {
  project_that date +%N
  expect_difference
}

TheTimeZoneIsNoticed() {
  project_that "date --date=@\$SOURCE_DATE_EPOCH"
  expect_difference
}

TheUmaskIsNoticed() {
  project_that umask
  expect_difference
}

AFileThatOnlyOneBuildMakesIsNoticed() {
  project_that "case \$PWD in */two) echo >build/package/b.deb ;; esac; echo"
  expect_failure 1 "./b.deb" "$root/scripts/reproduce" "$project"
}

WhatIsNotCommittedYetIsBuiltToo() {
  project_that cat part
  add_file part <<<'text'
  expect_success "$root/scripts/reproduce" "$project"
}

ABuildThatFailsIsShown() {
  project_that cat missing
  expect_failure 1 "building failed" "$root/scripts/reproduce" "$project"
  expect_said "missing: No such file"
}

ABuildThatMakesNothingFails() {
  project_that "echo >build/package/other; exit 0; echo"
  expect_failure 1 "the build made no library and no package" "$root/scripts/reproduce" "$project"
}

# object_of <date>: compiles a unit that has origins, with this date for the build's, and sets `object`.
object_of() {
  local build="$work/$1" unit=src/2System/CMakeFiles/qorn_2system.dir/Modules/_Imp/ModulesDyLib.cpp.o
  SOURCE_DATE_EPOCH=$(date --utc --date="$1 12:34:56" +%s)
  export SOURCE_DATE_EPOCH
  expect_success cmake -G Ninja -S "$root" -B "$build" \
    -DQORN_BUILD_BRIDGE=OFF -DQORN_BUILD_EXAMPLES=OFF -DQORN_BUILD_TESTS=OFF
  expect_success cmake --build "$build" --target "$unit"
  object=$build/$unit
}

# Also where ccache is told that the time does not matter.
TheLibrariesBearTheDateThatIsSet() {
  export CCACHE_SLOPPINESS=time_macros
  object_of 1970-01-02
  expect_success grep -aqF 'Jan  2 1970' "$object"
  object_of 1971-12-31
  expect_success grep -aqF 'Dec 31 1971' "$object"
  expect_success grep -aqF 12:34:56 "$object"
}

TheLibrariesDoNotNameTheFolder() {
  local name=src/2System/Modules/_Imp/ModulesDyLib.cpp
  object_of 1970-01-02
  output=$(tr '\0' '\n' <"$object" | grep -aF "$name" | sort -u)
  [ "$output" = "$name" ] || fail "the name of the file is not $name"
}

run_case "$@"
