# Sourced by the tests of the commands: a system that is made up. What is installed stands in a file,
# and apt-get adds to it.
# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# Copies the two commands and their scripts into the project and leaves a PATH that holds nothing
# but common tools and what `stub` adds.
isolate_commands() {
  local tool
  cp -r -- "$root/run" "$root/test" "$root/scripts" "$project/"
  mkdir -- "$work/bin"
  for tool in awk basename bash cat chmod cut dirname echo env false getent grep id ls mkdir mktemp \
    mv nproc readlink rm sed sort tail tee touch true wc; do
    ln -s -- "$(type -P "$tool")" "$work/bin/$tool"
  done
  PATH=$work/bin
}

# stub <name>: a program of this name in the PATH, its text from the standard input.
stub() {
  rm -f -- "$work/bin/$1"
  {
    echo '#!/usr/bin/env bash'
    cat
  } >"$work/bin/$1"
  chmod +x -- "$work/bin/$1"
}

# A Debian system, used by root, with all that ./run needs. The configuration fails, so that the
# commands end there.
debian() {
  isolate_commands
  export WORK=$work
  printf '%s\n' g++ cmake ninja-build ccache libboost1.81-dev \
    libboost-filesystem1.81-dev libboost-thread1.81-dev libicu-dev libplist-dev \
    openjdk-17-jdk-headless libgtest-dev libssl-dev clang-format git python3 shellcheck tzdata \
    dbus-daemon doxygen libsystemd-dev libxtst6 xvfb \
    >"$work/installed"
  : >"$work/calls"
  user 0
  stub dpkg-query <<<'sed "s/$/ installed/" "$WORK/installed"'
  stub apt-get <<'END'
echo "apt-get $*" >>"$WORK/calls"
case " $* " in
  *" install "*) printf '%s\n' "$@" >>"$WORK/installed" ;;
esac
END
  stub javac </dev/null
  stub cmake <<<'echo "no compiler" >&2; exit 1'
}

# user <number>
user() {
  stub id <<<"echo $1"
}

remove_package() {
  sed -i "/^$1\$/d" "$work/installed"
}

expect_calls() {
  local calls
  calls=$(sed 's/ .* \(install\|update\)/ \1/' "$work/calls")
  [ "$calls" = "$1" ] || fail "called: $calls"
}
