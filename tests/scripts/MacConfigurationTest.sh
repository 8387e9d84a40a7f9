# What CMake makes of the project on a Mac: its commands are listed and read, not run.
# shellcheck shell=bash
# shellcheck source=tests/scripts/macos.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/macos.sh"

command -v clang++ >/dev/null || skip "there is no clang++"

both_processors="-arch x86_64 -arch arm64"
cocoa=src/1Base/CMakeFiles/qorn_1base.dir/BaseMacOS/_Imp/BaseMacOSCocoa.mm.o
bridge=src/QORNOpenOfficeLibrary/CMakeFiles/qorn_bridge_objects.dir/QORNOoLibrary_if.cpp.o
product=lib/libQORNOpenOffice.jnilib

# configure_project [<argument of cmake>...]
configure_project() {
  expect_success configure "$root" "$@"
  list_commands
}

# check_every_command <text>: each command that compiles or links holds it.
check_every_command() {
  local without
  without=$(grep -F clang++ "$commands" | grep -vF -e "$1" || true)
  [ -z "$without" ] || fail "without $1: $without"
}

# check_command <output> <text>...: the command that makes the output holds all of the texts.
check_command() {
  local made text
  made=$(command_with " -o $1 ")
  for text in "${@:2}"; do
    [[ "$made " == *" $text "* ]] || fail "no $text in: $made"
  done
}

# check_frameworks <program or library> <framework>...
check_frameworks() {
  local linked
  linked=$(command_with " -o $1 " | grep -oE -e '-framework [A-Za-z]+' | cut -d ' ' -f 2 | sort -u)
  [ "$linked" = "$(printf '%s\n' "${@:2}")" ] || fail "$1 is linked with:" "$linked"
}

# All sources but those of Linux.
check_sources() {
  local compiled expected
  compiled=$(grep -oE -e ' -o src/[^ ]*\.o ' "$commands" |
    sed -E 's, -o (.*)CMakeFiles/[^/]*/(.*)\.o ,\1\2,' | sort)
  expected=$(cd -- "$root" && find src -name '*.cpp' -o -name '*.mm' |
    grep -vE '^src/0Platform/|Linux|OsRelease' | sort)
  output=$(diff <(printf '%s\n' "$expected") <(printf '%s\n' "$compiled")) ||
    fail "other sources are compiled"
}

check_cocoa() {
  check_command "$cocoa" "-x objective-c++" -fno-objc-arc -std=gnu++17 -fvisibility=hidden
  [ "$(grep -cF objective-c++ "$commands")" -eq 1 ] || fail "other sources are Objective-C++"
}

check_product() {
  local libraries expected
  check_command "$product" -dynamiclib "-install_name @rpath/libQORNOpenOffice.jnilib" \
    -Wl,-rpath,@loader_path "-Xlinker -exported_symbols_list"
  command_with " -o $product " | grep -qE -e '-Xlinker "?[^ "].*/cmake/exports\.txt"? ' ||
    fail "no list of exports"
  libraries=$(command_with " -o $product " |
    grep -oE -e '[^/ ]+\.(a|dylib)( |$)' -e ' -l[^ ]+' | tr -d ' ' | sort)
  expected=$(printf '%s\n' libboost_{filesystem,thread}.a libqorn_{1base,2system,3util}.a)
  [ "$libraries" = "$expected" ] ||
    fail "the product is linked with:" "$libraries"
}

check_all_frameworks() {
  local base=(AddressBook Carbon CoreFoundation Foundation SystemConfiguration)
  local system=(AddressBook ApplicationServices Carbon CoreFoundation CoreGraphics CoreServices
    Foundation SystemConfiguration)
  check_frameworks bin/StringsKindsTest "${base[@]}"
  check_frameworks bin/EncryptTest "${system[@]}"
  check_frameworks "$product" "${system[@]}"
}

check_java() {
  local made
  made=$(command_with " -o $bridge ")
  [[ $made == *"$java_home/include "*"$java_home/include/darwin "* ]] || fail "not its Java: $made"
}

check_nothing_of_linux() {
  local found
  found=$(grep -nE -e 'src/0Platform|Linux' -e '-lqorn|-licu|libicu|plist|systemd|-ldl|-lpthread' \
    -e '--wrap|version-script|-z[, ]|defsym|dynamic-symbol|new-dtags|static-lib' "$commands" || true)
  [ -z "$found" ] || fail "of Linux: $found"
}

# No test is built that has something put in front of something else.
check_tests() {
  local source count=0
  while IFS= read -r source; do
    ! grep -qE '__wrap_|__real_|PlatformCalls\.h' -- "$root/$source" || fail "is built: $source"
    count=$((count + 1))
  done < <(grep -oE -e ' -o tests/[^ ]*\.o ' "$commands" |
    sed -E 's, -o (.*)CMakeFiles/[^/]*/(.*)\.o ,\1\2,; s,/__,/..,g')
  [ "$count" -gt 50 ] || fail "only $count sources of tests are built"
}

check_all() {
  check_every_command "$both_processors"
  check_every_command " -mmacosx-version-min=10.15 "
  check_sources
  check_cocoa
  check_product
  check_all_frameworks
  check_java
  check_nothing_of_linux
  check_tests
}

