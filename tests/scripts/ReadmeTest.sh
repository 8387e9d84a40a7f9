# The code in README.md: each block is run, or is what .ci/run has run. LIBRARY, CLASSES, JAVA and
# JAVAC name what was built, and with what.
# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# Which test takes which block: the heading above it, its language, the test's name, behind that of
# its file where it is another.
rules='Two commands|sh|TheCommandsAreThoseOfCI
Calling it from Java|java|TheClassInJavaRuns
Using the foundation from C++|cmake|TheProjectInCppRuns
Using the foundation from C++|cpp|TheProjectInCppRuns
Installing it|sh|DebianPackageTest.TheReadmesWayLeadsIntoAFolder
Installing it|cmake|ExamplesTest.TheReadmeShowsTheProjectThatFindsIt
Installing it|sh|DebianPackageTest.TheReadmesWayLeadsIntoAFolder
Installing it|sh|DebianPackageTest.TheReadmesWayLeadsIntoAFolder
Installing it|sh|DebianPackageTest.TheReadmesWayLeadsIntoAFolder
Installing it|sh|DebianPackageTest.TheReadmesWayLeadsIntoAFolder
Installing it|sh|DebianPackageTest.ThePackagesInstallAndAreRemovedCleanly
Installing it|sh|DebianPackageTest.ThePackagesInstallAndAreRemovedCleanly'

# list_blocks: a line for each block, with its heading and language. Indented code has the language
# "indented", a fence that names none has "none".
list_blocks() {
  awk '
    /^ *(```|~~~)/ {
      inside = !inside
      if (inside) {
        language = $0
        sub(/^ *[`~]*/, "", language)
        print heading "|" (language == "" ? "none" : language)
      }
      next
    }
    !inside && /^#+ / { heading = $0; sub(/^#+ /, "", heading) }
    !inside && /^(    |\t)/ && blank { print heading "|indented" }
    { blank = $0 ~ /^ *$/ || (blank && /^(    |\t)/) }
  ' "$1"
}

# block <heading> <language> [<file>]: the lines of the one such block, of the README by default.
block() {
  awk -v heading="$1" -v fence="\`\`\`$2" '
    /^#+ / && !inside { here = $0; sub(/^#+ /, "", here) }
    /^```/ { inside = !inside; chosen = inside && here == heading && $0 == fence; next }
    chosen
  ' "$root/${3:-README.md}"
}

# has_test <case> | <file>.<case>
has_test() {
  if [[ $1 == *.* ]]; then
    grep -q "^${1#*.}() {" "$root/tests/scripts/${1%.*}.sh"
  else
    [ "$(type -t -- "$1")" = function ]
  fi
}

EveryBlockHasItsTest() {
  local heading language test
  output=$(diff <(list_blocks "$root/README.md") <(cut -d '|' -f 1,2 <<<"$rules")) ||
    fail "the blocks of the README (<) are not those of the rules (>)"
  while IFS='|' read -r heading language test; do
    has_test "$test" || fail "there is no test $test"
    [ -n "$(block "$heading" "$language")" ] || fail "nothing to take for $test"
  done <<<"$rules"
}

ABlockOfAnyFormIsSeen() {
  local expected
  add_file a.md <<'END'
# One
```
plain
```
## Two
1. A list:
   ```sh
   # no heading
   ```

    indented
    further

~~~text
    inside
~~~
END
  output=$(list_blocks "$project/a.md")
  expected=$'One|none\nTwo|sh\nTwo|indented\nTwo|text'
  # Each line of indented code is told.
  output=$(uniq <<<"$output")
  [ "$output" = "$expected" ] || fail "not: $expected"
}

# A project in which .ci/run does nothing but write down what it calls.
commands_of_ci() {
  local command
  mkdir -p -- "$project/scripts" "$project/.ci"
  cp -- "$root/.ci/run" "$project/.ci/"
  cp -- "$root/scripts/common" "$project/scripts/"
  for command in run test $(cd -- "$root" && ls -d scripts/*); do
    if [ -x "$root/$command" ]; then
      printf '#!/bin/sh\necho "%s $*" >>"$WORK/calls"\n' "./$command" >"$project/$command"
      chmod +x -- "$project/$command"
    fi
  done
  WORK=$work try "$project/.ci/run"
  sed 's,^\./scripts/,scripts/,' "$work/calls"
}

# was_called <command>: whether .ci/run has called it, at most with the preset that it has by default
# and with variables of CMake.
was_called() {
  local line rest
  while IFS= read -r line; do
    if [[ "$line " == "$1 "* ]]; then
      rest=${line#"$1"}
      rest=${rest# release}
      [[ $rest =~ ^(\ -D[^\ ]*|\ )*$ ]] && return
    fi
  done <"$work/called"
  return 1
}

# expect_called <text>: .ci/run has called each command in the text, and there is one.
expect_called() {
  local command count=0
  commands_of_ci >"$work/called"
  while IFS= read -r command; do
    read -r command <<<"${command%%#*}"
    if [ -n "$command" ]; then
      was_called "$command" || fail ".ci/run does not run: $command"
      count=$((count + 1))
    fi
  done <<<"$1"
  [ "$count" -gt 0 ] || fail "there is no command"
}

TheCommandsAreThoseOfCI() {
  expect_called "$(block "Two commands" sh)"
  ! was_called "./test tsan" || fail "another command counts for this one"
  ! was_called ./tes || fail "half a command counts"
}

TheCommandsForContributorsAreThoseOfCI() {
  expect_called "$(block "Before you begin" sh CONTRIBUTING.md)"
}

TheClassInJavaRuns() {
  block "Calling it from Java" java | add_file FirstSteps.java
  cd -- "$project"
  expect_success env LC_ALL=C.UTF-8 "$JAVAC" -cp "$CLASSES" -d classes FirstSteps.java
  # A Java machine in the "C" locale cannot load from the path that this is.
  expect_success env -i LC_ALL=C.UTF-8 "$JAVA" -cp "classes:$CLASSES" FirstSteps "$LIBRARY"
  [ "$output" = $'3\n0' ] || fail "not what the comments say"
}

# A project that has the sources in a folder.
TheProjectInCppRuns() {
  ln -s -- "$root" "$project/qorn"
  block "Using the foundation from C++" cpp | add_file FirstSteps.cpp
  {
    echo 'cmake_minimum_required(VERSION 3.25)'
    echo 'project(another LANGUAGES CXX)'
    block "Using the foundation from C++" cmake
  } | add_file CMakeLists.txt
  if command -v ccache >/dev/null; then
    export CMAKE_CXX_COMPILER_LAUNCHER=ccache
  fi
  expect_success cmake -G Ninja -S "$project" -B "$work/build"
  expect_success cmake --build "$work/build"
  expect_success "$work/build/first_steps"
  [ "$output" = $'9\n/home/ada/Grüße.pdf' ] || fail "not what the comments say"
  [ -z "$(find "$work/build" -name '*Test' -o -name '*.jnilib')" ] || fail "built more than asked"
  expect_success cmake --install "$work/build" --prefix "$work/installed"
  [ ! -e "$work/installed" ] || fail "it installs what the project did not ask for"
}

run_case "$@"
