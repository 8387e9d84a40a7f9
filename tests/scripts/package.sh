# Sourced by the tests of what is installed and packed.
# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# Where what is installed lies in the end: not where it was installed. Lists of pkg-config and of
# Java are split at colons, so the name holds none.
place="$work/another place, of Größe 東京"

# install_there [<option of cmake --install>...]
install_there() {
  expect_success cmake --install "$BUILD" --prefix "$work/first place" "$@"
  mv -- "$work/first place" "$place"
}

# installed <pattern of find>: prints the installed files whose path matches.
installed() {
  (cd -- "$place" && find . ! -type d -path "$1")
}

# expect_installed <pattern of find>: there are those files that the standard input lists, and no
# others.
expect_installed() {
  output=$(diff <(LC_ALL=C sort) <(installed "$1" | LC_ALL=C sort)) ||
    fail "other files are installed"
}

project_version() {
  sed -n 's/^project(qorn VERSION \([0-9.]*\).*/\1/p' "$root/CMakeLists.txt"
}
