# The built library, called by the Java program. LIBRARY, CLASSES, JAVA and FAULTY_LIBRARY name what
# was built.
# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

temporary=$work/temporary
mkdir -- "$temporary"

# call <library> [<folder>...]: with an environment that holds next to nothing.
call() {
  env -i HOME="$project" TMPDIR="$temporary" \
    bash "$root/scripts/call-library" "$1" "$CLASSES" "$JAVA" "${@:2}"
}

# expect_one_complaint <text> <library> [<folder>...]: one line, apart from what is announced.
expect_one_complaint() {
  expect_failure 1 "$1" call "${@:2}"
  output=$(grep -v '^call-library: calling ' <<<"$output")
  expect_one_line
}

GivenFoldersAreHandedOver() {
  expect_success call "$LIBRARY" /a "/Größe 東京" "/👪" "" $'/two\nlines'
  expect_said 'initializeLibrary("/a", "/Größe 東京", "/👪", "", "/two\u000Alines", 0) = 0'
  expect_said 'initializeLibrary("/a", "/Größe 東京", "/👪", "", "/two\u000Alines", 1) = 0'
}

TheResultsAreThePromisedOnes() {
  expect_success call "$LIBRARY"
  [ "$(grep -c '^getLibraryVersion() = 3$' <<<"$output")" -eq 2 ] || fail "not version 3, twice"
  [ "$(grep -c '^initializeLibrary(.*) = 0$' <<<"$output")" -eq 6 ] || fail "not six calls with 0"
  [ "$(grep -c '^startSuppressingDialogs() = 0$' <<<"$output")" -eq 4 ] || fail "start"
  [ "$(grep -c '^stopSuppressingDialogs() = 0$' <<<"$output")" -eq 4 ] || fail "stop"
}

TheUsersFoldersAreTheDefault() {
  cd -- "$project"
  expect_success call "$LIBRARY"
  expect_said "initializeLibrary(\"$project\", \"$project/Desktop\", \"$project/Documents\",\
 \"$temporary\", \"$project\", 0) = 0"
}

TheDesktopsOwnFoldersCount() {
  add_file .config/user-dirs.dirs <<'END'
# XDG_DESKTOP_DIR="/no"
XDG_DESKTOP_DIR="$HOME/Schreib\"tisch"
XDG_DOCUMENTS_DIR="/srv/papers $(touch bad)"
END
  cd -- "$project"
  expect_success call "$LIBRARY"
  expect_said "\"$project/Schreib\\\"tisch\", \"/srv/papers \$(touch bad)\","
  [ ! -e bad ] || fail "the file was executed"
}

AnotherConfigurationFolderCounts() {
  add_file other/user-dirs.dirs <<<'XDG_DESKTOP_DIR="/srv/desk"'
  expect_success env -i HOME="$project" XDG_CONFIG_HOME="$project/other" \
    bash "$root/scripts/call-library" "$LIBRARY" "$CLASSES" "$JAVA"
  expect_said "\"$project\", \"/srv/desk\", \"$project/Documents\", \"/tmp\""
}

AnEnvironmentWithoutAnythingIsEnough() {
  expect_success env -i bash "$root/scripts/call-library" "$LIBRARY" "$CLASSES" "$JAVA"
  expect_said "initializeLibrary(\"$(getent passwd "$(id -u)" | cut -d : -f 6)\", "
}

TheExamplesAreRealFoldersAndGoAway() {
  expect_success call "$LIBRARY"
  expect_said "/👪 𝒬𝑜𝓇𝓃\", "
  [ -z "$(ls -A -- "$temporary")" ] || fail "left behind: $(ls -A -- "$temporary")"
}

AnUnusualPlaceOfTheLibraryIsNoHindrance() {
  cp -- "$LIBRARY" "$project/"
  cp -r -- "$CLASSES" "$project/classes"
  CLASSES=$project/classes
  expect_success call "$project/${LIBRARY##*/}"
}

AMissingLibraryIsTold() {
  expect_one_complaint "the library is missing: $project/none" "$project/none"
}

AFileThatIsNoLibraryIsTold() {
  add_file library <<<"just a text that is long enough to be looked at as if it were a library"
  expect_one_complaint "the library cannot be used: $project/library" "$project/library"
}

# elf <class> <machine>: the beginning of a shared library of this word size and machine.
elf() {
  printf '\177ELF%b\1\1\0\0\0\0\0\0\0\0\0\3\0%b\0\1\0\0\0' "$1" "$2"
  head -c 256 /dev/zero
}

ALibraryOfAnotherWordSizeIsTold() {
  elf '\1' '\3' | add_file library
  expect_one_complaint "the library cannot be used: $project/library" "$project/library"
}

ALibraryOfAnotherMachineIsTold() {
  local machine='\0267'
  if [ "$(uname -m)" = aarch64 ]; then
    machine='\076'
  fi
  elf '\2' "$machine" | add_file library
  expect_one_complaint "the library cannot be used: $project/library" "$project/library"
}

ALibraryWithoutTheMethodsIsTold() {
  g++ -shared -fPIC -o "$project/library" -x c++ /dev/null
  expect_one_complaint "the library cannot be used: " "$project/library"
}

AWrongResultIsTold() {
  expect_failure 1 "getLibraryVersion() = 4, but 3 is promised" call "$FAULTY_LIBRARY"
  expect_said "FiveFolders: not every result was as promised"
}

AMissingJavaMachineIsTold() {
  JAVA=$project/java
  expect_one_complaint "there is no Java machine: $project/java" "$LIBRARY"
}

AFolderThatIsNotInUTF8IsTold() {
  expect_one_complaint "a folder's name is not UTF-8" "$LIBRARY" a b c d $'\xFF'
}

AWrongNumberOfFoldersIsAUsageError() {
  expect_failure 2 "usage: " call "$LIBRARY" a b c d
  expect_one_line
}

run_case "$@"
