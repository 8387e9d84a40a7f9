# What happens where something is missing or lies elsewhere: it works, or one line says what to do.
# shellcheck shell=bash
# shellcheck disable=SC2016 # the shells that are started expand their variables themselves
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

build=$work/build

# configure [<argument of cmake>...]: of the sources in `sources`, the tests left aside.
sources=$root
configure() {
  cmake -G Ninja -S "$sources" -B "$build" -DQORN_BUILD_TESTS=OFF "$@"
}

# expect_refusal <text> [<argument of cmake>...]: CMake ends with this as its one error.
expect_refusal() {
  try configure "${@:2}"
  expect_status 1
  [ "$(grep -c '^CMake Error' <<<"$output")" -eq 1 ] || fail "not one error"
  # CMake breaks the text into lines.
  output=$(tr -s ' \n' ' ' <<<"$output")
  expect_said "$1"
}

without_jdk=(-DCMAKE_DISABLE_FIND_PACKAGE_JNI=ON -DCMAKE_DISABLE_FIND_PACKAGE_Java=ON)

WithoutAJdkTheBridgeIsRefused() {
  expect_refusal "The Java bridge needs a JDK 11 or newer (Debian: openjdk-17-jdk-headless);\
 -DQORN_BUILD_BRIDGE=OFF builds the foundation alone" "${without_jdk[@]}"
}

WithoutPeersTheBenchmarksAreConfigured() {
  [ -n "$(find /usr/lib /usr/local/lib -name benchmarkConfig.cmake 2>/dev/null)" ] ||
    skip "Google Benchmark is not installed"
  local peer hidden=(-DCMAKE_DISABLE_FIND_PACKAGE_PkgConfig=ON)
  for peer in absl date Poco Qt5Core; do
    hidden+=("-DCMAKE_DISABLE_FIND_PACKAGE_$peer=ON")
  done
  expect_success configure -DQORN_BUILD_BRIDGE=OFF -DQORN_BUILD_BENCHMARKS=ON "${hidden[@]}"
  for peer in Absl Fmt GLib Poco Qt Spdlog SQLite; do
    expect_said "Benchmarks: $peer is not installed, left out"
  done
}

WithoutGoogleBenchmarkTheBenchmarksAreRefused() {
  expect_refusal "The benchmarks need Google Benchmark (Debian: libbenchmark-dev)" \
    -DQORN_BUILD_BRIDGE=OFF -DQORN_BUILD_BENCHMARKS=ON \
    -DCMAKE_DISABLE_FIND_PACKAGE_benchmark=ON
}

# expect_other_boost <variable of CMake>: a Boost in a folder of its own, made of links to the
# system's, is found by the variable while the system's own places are hidden.
expect_other_boost() {
  local own="$project/own boost" library
  [ -d /usr/include/boost ] || skip "the system's Boost is not where Debian has it"
  mkdir -p -- "$own/lib"
  ln -s /usr/include "$own/include"
  while IFS= read -r library; do
    ln -s "$library" "$own/lib/"
  done < <(find /usr/lib -name 'libboost_*.a' 2>/dev/null)
  [ -e "$own/lib/libboost_filesystem.a" ] || skip "there is no static Boost"
  expect_success configure -DQORN_BUILD_BRIDGE=OFF "-D$1=$own" \
    -DBoost_NO_SYSTEM_PATHS=ON -DBoost_NO_BOOST_CMAKE=ON
  grep -qF "=$own/include" "$build/CMakeCache.txt" || fail "not its headers"
  [ "$(grep -cF "_LIBRARY_RELEASE:FILEPATH=$own/lib/libboost_" "$build/CMakeCache.txt")" -eq 4 ] ||
    fail "not its libraries"
}

ABoostIsFoundByItsRoot() {
  expect_other_boost Boost_ROOT
}

ABoostIsFoundByThePrefix() {
  expect_other_boost CMAKE_PREFIX_PATH
}

SharedLibrariesAreNotMade() {
  expect_success configure -DQORN_BUILD_BRIDGE=OFF -DBUILD_SHARED_LIBS=ON
  expect_said "BUILD_SHARED_LIBS changes nothing: the foundation's libraries are static"
  ! grep -qE '^build [^:]*\.so:' "$build/build.ninja" || fail "a shared library would be made"
  expect_success configure -DBUILD_SHARED_LIBS=OFF
  expect_not_said "BUILD_SHARED_LIBS"
}

# Without a JDK, in paths with all that may be hard to quote.
AReadOnlySourceTreeIsBuiltWithoutAJdk() {
  sources=$project/sources
  mkdir -- "$sources"
  cp -r -- "$root/CMakeLists.txt" "$root/CMakePresets.json" "$root/cmake" "$root/src" \
    "$root/examples" "$sources/"
  if [ "$(id -u)" -eq 0 ]; then
    unshare --mount true 2>/dev/null || skip "root may write everywhere, and not mount here"
    try unshare --mount bash -c '
      mount --bind "$1" "$1" && mount -o remount,bind,ro "$1" && exec bash "$2" build_read_only "$1"
      ' _ "$sources" "${BASH_SOURCE[0]}"
  else
    chmod -R a-w "$sources"
    try bash "${BASH_SOURCE[0]}" build_read_only "$sources"
    chmod -R u+w "$sources"
  fi
  expect_status 0
}

# The two lowest floors; what builds the others is no different.
build_read_only() {
  build=$project/build
  ! touch "$sources/new" 2>/dev/null || fail "the sources can be written to"
  expect_success configure "${without_jdk[@]}" -DQORN_BUILD_BRIDGE=OFF -DCMAKE_BUILD_TYPE=Debug
  expect_success cmake --build "$build" --target qorn_1base
  output=$(ls "$build/lib")
  [ "$output" = $'libqorn_0platform.a\nlibqorn_1base.a' ] || fail "not these two floors"
}

if [ "${1:-}" = build_read_only ]; then
  sources=$2
fi
run_case "$@"
