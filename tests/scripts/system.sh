# Sourced by the tests of the commands: a system that is made up. What is installed stands in a file,
# and apt-get or brew adds to it.
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
  for tool in awk basename bash cat chmod cut dirname echo env false getconf grep id ls mkdir mktemp \
    mv readlink rm sed sort tail tee touch true uname wc; do
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
  bash -c 'root=$1 && source "$root/scripts/packages" && printf "%s\n" "${packages_test[@]}"' - \
    "$root" >"$work/installed"
  isolate_commands
  export WORK=$work
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

# A Mac, used by user 501, with all that ./run needs, where no tool is found that macOS lacks. The
# configuration fails.
macos() {
  isolate_commands
  export WORK=$work
  printf '%s\n' cmake ninja boost openjdk@17 ca-certificates >"$work/installed"
  : >"$work/calls"
  user 501
  stub uname <<<'echo Darwin'
  stub xcode-select <<<'echo /Library/Developer/CommandLineTools'
  stub brew <<'END'
case $1 in
  list) cat "$WORK/installed" ;;
  *)
    echo "brew $*${HOMEBREW_NO_AUTO_UPDATE:+, no update}" >>"$WORK/calls"
    shift 2
    printf '%s\n' "$@" >>"$WORK/installed"
    ;;
esac
END
  stub javac <<<'echo "Unable to locate a Java Runtime." >&2; exit 1'
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
