# The Debian packages, and the README's way to them. BUILD names the build's folder, JAVA the Java
# machine, CPACK the program that packs.
# shellcheck shell=bash
# shellcheck disable=SC2016 # commands are handed to other shells, which expand them
# shellcheck source=tests/scripts/package.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/package.sh"

# make, which CMake calls where nothing else is wished, knows no path with a colon.
clone="$work/clone, of Größe 東京"
packages=$clone/build/package

# In the "C" locale CPack finds no file in a path that is not ASCII.
make_packages() {
  expect_success env LC_ALL=C.UTF-8 "$CPACK" --config "$BUILD/CPackConfig.cmake" -B "$packages"
}

# package_file <name>: prints where the package lies.
package_file() {
  printf '%s\n' "$packages/$1_$(project_version)_$(dpkg --print-architecture).deb"
}

# expect_packed <package> <component>: the package holds what the component installs.
expect_packed() {
  make_packages
  expect_success cmake --install "$BUILD" --prefix "$work/tree/usr" --component "$2"
  output=$(diff <(cd -- "$work/tree" && find . ! -type d | LC_ALL=C sort) \
    <(dpkg-deb --fsys-tarfile "$(package_file "$1")" | tar -t | grep -v '/$' | LC_ALL=C sort)) ||
    fail "other files are packed"
}

# expect_field <package> <field> <pattern of the shell>
expect_field() {
  output=$(dpkg-deb --field "$(package_file "$1")" "$2")
  # shellcheck disable=SC2053 # a pattern
  [[ $output == $3 ]] || fail "$2 of $1 is not $3"
}

TheRunTimePackageHoldsTheLibrary() {
  expect_packed libqorn-jni library
  expect_field libqorn-jni Depends '*libc6 (>= *libicu72*libstdc++6*'
  expect_field libqorn-jni Version "$(project_version)"
  expect_field libqorn-jni Architecture "$(dpkg --print-architecture)"
}

TheDevelopmentPackageHoldsTheRest() {
  expect_packed libqorn-dev development
  expect_field libqorn-dev Depends 'libboost1.81-dev, *libicu-dev (<< 73~)*libplist-dev*'
}

# Whoever builds, and wherever: the files belong to root and can be read by all.
EverybodyCanReadWhatIsPacked() {
  umask 077
  make_packages
  for name in libqorn-jni libqorn-dev; do
    expect_success dpkg-deb --contents "$(package_file "$name")"
    ! grep -vE '^(drwxr-xr-x|-rw-r--r--|lrwxrwxrwx) root/root ' <<<"$output" ||
      fail "$name holds files with other rights"
  done
}

# readme_commands <pattern of awk>: those blocks of commands of the README's section on installing
# whose first line matches.
readme_commands() {
  awk -v pattern="$1" '
    /^## / { section = $0 == "## Installing it" }
    /^```/ { inside = section && $0 == "```sh"; first = 1; next }
    inside && first { wanted = $0 ~ pattern; first = 0 }
    inside && wanted' "$root/README.md"
}

# in_another_system <file>: runs the commands of the file, as `try` does, on a system that looks
# like this one and is gone when they end.
in_another_system() {
  mkdir -p -- "$work/layers"
  try unshare --mount --propagation private bash -euc '
    cd -- "$1/layers"
    mount -t tmpfs tmpfs .
    cd -- "$1/layers"
    mkdir upper work root
    mount -t overlay -o lowerdir=/,upperdir=upper,workdir=work overlay root
    for folder in /proc /dev "$1"; do
      mount --rbind "$folder" "root$folder"
    done
    exec chroot root bash -euxo pipefail "$2"
  ' in_another_system "$work" "$1"
}

skip_without_another_system() {
  [ "$(id -u)" -eq 0 ] || skip "only root can install a package"
  in_another_system /dev/null
  [ "$status" -eq 0 ] || skip "no second system can be made here: $(tail -n 1 <<<"$output")"
}

# The README's commands, with a project of somebody else between them.
ThePackagesInstallAndAreRemovedCleanly() {
  skip_without_another_system
  make_packages
  cp -r -- "$root/examples" "$clone/"
  cat >"$work/list" <<'END'
find /etc /opt /usr /var -xdev \( -path /var/cache -o -path /var/log -o -path /var/lib/apt \
  -o -path /var/lib/dpkg -o -path /usr/share/doc \) -prune -o -print | LC_ALL=C sort
dpkg-query --show
END
  {
    declare -p clone work JAVA
    cat <<'END'
export DEBIAN_FRONTEND=noninteractive LC_ALL=C.UTF-8
cd -- "$clone"
dpkg --purge libqorn-dev libqorn-jni
bash "$work/list" >"$work/before"
END
    readme_commands '^apt-get install'
    cat <<'END'
bash "$work/list" >"$work/between"
cmake -S examples/package -B build/first_steps
cmake --build build/first_steps
build/first_steps/first_steps >"$work/said"
g++ -std=c++17 examples/cpp/FirstSteps.cpp $(pkg-config --cflags --libs qorn-2system) \
  -o build/first_steps/plain
build/first_steps/plain >>"$work/said"
sed -i 's/System.load(.*)/System.loadLibrary("QORNOpenOffice")/' examples/java/FirstSteps.java
cd examples/java
"${JAVA}c" -cp /usr/share/java/qorn.jar FirstSteps.java
"$JAVA" -cp /usr/share/java/qorn.jar:. FirstSteps >>"$work/said"
cd ../..
END
    readme_commands '^apt-get purge'
    echo 'bash "$work/list" >"$work/after"'
  } >"$work/commands"
  in_another_system "$work/commands"
  expect_status 0
  output=$(cat -- "$work/said")
  [ "$output" = $'9\n/home/ada/Grüße.pdf\n9\n/home/ada/Grüße.pdf\n3\n0' ] ||
    fail "not what the comments say"
  output=$(diff "$work/before" "$work/after") || fail "something is left"
  ! cmp --silent "$work/before" "$work/between" || fail "nothing was installed"
}

# In a copy, as whoever has it cloned; into a folder whose name a shell does not split.
TheReadmesWayLeadsIntoAFolder() {
  if command -v ccache >/dev/null; then
    # The copy of the next run lies elsewhere and is the same.
    CCACHE_DIR=$(ccache --get-config cache_dir)
    export CCACHE_DIR CCACHE_BASEDIR=$clone CCACHE_NOHASHDIR=1 CCACHE_SLOPPINESS=time_macros
  fi
  mkdir -- "$clone"
  cp -r -- "$root"/{CMakeLists.txt,CMakePresets.json,cmake,examples,src} "$clone/"
  HOME=$(mktemp -d /tmp/qorn-home-XXXXXX)
  trap 'rm -rf -- "$work" "$HOME"' EXIT
  export HOME
  PATH=$(dirname -- "$JAVA"):$PATH
  unset PKG_CONFIG_PATH CMAKE_PREFIX_PATH
  cd -- "$clone"
  readme_commands '^[^a]' >"$work/commands"
  try env LC_ALL=C.UTF-8 bash -euo pipefail "$work/commands"
  expect_status 0
  [ "$(grep -cx 9 <<<"$output")$(grep -cx /home/ada/Grüße.pdf <<<"$output")" = 22 ] ||
    fail "not what the comments say in C++"
  expect_said $'\n3\n0\n'
  [ "$(find build/package -maxdepth 1 -name '*.deb' | wc -l)" -eq 2 ] || fail "no two packages"
}

run_case "$@"
