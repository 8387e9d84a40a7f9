# The library of a Mac, linked by LLVM's linker with the list of exports, and read by LLVM's tools
# under the names that Apple's have.
# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

command -v clang++ >/dev/null || skip "there is no clang++"
llvm=$(readlink -f -- "$(type -P llvm-nm)") || skip "there is no llvm-nm"
llvm=${llvm%/*}
[ -x "$llvm/ld64.lld" ] || skip "there is no ld64.lld beside $llvm/llvm-nm"

mkdir -- "$work/bin"
for tool in lipo nm otool; do
  ln -s -- "$llvm/llvm-$tool" "$work/bin/$tool"
done
printf '#!/bin/sh\necho Darwin\n' >"$work/bin/uname"
chmod +x -- "$work/bin/uname"

library=$project/libQORNOpenOffice.jnilib
oldest=11.0

# link_for <processor> <output> <option>...
link_for() {
  "$llvm/ld64.lld" -dylib -arch "$1" -platform_version macos "$oldest" "$oldest" -o "$2" "${@:3}"
}

# library_with <source> [<list of exports> [<option of the linker>...]]: for both processors.
library_with() {
  local prefix=Java_veltra_1qorn_QORN_1OoLibrary_ processor
  add_file library.cpp <<END
#define SHOWN __attribute__((visibility("default")))
extern "C" {
SHOWN int ${prefix}initializeLibrary() { return 0; }
SHOWN int ${prefix}getLibraryVersion() { return 3; }
SHOWN int ${prefix}startSuppressingDialogs() { return 0; }
SHOWN int ${prefix}stopSuppressingDialogs() { return 0; }
}
$1
END
  for processor in x86_64 arm64; do
    clang++ --target=$processor-apple-macos$oldest -stdlib=libc++ -c "$project/library.cpp" \
      -o "$work/$processor.o"
    link_for $processor "$work/$processor" "$work/$processor.o" \
      -exported_symbols_list "${2:-$root/cmake/exports.txt}" \
      -install_name "@rpath/${library##*/}" "${@:3}"
  done
  "$llvm/llvm-lipo" -create "$work/x86_64" "$work/arm64" -output "$library"
}

check() {
  PATH=$work/bin:$PATH "$root/scripts/check-exports" "$library"
}

# exports_and <name in C>: writes a list of exports with one more.
exports_and() {
  cp -- "$root/cmake/exports.txt" "$work/exports.txt"
  echo "_$1" >>"$work/exports.txt"
}

TheListLetsTheFourFunctionsOutAlone() {
  library_with 'SHOWN int fifth() { return 5; }
      template <class T> SHOWN int made(T) { return 0; } template int made(int);'
  expect_success check
}

BothListsNameTheSameFunctions() {
  output=$(diff <(sed 's/^_//' "$root/cmake/exports.txt") \
    <(sed -n 's/^ *\(Java_.*\);$/\1/p' "$root/cmake/exports.map")) || fail "they differ"
}

AFifthFunctionFails() {
  exports_and _Z5fifthv
  library_with 'SHOWN int fifth() { return 5; }' "$work/exports.txt"
  expect_failure 1 "exports other than the four functions for x86_64" check
  expect_said "for arm64"
  expect_said "> _Z5fifthv"
}

AFunctionMissingForOneProcessorFails() {
  library_with ''
  grep -v getLibraryVersion "$root/cmake/exports.txt" >"$work/exports.txt"
  link_for arm64 "$work/arm64" "$work/arm64.o" -exported_symbols_list "$work/exports.txt"
  "$llvm/llvm-lipo" -create "$work/x86_64" "$work/arm64" -output "$library"
  expect_failure 1 "exports other than the four functions for arm64" check
  expect_said "< Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion"
  expect_not_said "for x86_64"
}

# needs <path of a library>: links with a library of this name.
needs() {
  local processor
  echo 'int absent() { return 0; }' >"$work/other.cpp"
  for processor in x86_64 arm64; do
    clang++ --target=$processor-apple-macos$oldest -stdlib=libc++ -c "$work/other.cpp" \
      -o "$work/other-$processor.o"
    link_for $processor "$work/other-$processor.dylib" "$work/other-$processor.o" -install_name "$1"
  done
  "$llvm/llvm-lipo" -create "$work/other-x86_64.dylib" "$work/other-arm64.dylib" \
    -output "$work/other.dylib"
  library_with 'extern int (*use)(); int absent(); int (*use)() = absent;' '' "$work/other.dylib"
}

LibrariesOfTheSystemPass() {
  needs /usr/lib/libc++.1.dylib
  expect_success check
  needs /System/Library/Frameworks/Carbon.framework/Versions/A/Carbon
  expect_success check
}

ALibraryOfHomebrewFails() {
  needs /opt/homebrew/opt/boost/lib/libboost_thread.dylib
  expect_failure 1 "needs what not every Mac has:" check
  expect_said /opt/homebrew/opt/boost/lib/libboost_thread.dylib
}

AMissingLibraryFails() {
  expect_failure 1 "the library is missing" check
  expect_one_line
}

run_case "$@"
