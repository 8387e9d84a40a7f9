# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/system.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/system.sh"

# A system with package sources in both forms, whose apt-get fetches the source package that stands
# in $work/package.
system_with_sources() {
  export WORK=$work
  cp -r -- "$root/scripts" "$project/"
  mkdir -p -- "$work/bin" "$work/etc/parts" "$work/package"
  PATH=$work/bin:$PATH
  echo 'deb [arch=amd64] http://one.example/debian stable main' >"$work/etc/sources.list"
  printf 'Types: deb\nURIs: http://two.example/debian\n' >"$work/etc/parts/two.sources"
  stub apt-config <<<'printf "list=%q\nlists=%q\n" "$WORK/etc/sources.list" "$WORK/etc/parts/"'
  stub apt-get <<'END'
configuration=$2
[ "$1" = --config-file ] || exit 9
shift 3
echo "$*" >>"$WORK/calls"
case $1 in
  update) cp -r -- "$(dirname -- "$configuration")/sources" "$WORK/asked" ;;
  source) cp -- "$WORK/package/"* . ;;
esac
END
}

# package_with <folder in the source package>...
package_with() {
  local folder
  for folder in "$@"; do
    mkdir -p -- "$work/boost/$folder"
    : >"$work/boost/$folder/a.cpp"
  done
  tar -C "$work" -cJf "$work/package/boost1.81_1.81.0.orig.tar.xz" boost
}

fetched() {
  (cd -- "$project/build/boost" && printf '%s\n' */*/* | sort | tr '\n' ' ')
}

WhatIsNeededIsTakenOut() {
  system_with_sources
  package_with libs/filesystem/src libs/thread/src libs/regex/src
  expect_success "$project/scripts/fetch-boost" "$project/build/boost"
  [ "$(fetched)" = "libs/filesystem/src libs/thread/src " ] || fail "fetched: $(fetched)"
  [ "$(ls "$project/build")" = boost ] || fail "left: $(ls "$project/build")"
  expect_success "$project/scripts/fetch-boost" "$project/build/boost"
  [ "$(wc -l <"$work/calls")" -eq 2 ] || fail "fetched again: $(cat "$work/calls")"
}

TheSystemsPlacesAreAskedForSources() {
  system_with_sources
  package_with libs/filesystem/src libs/thread/src
  expect_success "$project/scripts/fetch-boost" "$project/build/boost"
  expect_success cat "$work/asked/sources.list" "$work/asked/two.sources"
  expect_said 'deb-src [arch=amd64] http://one.example/debian stable main'
  expect_said $'Types: deb-src\nURIs: http://two.example/debian'
}

AFetchThatFailsSaysWhyInOneLine() {
  system_with_sources
  stub apt-get <<<'echo "N: never mind"; echo "E: no such source"; echo "E: more"; exit 100'
  expect_failure 1 "could not fetch the sources of boost1.81: E: no such source" \
    "$project/scripts/fetch-boost" "$project/build/boost"
  [ "$(wc -l <<<"$output")" -eq 2 ] || fail "more than the step and the reason"
  [ -z "$(ls "$project/build")" ] || fail "left: $(ls "$project/build")"
}

APackageThatLacksAPartFails() {
  system_with_sources
  package_with libs/filesystem/src
  expect_failure 1 "does not hold" "$project/scripts/fetch-boost" "$project/build/boost"
  [ -z "$(ls "$project/build")" ] || fail "left: $(ls "$project/build")"
}

run_case "$@"
