# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

library=$project/library.so
closed=("-Wl,-z,relro" "-Wl,-z,now")

# library_with <source> [<option of g++>...]
library_with() {
  local prefix=Java_veltra_1qorn_QORN_1OoLibrary_
  add_file library.cpp <<END
extern "C" {
int ${prefix}initializeLibrary() { return 0; }
int ${prefix}getLibraryVersion() { return 3; }
int ${prefix}startSuppressingDialogs() { return 0; }
int ${prefix}stopSuppressingDialogs() { return 0; }
}
$1
END
  g++ -shared -fPIC "${@:2}" -o "$library" "$project/library.cpp"
}

FourFunctionsPass() {
  library_with 'static int hidden() { return 1; } int (*used)() __attribute__((
      visibility("hidden"))) = hidden;' "${closed[@]}"
  expect_success "$root/scripts/check-exports" "$library"
}

AFifthFunctionFails() {
  library_with 'int fifth() { return 5; }' "${closed[@]}"
  expect_failure 1 "> _Z5fifthv" "$root/scripts/check-exports" "$library"
}

AWeakTemplateFails() {
  library_with 'template <class T> int made(T) { return 0; } template int made(int);' "${closed[@]}"
  expect_failure 1 "> _Z4made" "$root/scripts/check-exports" "$library"
}

AMissingFunctionFails() {
  g++ -shared -fPIC "${closed[@]}" -o "$library" -x c++ /dev/null
  expect_failure 1 "getLibraryVersion" "$root/scripts/check-exports" "$library"
}

AnUndefinedSymbolFails() {
  library_with 'int absent();
      __attribute__((visibility("hidden"))) int call() { return absent(); }' "${closed[@]}"
  expect_failure 1 "undefined symbol: _Z6absentv" "$root/scripts/check-exports" "$library"
}

EachFailureIsTold() {
  library_with 'int fifth() { return 5; }' -Wl,-z,norelro -Wl,-z,now
  expect_failure 1 "> _Z5fifthv" "$root/scripts/check-exports" "$library"
  expect_said "RELRO"
}

ALibraryWithoutReadOnlyRelocationsFails() {
  library_with '' -Wl,-z,norelro -Wl,-z,now
  expect_failure 1 "RELRO" "$root/scripts/check-exports" "$library"
}

ALibraryThatIsBoundLateFails() {
  library_with '' -Wl,-z,relro -Wl,-z,lazy -Wl,-z,origin
  expect_failure 1 "BIND_NOW" "$root/scripts/check-exports" "$library"
}

AMissingLibraryFails() {
  expect_failure 1 "the library is missing" "$root/scripts/check-exports" "$library"
  expect_one_line
}

run_case "$@"
