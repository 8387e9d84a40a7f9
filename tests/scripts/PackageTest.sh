# What is installed, as a stranger meets it: somebody else's project finds it, in C++ by CMake and
# by pkg-config, and in Java. BUILD names the build's folder, JAVA and JAR two programs of Java.
# shellcheck shell=bash
# shellcheck source=tests/scripts/package.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/package.sh"

examples=$root/examples

# project_with <source> <component>...: a program of the source, in a project of its own that finds
# these components.
project_with() {
  local source=$1
  shift
  cp -- "$source" "$project/program.cpp"
  add_file CMakeLists.txt <<END
cmake_minimum_required(VERSION 3.25)
project(stranger LANGUAGES CXX)
find_package(qorn ${version-0.1} REQUIRED COMPONENTS $*)
add_executable(program program.cpp)
target_link_libraries(program PRIVATE ${*/#/qorn::})
END
}

# configure_project [<option of cmake>...]
configure_project() {
  try cmake -G Ninja -S "$project" -B "$work/build" -DCMAKE_PREFIX_PATH="$place" "$@"
}

expect_configured() {
  configure_project "$@"
  expect_status 0
}

# expect_refused <text> [<option of cmake>...]: the project is told so, in a line of its own.
expect_refused() {
  configure_project "${@:2}"
  expect_status 1
  grep -qxF -- "  $1" <<<"$output" || fail "no line says: $1"
}

# expect_example <program> <source>: the program prints what the source says.
expect_example() {
  expect_success cmake -DPROGRAM="$1" -DSOURCE="$2" -P "$examples/cpp/CheckExample.cmake"
}

# A program of the lowest floor, which calls for each library that this one needs.
platform_program() {
  cat >"$work/platform.cpp" <<END
// Decomposes nothing, composes one letter and finds no bundle.
//
// Prints:
//     3

#include <CoreFoundation/CoreFoundation.h>

#include <cstdio>

int main() {
    UInt8 const name[] = {'u', 0xCC, 0x88, 's', 's'};
    CFStringRef text =
        CFStringCreateWithBytes(nullptr, name, sizeof name, kCFStringEncodingUTF8, false);
    CFMutableStringRef composed = CFStringCreateMutableCopy(nullptr, 0, text);
    CFStringNormalize(composed, kCFStringNormalizationFormC);
    CFURLRef url = CFURLCreateWithFileSystemPath(nullptr, text, kCFURLPOSIXPathStyle, true);
    if (CFBundleCreate(nullptr, url) != nullptr) {
        return 1;
    }
    std::printf("%ld\n", static_cast<long>(CFStringGetLength(composed)));
    CFRelease(url);
    CFRelease(composed);
    CFRelease(text);
}
END
}

# example_of <component>: sets `source` to a program that needs it and nothing above.
example_of() {
  case $1 in
    0platform)
      platform_program
      source=$work/platform.cpp
      ;;
    1base) source=$examples/cpp/text_example.cpp ;;
    2system) source=$examples/cpp/dates_example.cpp ;;
    3util) source=$examples/cpp/bytes_example.cpp ;;
    foundation) source=$examples/cpp/file_spec_example.cpp ;;
  esac
}

# expect_found <component>: a project that wants it alone is built, and works.
expect_found() {
  install_there
  example_of "$1"
  project_with "$source" "$1"
  expect_configured
  expect_success cmake --build "$work/build"
  expect_example "$work/build/program" "$source"
}

AProjectFinds0Platform() { expect_found 0platform; }
AProjectFinds1Base() { expect_found 1base; }
AProjectFinds2System() { expect_found 2system; }
AProjectFinds3Util() { expect_found 3util; }
AProjectFindsTheFoundation() { expect_found foundation; }

WithoutComponentsAllIsFound() {
  install_there
  project_with "$examples/cpp/bytes_example.cpp" 3util
  sed -i 's/ COMPONENTS .*)/)/' "$project/CMakeLists.txt"
  expect_configured
}

AnUnknownComponentIsToldInOneLine() {
  install_there
  project_with "$examples/cpp/bytes_example.cpp" 3util 4office
  expect_refused \
    "no component 4office; there are: 0platform 1base 2system 3util foundation"
  sed -i 's/COMPONENTS 3util 4office/COMPONENTS 3util OPTIONAL_COMPONENTS 4office/
    s/ qorn::4office//' "$project/CMakeLists.txt"
  expect_configured
}

AnotherVersionIsRefused() {
  install_there
  for version in 0.0 0.2 1; do
    project_with "$examples/cpp/bytes_example.cpp" 3util
    configure_project
    expect_status 1
    expect_said "version: $(project_version)"
  done
}

OnlyWhatIsNeededIsLookedFor() {
  install_there
  project_with "$examples/cpp/bytes_example.cpp" 0platform
  expect_configured -DCMAKE_DISABLE_FIND_PACKAGE_Boost=ON
  expect_refused "it needs ICU 72: uc, i18n and data" -DCMAKE_DISABLE_FIND_PACKAGE_ICU=ON
  expect_refused "it needs libplist 2.2 or newer (Debian: libplist-dev)" \
    -DCMAKE_DISABLE_FIND_PACKAGE_ICU=OFF -DCMAKE_DISABLE_FIND_PACKAGE_Plist=ON
  project_with "$examples/cpp/bytes_example.cpp" 2system
  expect_refused "it needs Boost 1.81: headers, and filesystem and thread as archives" \
    -DCMAKE_DISABLE_FIND_PACKAGE_Plist=OFF
}