TheProjectIsBuiltForBothProcessors() {
  mac arm64 /opt/homebrew
  configure_project "-DCMAKE_OSX_ARCHITECTURES=x86_64;arm64"
  check_all
}

# expect_noticed <command of sed>: in the list of commands it is a mistake that the checks find.
expect_noticed() {
  sed -E "$1" "$work/right" >"$commands"
  ! cmp -s "$work/right" "$commands" || fail "changes nothing: $1"
  ! (check_all) >/dev/null 2>&1 || fail "not noticed: $1"
}

EachMistakeIsNoticed() {
  mac arm64 /opt/homebrew
  configure_project "-DCMAKE_OSX_ARCHITECTURES=x86_64;arm64"
  mv -- "$commands" "$work/right"
  expect_noticed '/BaseMacOS\.cpp/s/-arch x86_64//'
  expect_noticed '/jnilib/s/-arch arm64//'
  expect_noticed '/EncryptMd5/s/=10\.15/=11.0/'
  expect_noticed '/ -o .*TimeClock\.cpp\.o/d'
  expect_noticed '1s/$/ -o src\/1Base\/CMakeFiles\/x\/BaseMacOSLinuxMail.cpp.o /'
  expect_noticed 's/-fno-objc-arc/-fobjc-arc/'
  expect_noticed '/Cocoa/s/gnu\+\+17/gnu++14/'
  expect_noticed '/BaseMacOS\.cpp/s/ -c / -x objective-c++ -c /'
  expect_noticed 's/libQORNOpenOffice\.jnilib/libQORNOpenOffice.dylib/'
  expect_noticed 's/@rpath/\/tmp\/build/'
  expect_noticed 's/-exported_symbols_list/-unexported_symbols_list/'
  expect_noticed 's/exports\.txt/exports.map/'
  expect_noticed 's/libboost_thread\.a/libboost_thread.dylib/'
  expect_noticed '/jnilib/s/$/ -ljvm/'
  expect_noticed '/jnilib/s/-framework CoreGraphics//'
  expect_noticed '/jnilib/s/$/ -framework AppKit/'
  expect_noticed '/StringsKindsTest/s/$/ -framework CoreGraphics/'
  expect_noticed 's/include\/darwin/include\/linux/'
  expect_noticed '/EncryptTest/s/$/ -lqorn_test_platform_calls/'
  expect_noticed '/EncryptTest/s/$/ -Wl,--wrap=CFRelease/'
  expect_noticed '/jnilib/s/$/ -Wl,-z,now/'
  expect_noticed 's,EncodingLatin1Test\.cpp\.o ,EncodingConverterTest.cpp.o ,g'
  expect_noticed '/ -o tests.*\.o /d'
}

TestsOfLinuxCountAsSkipped() {
  mac arm64 /opt/homebrew
  configure_project
  expect_success ctest --test-dir "$build" -R '^(EncodingTest|ErrorAssertTest)\.Linux$'
  [ "$(grep -c '\*\*\*Skipped' <<<"$output")" -eq 2 ] || fail "not skipped"
  list_commands
  [ -n "$(command_with EncodingLatin1Test.cpp.o " -c ")" ] || fail "too much is left out"
  ! grep -F -e EncodingConverterTest.cpp -e StreamsBufferTest.cpp "$commands" || fail "built there"
}

TheMachinesProcessorIsTheDefault() {
  mac arm64 /opt/homebrew
  configure_project
  ! grep -F -e ' -arch ' "$commands" || fail "another processor"
}

TheOldestMacCanBeChosen() {
  mac arm64 /opt/homebrew
  configure_project -DCMAKE_OSX_DEPLOYMENT_TARGET=13.0
  check_every_command " -mmacosx-version-min=13.0 "
  export MACOSX_DEPLOYMENT_TARGET=12.3
  configure_project
  check_every_command " -mmacosx-version-min=12.3 "
}

AProjectAroundItChoosesItsOwnOldestMac() {
  mac arm64 /opt/homebrew
  # Else CMake makes an entry for the project around it.
  add_tool /usr/bin/sw_vers 'exit 1'
  add_file CMakeLists.txt <<END
cmake_minimum_required(VERSION 3.25)
project(another LANGUAGES CXX)
add_subdirectory("$root" qorn)
END
  expect_success configure "$project"
  list_commands
  [ -n "$(command_with BaseMacOSCocoa.mm.o " -c ")" ] || fail "the foundation is not built"
  ! grep -F -e '-mmacosx-version-min' "$commands" || fail "chosen for it"
}

# Homebrew lies elsewhere there.
AMacWithIntelsProcessorIsKnown() {
  mac x86_64 /usr/local
  configure_project "-DCMAKE_OSX_ARCHITECTURES=x86_64;arm64"
  check_all
}

TheStandInForJavaIsNoJava() {
  mac arm64 /opt/homebrew
  rm -- "$mac/opt/homebrew/opt/openjdk@17"
  # Found only where the folder above the stand-in is taken for a Java's.
  add_to_mac /usr/lib/server/libjvm.dylib </dev/null
  expect_failure 1 "The Java bridge needs a JDK 11 or newer" configure "$root"
}

AnotherJavaCanBeChosen() {
  mac arm64 /opt/homebrew
  mv -- "$java_home" "$mac/java"
  java_home=$mac/java
  export JAVA_HOME=$java_home
  configure_project
  check_java
}

run_case "$@"
