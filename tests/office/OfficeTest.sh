# The built library in a real office: an extension of our own, installed into a profile of its own,
# loads it from there and calls the four methods. The tests' environment names what was built and
# what the office consists of; see CMakeLists.txt.
# shellcheck shell=bash
# shellcheck disable=SC2016 # the shells that are started expand their variables themselves
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/../scripts/support.sh"

: "${LIBRARY:?}" "${CLASSES:?}" "${JAVA:?}" "${JAR:?}" "${CMAKE:?}" "${CXX:?}"
: "${OFFICE:?}" "${UNOPKG:?}" "${OFFICE_JAR:?}" "${OFFICE_PIPE:?}"

# How long an office may take to be reached, and each program at all, in seconds: the machine may
# have much else to do.
patience=${PATIENCE:-120}
limit=200
script=$(readlink -f -- "${BASH_SOURCE[0]}")
extension=$project/caller.oxt
pipe=${work##*/}
touch -- "$work/start"
mkdir -- "$project/profile" "$project/home" "$project/temporary" "$project/current"
cd -- "$project/current"
trap 'end_processes; wait; rm -rf -- "$work"' EXIT

# url <path>
url() {
  local LC_ALL=C path=$1 i byte
  printf file://
  for ((i = 0; i < ${#path}; ++i)); do
    byte=${path:i:1}
    case $byte in
      [A-Za-z0-9/._-]) printf %s "$byte" ;;
      *) printf '%%%02X' "'$byte" ;;
    esac
  done
}

profile=-env:UserInstallation=$(url "$project/profile")

# inside <command>...: with nothing of the caller's environment, for so long at most. All that it
# starts bears the mark.
inside() {
  timeout --kill-after=5 "$limit" env -i "PATH=$PATH" "HOME=$project/home" \
    "TMPDIR=$project/temporary" LC_ALL=C.UTF-8 "JAVA_HOME=$(java_home)" "QORN_OFFICE_TEST=$work" \
    "$@" </dev/null
}

java_home() {
  dirname -- "$(dirname -- "$(readlink -f -- "$JAVA")")"
}

# Prints the processes that bear the mark.
processes() {
  { grep -lzsxF -- "QORN_OFFICE_TEST=$work" /proc/[0-9]*/environ || true; } | cut -d / -f 3
}

end_processes() {
  local process
  for process in $(processes); do
    kill -KILL "$process" 2>/dev/null || true
  done
}

expect_no_process() {
  local tries=0
  while [ -n "$(processes)" ]; do
    [ $((++tries)) -le 30 ] || fail "left behind: $(ps -o args= -p "$(processes | paste -s -d ,)")"
    sleep 0.1
  done
}

# An office that was killed leaves its pipes where it made them, which is always here. Others make and
# remove files there meanwhile, which find takes for a failure.
remove_dead_pipes() {
  local socket
  { find /tmp -maxdepth 1 -type s -user "$(id -u)" -name 'OSL_PIPE_*' -newer "$work/start" \
    2>/dev/null || true; } |
    while IFS= read -r socket; do
      grep -qF -- "$socket" /proc/net/unix || rm -f -- "$socket"
    done
}

# Prints the files that whoever uses the office would find afterwards.
files() {
  find "$project/home" "$project/temporary" "$project/current" | sort
}

# In a new profile an office asks by this status to be started again.
run_office() {
  local starts=0 ended=81
  while [ "$ended" -eq 81 ] && [ $((++starts)) -le 3 ]; do
    ended=0
    inside "$OFFICE" --headless --norestore --nologo --nodefault \
      "--accept=pipe,name=$pipe;urp" "$profile" || ended=$?
  done
  return "$ended"
}

# session [<task>...]: an office that does these tasks and ends. What it said is in the file `said`.
session() {
  local office ended=0
  run_office >"$project/said" 2>&1 &
  office=$!
  try inside "$JAVA" "-Djava.library.path=$OFFICE_PIPE" -cp "$CLASSES:$OFFICE_JAR" \
    office.Client "$pipe" "$office" "$patience" "$@"
  # Who could not be asked to end is not waited for.
  [ "$status" -le 1 ] || end_processes
  wait "$office" || ended=$?
  [ "$ended" -eq 0 ] || remove_dead_pipes
  [ "$status" -ne 3 ] || explain_silence
  [ "$status" -eq 0 ] || fail "not as promised"
  output=$(cat -- "$project/said")
  [ "$ended" -eq 0 ] || fail "the office ended with $ended"
  expect_no_process
}

# An office that cannot be reached either without the extension is none of the library's business.
explain_silence() {
  if [ "${CONTROL:-}" != yes ] && CONTROL=yes bash "$script" start_once >/dev/null 2>&1; then
    fail "the office can only be reached without the extension"
  fi
  [ "${CONTROL:-}" = yes ] && exit 1
  skip "the office could not be started: $(head -n 1 -- "$project/said")"
}

start_once() {
  session
}

# pack: an extension with the library in it.
pack() {
  local parts=$work/extension
  cp -r -- "$root/tests/office/extension" "$parts"
  cp -- "$LIBRARY" "$parts/libQORNOpenOffice.jnilib"
  echo "RegistrationClassName: office.Caller" >"$work/manifest"
  LC_ALL=C.UTF-8 "$JAR" --create --file "$parts/caller.jar" --manifest "$work/manifest" -C "$CLASSES" .
  (cd -- "$parts" && "$CMAKE" -E tar cf "$extension" --format=zip .)
}

# What the office has said, and what was left until now, is none of the library's doing.
remember() {
  files >"$work/files"
  cp -- "$project/said" "$work/said"
}

# expect_quiet: neither files nor words remain of the calls.
expect_quiet() {
  output=$(grep -vxFf "$work/said" -- "$project/said") &&
    fail "the office says more than it does by itself"
  output=$(diff "$work/files" <(files)) || fail "files were left behind"
}

call_once() {
  pack
  session "add=$(url "$extension")"
  remember
  session call
  expect_quiet
}

# As root the office's own program for extensions refuses to serve a single user.
install() {
  if [ "$(id -u)" -eq 0 ]; then
    session "add=$(url "$extension")"
  else
    expect_success inside "$UNOPKG" add "$profile" "$extension"
  fi
}

remove() {
  if [ "$(id -u)" -eq 0 ]; then
    session remove
  else
    expect_success inside "$UNOPKG" remove "$profile" org.example.qorn-caller
  fi
}

TheOfficeCallsTheLibrary() {
  pack
  # The first start in a new profile forgets what was installed into it.
  session
  install
  remember
  session call
  expect_quiet
  session call
  expect_quiet
  remove
  session gone
  expect_quiet
  output=$(find "$project/profile" -name 'caller*' -o -name '*.jnilib')
  [ -z "$output" ] || fail "something of the extension remains"
}

# The same again without root's rights.
AnOrdinaryUserCallsItToo() {
  local copy=$work/copy as_other=(setpriv --reuid=65534 --regid=65534 --clear-groups)
  [ "$(id -u)" -eq 0 ] || skip "whoever runs this is an ordinary user already"
  mkdir -p -- "$copy/tests/scripts" "$copy/temporary"
  cp -r -- "$root/tests/office" "$copy/tests/"
  cp -- "$root/tests/scripts/support.sh" "$copy/tests/scripts/"
  cp -r -- "$CLASSES" "$copy/classes"
  cp -- "$LIBRARY" "$copy/"
  chmod 711 "$work"
  chmod -R go=rX "$copy"
  chown 65534:65534 "$copy/temporary"
  "${as_other[@]}" test -w "$copy/temporary" || skip "another user cannot reach ${TMPDIR:-/tmp}"
  try env "TMPDIR=$copy/temporary" "LIBRARY=$copy/${LIBRARY##*/}" "CLASSES=$copy/classes" \
    "${as_other[@]}" bash "$copy/tests/office/OfficeTest.sh" TheOfficeCallsTheLibrary
  skip_with_it
  expect_status 0
}

skip_with_it() {
  if [[ $output == "[  SKIPPED ] "* ]]; then
    skip "${output#"[  SKIPPED ] "}"
  fi
}

# faulty_library <body of startSuppressingDialogs> [<option of the compiler>...]
faulty_library() {
  local prefix=Java_veltra_1qorn_QORN_1OoLibrary_
  cat >"$project/faulty.cpp" <<END
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>
#include <unistd.h>
extern "C" {
int ${prefix}initializeLibrary() { return 0; }
int ${prefix}getLibraryVersion() { return 3; }
int ${prefix}startSuppressingDialogs() { $1 }
int ${prefix}stopSuppressingDialogs() { return 0; }
}
END
  LIBRARY=$project/faulty.so
  "$CXX" -shared -fPIC "${@:2}" -o "$LIBRARY" "$project/faulty.cpp"
}

# expect_noticed <text>: a call of the faulty library does not pass, and this is told.
expect_noticed() {
  try env "LIBRARY=$LIBRARY" bash "$script" call_once
  skip_with_it
  expect_status 1
  expect_said "$1"
}

AWrongResultIsNoticed() {
  faulty_library 'return 1;'
  expect_noticed "startSuppressingDialogs gave 1, not 0"
}

AFileThatIsNoLibraryIsNoticed() {
  LIBRARY=$project/text
  echo "just a text" >"$LIBRARY"
  expect_noticed "load failed: "
}

AMissingMethodIsNoticed() {
  faulty_library 'return 0;' -DJava_veltra_1qorn_QORN_1OoLibrary_initializeLibrary=other
  expect_noticed "initializeLibrary failed: "
}

AnotherBoostIsNoticed() {
  faulty_library 'return 0;' -Wl,--no-as-needed -lboost_filesystem
  expect_noticed "the library brings along [/"
}

WordsAreNoticed() {
  faulty_library 'std::puts("a word"); return std::fflush(stdout);'
  expect_noticed "it said: a word"
}

AFileLeftBehindIsNoticed() {
  faulty_library 'std::ofstream(std::getenv("TMPDIR") + std::string("/left")); return 0;'
  expect_noticed "files were left behind"
}

AProcessLeftBehindIsNoticed() {
  faulty_library 'if (fork() == 0) { closefrom(0); execlp("sleep", "sleep", "98", NULL); } return 0;'
  expect_noticed "left behind: sleep 98"
}

AnUncleanEndIsNoticed() {
  faulty_library 'return std::atexit([] { _exit(7); });'
  expect_noticed "the office ended with 7"
}

ADeadOfficeIsNoticed() {
  faulty_library '_exit(7);'
  expect_noticed "the office died of startSuppressingDialogs"
}

AnOfficeThatOnlyStartsWithoutItIsNoticed() {
  printf '#!/bin/sh\n[ -z "$(find "$HOME/../profile" -name caller.jar)" ] || exit 1\nexec "%s" "$@"\n' \
    "$OFFICE" >"$project/office"
  chmod +x -- "$project/office"
  OFFICE=$project/office expect_noticed "the office can only be reached without the extension"
}

# expect_no_office <reason>: it is told that the office is to blame.
expect_no_office() {
  expect_success bash "$script" TheOfficeCallsTheLibrary
  [ "$output" = "[  SKIPPED ] the office could not be started: $1" ] || fail "not told"
  expect_no_process
}

AnOfficeThatDoesNotStartIsToldApart() {
  printf '#!/bin/sh\necho no display >&2\nexit 1\n' >"$project/office"
  chmod +x -- "$project/office"
  OFFICE=$project/office expect_no_office "no display"
}

AnOfficeThatHangsIsEnded() {
  printf '#!/bin/sh\necho waiting\ntrap "" TERM\nsleep 1000\nsleep 1000\n' >"$project/office"
  chmod +x -- "$project/office"
  PATIENCE=5 OFFICE=$project/office expect_no_office waiting
}

run_case "$@"