AnotherReleaseOfALibraryIsRefused() {
  install_there
  project_with "$examples/cpp/bytes_example.cpp" 3util
  sed -i 's/_qorn_expect(Boost 1\.81/_qorn_expect(Boost 1.80/' \
    "$place/lib/cmake/qorn/qorn-config.cmake"
  expect_refused "it was built with Boost 1.80 and needs the same, not 1.81.0"
}

# Boost_USE_STATIC_LIBS decides which Boost the project itself links.
TheProjectsOwnChoiceOfBoostStays() {
  install_there
  project_with "$examples/cpp/bytes_example.cpp" 3util
  cat >>"$project/CMakeLists.txt" <<'END'
if(DEFINED Boost_USE_STATIC_LIBS)
  message(FATAL_ERROR "it was set")
endif()
set(Boost_USE_STATIC_LIBS OFF)
find_package(qorn COMPONENTS 2system)
message(STATUS "it is ${Boost_USE_STATIC_LIBS}")
END
  expect_configured
  expect_said "it is OFF"
}

# pkg_config <option>...: its answer about the installed files.
pkg_config() {
  PKG_CONFIG_PATH=$place/lib/pkgconfig pkg-config "$@"
}

# expect_linked <component> [<option of pkg-config>...]: a plain compiler makes a program of its
# example.
expect_linked() {
  local flags source
  install_there
  example_of "$1"
  flags=$(pkg_config --cflags --libs "${@:2}" "qorn-$1") || fail "pkg-config fails for $1"
  # The answer is quoted for a shell.
  expect_success eval "g++ -std=c++17 '$source' $flags -o '$work/program'"
  expect_example "$work/program" "$source"
}

ThePlainCompilerLinks0Platform() { expect_linked 0platform --static; }
ThePlainCompilerLinks1Base() { expect_linked 1base --static; }
ThePlainCompilerLinks2System() { expect_linked 2system --static; }
ThePlainCompilerLinks3Util() { expect_linked 3util --static; }
ThePlainCompilerLinksTheFoundation() { expect_linked foundation; }

PkgConfigTellsTheVersion() {
  install_there
  for component in 0platform 1base 2system 3util foundation; do
    expect_success pkg_config --modversion "qorn-$component"
    [ "$output" = "$(project_version)" ] || fail "another version of $component"
  done
}

# One unit includes every public header, and so every one that these include.
EveryPublicHeaderIsInstalledAndNoOther() {
  local flags included
  install_there
  flags=$(pkg_config --cflags qorn-foundation)
  (cd -- "$root/src" && find . -name '*.h' ! -path '*/_Imp/*' ! -path './QORN*') >"$work/public"
  sed 's,^\./,#include ",; s,$,",' "$work/public" >"$work/all.cpp"
  expect_success eval "g++ -std=c++17 -Wall -Wextra -Werror -MD -MF '$work/used' \
    -fsyntax-only '$work/all.cpp' $flags"
  included=$(sed 's/\\ / /g; s/ *\\$//; s/^ *//' "$work/used" |
    sed -n 's,^.*/include/qorn/\(.*/_Imp/.*\),./\1,p')
  { cat -- "$work/public" && printf '%s\n' "$included"; } |
    sed 's,^\.,./include/qorn,' | expect_installed './include/*'
}

TheLibraryIsTheProductAndItsClass() {
  install_there --component library
  expect_installed '*' <<'END'
./lib/jni/libQORNOpenOffice.jnilib
./lib/jni/libQORNOpenOffice.so
./share/java/qorn.jar
END
}

TheRestIsForDevelopment() {
  install_there --component development
  [ -z "$(installed '*/jni/*')$(installed './share/java/*')" ] || fail "the product is among it"
  expect_installed './lib/*.a' <<'END'
./lib/libqorn_0platform.a
./lib/libqorn_1base.a
./lib/libqorn_2system.a
./lib/libqorn_3util.a
END
}

NothingInstalledNamesTheBuildMachine() {
  install_there
  # The search finds what it must not find there.
  expect_success grep -rlF -e "$root" -e "$BUILD" -- "$BUILD/CMakeCache.txt"
  try grep -rlF -e "$root" -e "$BUILD" -e "$work" -- "$place"
  expect_status 1
}

# expect_first_steps <option of java>...: the program of the README runs and says the right thing.
expect_first_steps() {
  expect_success env -i LC_ALL=C.UTF-8 "$JAVA" -cp "$place/share/java/qorn.jar:." "$@"
  [ "$output" = $'3\n0' ] || fail "not what the comments say"
}

compile_first_steps() {
  expect_success env -i LC_ALL=C.UTF-8 "${JAVA}c" -cp "$place/share/java/qorn.jar" \
    FirstSteps.java
}

AProgramInJavaUsesTheLibrary() {
  install_there --component library
  mkdir -- "$work/java"
  cd -- "$work/java"
  cp -- "$examples/java/FirstSteps.java" .
  compile_first_steps
  expect_first_steps FirstSteps "$place/lib/jni/libQORNOpenOffice.jnilib"
  sed -i 's/System.load(.*)/System.loadLibrary("QORNOpenOffice")/' FirstSteps.java
  compile_first_steps
  expect_first_steps -Djava.library.path="$place/lib/jni" FirstSteps
}

TheArchiveOfClassesTellsTheVersion() {
  install_there --component library
  cd -- "$work"
  expect_success env LC_ALL=C.UTF-8 "$JAR" --extract --file "$place/share/java/qorn.jar"
  tr -d '\r' <META-INF/MANIFEST.MF | grep -qxF "Implementation-Version: $(project_version)" ||
    fail "the manifest does not tell the version"
}

run_case "$@"
