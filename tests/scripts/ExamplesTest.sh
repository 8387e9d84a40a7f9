# The examples: the README shows the first of them, they do what they say, and none is forgotten.
# FIRST_STEPS, LIBRARY, CLASSES and JAVA name what was built.
# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# readme_block <language> [<number>]: the README's code in this language, or of this block of it.
readme_block() {
  awk -v fence="\`\`\`$1" -v number="${2:-0}" '
    $0 == fence { ++count; inside = number == 0 || number == count; next }
    /^```/ { inside = 0 }
    inside' "$root/README.md"
}

# expect_shown <language> <file> [<number>]: the README shows the whole file and no other code.
expect_shown() {
  output=$(diff -- "$root/$2" <(readme_block "$1" "${3:-}")) || fail "the README does not show $2"
}

TheReadmeShowsTheExampleInCpp() { expect_shown cpp examples/cpp/FirstSteps.cpp; }
TheReadmeShowsTheProjectThatFindsIt() { expect_shown cmake examples/package/CMakeLists.txt 2; }
TheReadmeShowsTheExampleInJava() { expect_shown java examples/java/FirstSteps.java; }

FirstStepsInCpp() {
  expect_success "$FIRST_STEPS"
  [ "$output" = $'9\n/home/ada/Grüße.pdf' ] || fail "not what the comments say"
}

FirstStepsInJava() {
  cd -- "$CLASSES"
  expect_success env -i LC_ALL=C.UTF-8 "$JAVA" -cp . FirstSteps "$LIBRARY"
  [ "$output" = $'3\n0' ] || fail "not what the comments say"
}

# An example that is not among these is built by nobody, or run by nobody.
EveryExampleIsRun() {
  local file name
  for file in "$root"/examples/cpp/*.cpp; do
    name=$(basename -- "$file" .cpp)
    [ "$name" = FirstSteps ] ||
      grep -qxF "qorn_add_example($name)" "$root/examples/cpp/CMakeLists.txt" ||
      fail "no test runs examples/cpp/$name.cpp"
  done
  # ./run calls FiveFolders, as do the tests of call-library.
  output=$(cd -- "$root/examples/java" && find . -name '*.java' | sort)
  [ "$output" = $'./FirstSteps.java\n./FiveFolders.java\n./veltra_qorn/QORN_OoLibrary.java' ] ||
    fail "no test runs one of the examples in Java"
}

run_case "$@"
