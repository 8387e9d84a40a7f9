# Sourced by the tests that configure for macOS: a Mac that is made up of Homebrew's packages, as far
# as CMake looks at them, and of the answers that Apple's tools give it.
# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

mac=$work/mac
build=$work/build

# add_to_mac <path>: writes the standard input there.
add_to_mac() {
  mkdir -p -- "$(dirname -- "$mac$1")"
  cat >"$mac$1"
}

# add_tool <path> <line of shell>: a program on the Mac.
add_tool() {
  printf '#!/bin/sh\n%s\n' "$2" | add_to_mac "$1"
  chmod +x -- "$mac$1"
}

# mac <processor> <folder of Homebrew>: makes the Mac. Its own javac finds no Java.
mac() {
  processor=$1
  homebrew=$2
  mkdir -p -- "$mac/sdk/usr/include"
  add_tool /usr/bin/sw_vers 'echo 15.6'
  add_tool /usr/bin/xcode-select "echo '$mac/developer'"
  add_tool /usr/bin/sysctl 'exit 1'
  add_tool /usr/bin/install_name_tool 'exit 1'
  add_tool /usr/bin/javac 'echo "Unable to locate a Java Runtime." >&2; exit 1'
  add_tool /usr/bin/java 'echo "Unable to locate a Java Runtime." >&2; exit 1'
  export PATH="$mac/usr/bin:$PATH"
  unset JAVA_HOME MACOSX_DEPLOYMENT_TARGET CMAKE_OSX_ARCHITECTURES CXX CXXFLAGS LDFLAGS
  add_boost
  add_google_test
  add_java
  add_to_mac /toolchain.cmake <<END
set(CMAKE_SYSTEM_NAME Darwin)
set(CMAKE_SYSTEM_VERSION 24.6.0)
set(CMAKE_SYSTEM_PROCESSOR $processor)
foreach(language CXX OBJCXX)
  set(CMAKE_\${language}_COMPILER "$(type -P clang++)")
  set(CMAKE_\${language}_COMPILER_TARGET $processor-apple-macos)
  # There is nothing to link a program with.
  set(CMAKE_\${language}_COMPILER_WORKS ON)
endforeach()
set(CMAKE_TRY_COMPILE_TARGET_TYPE STATIC_LIBRARY)
set(CMAKE_AR "$(type -P ar)")
set(CMAKE_RANLIB "$(type -P ranlib)")
set(CMAKE_INSTALL_NAME_TOOL "$mac/usr/bin/install_name_tool")
set(CMAKE_OSX_SYSROOT "$mac/sdk")
set(CMAKE_FIND_ROOT_PATH "$mac")
foreach(kind PROGRAM LIBRARY INCLUDE PACKAGE)
  set(CMAKE_FIND_ROOT_PATH_MODE_\${kind} ONLY)
endforeach()
END
}

# Its shared libraries lie beside the archives, and are given to who does not ask for those.
add_boost() {
  local folder=$homebrew/lib/cmake/Boost-1.90.0
  add_to_mac "$folder/BoostConfigVersion.cmake" <<'END'
set(PACKAGE_VERSION 1.90.0)
set(PACKAGE_VERSION_COMPATIBLE TRUE)
END
  add_to_mac "$folder/BoostConfig.cmake" <<END
set(suffix .dylib)
if(Boost_USE_STATIC_LIBS)
  set(suffix .a)
endif()
foreach(name headers filesystem thread)
  set(Boost_\${name}_FOUND TRUE)
  add_library(Boost::\${name} INTERFACE IMPORTED)
  target_include_directories(Boost::\${name} INTERFACE "$mac$homebrew/include")
endforeach()
foreach(name filesystem thread)
  target_link_libraries(Boost::\${name} INTERFACE "$mac$homebrew/lib/libboost_\${name}\${suffix}")
endforeach()
END
  mkdir -p -- "$mac$homebrew/include"
}

add_google_test() {
  add_to_mac "$homebrew/lib/cmake/GTest/GTestConfig.cmake" <<END
foreach(name gtest gtest_main)
  add_library(GTest::\${name} INTERFACE IMPORTED)
  target_link_libraries(GTest::\${name} INTERFACE "$mac$homebrew/lib/lib\${name}.a")
endforeach()
END
}

# Homebrew's links lead through its own folder of programs to the Java that lies beside.
add_java() {
  local keg=$homebrew/Cellar/openjdk@17/17.0.20 tool
  java_home=$mac$keg/libexec/openjdk.jdk/Contents/Home
  mkdir -p -- "$mac$keg/bin" "$mac$homebrew/opt"
  for tool in jar java javac javadoc; do
    # shellcheck disable=SC2028 # the program reads the escapes
    add_tool "${java_home#"$mac"}/bin/$tool" 'echo "openjdk version \"17.0.20\"" >&2'
    ln -s -- "../libexec/openjdk.jdk/Contents/Home/bin/$tool" "$mac$keg/bin/$tool"
  done
  ln -s -- ../Cellar/openjdk@17/17.0.20 "$mac$homebrew/opt/openjdk@17"
  add_to_mac "${java_home#"$mac"}/include/jni.h" <<<'#include "jni_md.h"'
  add_to_mac "${java_home#"$mac"}/include/darwin/jni_md.h" </dev/null
  add_to_mac "${java_home#"$mac"}/lib/server/libjvm.dylib" </dev/null
}

# configure <folder of sources> [<argument of cmake>...]
configure() {
  rm -rf -- "$build"
  cmake -G Ninja -DCMAKE_MAKE_PROGRAM="$(type -P ninja)" --toolchain "$mac/toolchain.cmake" \
    -S "$1" -B "$build" "${@:2}"
}

# Writes all commands of the build, one a line and without quotes, to a file that `commands` names.
list_commands() {
  commands=$work/commands
  ninja -C "$build" -t commands | tr -d '"\134' >"$commands"
}

# command_with <text>...: prints the one command that holds all of the texts.
command_with() {
  local found text
  found=$(cat -- "$commands")
  for text in "$@"; do
    found=$(grep -F -e "$text" <<<"$found" || true)
  done
  [ -n "$found" ] || fail "no command with: $*"
  [ "$(wc -l <<<"$found")" -eq 1 ] || fail "more than one command with: $*"
  printf '%s\n' "$found"
}
