# The README's examples: they are the files of examples/, and do what they say. FIRST_STEPS, LIBRARY,
# CLASSES and JAVA name what was built.
# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# readme_block <language>: the README's code in this language.
readme_block() {
  awk -v fence="\`\`\`$1" '$0 == fence { inside = 1; next } /^```/ { inside = 0 } inside' \
    "$root/README.md"
}

# expect_shown <language> <file>: the README shows the whole file and no other code.
expect_shown() {
  output=$(diff -- "$root/$2" <(readme_block "$1")) || fail "the README does not show $2"
}

TheReadmeShowsTheExampleInCpp() { expect_shown cpp examples/cpp/FirstSteps.cpp; }
TheReadmeShowsTheExampleInJava() { expect_shown java examples/java/FirstSteps.java; }

expect_steps_in_cpp() {
  expect_success "$1"
  [ "$output" = $'9\n/home/ada/Grüße.pdf' ] || fail "not what the comments say"
}

FirstStepsInCpp() {
  expect_steps_in_cpp "$FIRST_STEPS"
}

FirstStepsInJava() {
  cd -- "$CLASSES"
  expect_success env -i LC_ALL=C.UTF-8 "$JAVA" -cp . FirstSteps "$LIBRARY"
  [ "$output" = $'3\n0' ] || fail "not what the comments say"
}

# As the README tells it: a project that has the sources in a folder.
AnotherProjectUsesTheFoundation() {
  ln -s -- "$root" "$project/qorn"
  cp -- "$root/examples/cpp/FirstSteps.cpp" "$project/"
  {
    echo 'cmake_minimum_required(VERSION 3.25)'
    echo 'project(another LANGUAGES CXX)'
    readme_block cmake
  } | add_file CMakeLists.txt
  if command -v ccache >/dev/null; then
    export CMAKE_CXX_COMPILER_LAUNCHER=ccache
  fi
  expect_success cmake -G Ninja -S "$project" -B "$work/build"
  expect_success cmake --build "$work/build"
  expect_steps_in_cpp "$work/build/first_steps"
  [ -z "$(find "$work/build" -name '*Test' -o -name '*.jnilib')" ] || fail "built more than asked"
}

run_case "$@"
