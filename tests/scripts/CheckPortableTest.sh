# shellcheck shell=bash
# shellcheck disable=SC2016 # the lines are those of scripts
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# rejects <line> <what is said of it>
rejects() {
  add_file run <<<"$1"
  commit_all
  expect_failure 123 "run:1: $2" "$root/scripts/check-portable" "$project"
  expect_one_line
}

# accepts <line>...
accepts() {
  printf '%s\n' "$@" | add_file run
  commit_all
  expect_success "$root/scripts/check-portable" "$project"
}

WhatBashHasAlwaysHadPasses() {
  accepts 'while IFS= read -r -d "" line; do lines+=("$line"); done < <(list)' \
    'local name=$1 list=()' 'export -f name' 'x=${x%/*}${x:-b}${x/a/b}${#x}${x:0:3}' \
    '[[ $x == *.[a-z] ]] && printf "%s\0" "$@" >&2 2>&1 | cat' 'case a in a) ;; esac'
}

ItsOwnToolsPass() {
  accepts 'readlink -f -- "$x"' 'mktemp -d' 'sed -n s/a/b/p' 'grep -qxF -- a' 'sort -u' \
    'rm -rf -- x' 'getconf _NPROCESSORS_ONLN' '"$x/timeout"'
}

ACommentMaySayAnything() { accepts '# mapfile, sed -i'; }

NewerBuiltinsFail() {
  rejects 'mapfile -t a < <(b)' 'is newer than bash 3.2'
  rejects 'x; readarray a' 'is newer'
  rejects 'coproc a' 'is newer'
  rejects 'wait -n' 'is newer'
}

NewerOptionsFail() {
  rejects 'shopt -s globstar' 'is newer'
  rejects 'shopt -s inherit_errexit' 'is newer'
}

NewerVariablesFail() { rejects 'echo "$EPOCHSECONDS"' 'is newer'; }

NewerKindsOfVariablesFail() {
  rejects 'declare -A a' 'is newer'
  rejects 'local -n a=$1' 'is newer'
  rejects 'declare -rg a=1' 'is newer'
}

NewerExpansionsFail() {
  rejects 'echo "${a,,}"' 'a change of case'
  rejects 'echo "${a^}"' 'a change of case'
  rejects 'echo "${a[@]^^}"' 'a change of case'
  rejects 'echo "${a@Q}"' 'a transformation'
  rejects 'echo "${a:0:-1}"' 'a negative length'
  rejects 'echo "${a[-1]}"' 'a negative index'
  rejects '[[ -v a ]]' 'the test for a variable'
}

NewerRedirectionsFail() {
  rejects 'a &>>b' 'is newer'
  rejects 'a |& b' 'is newer'
  rejects 'exec {stream}>a' 'a number for a new stream'
  rejects 'printf "%(%F)T"' 'the format of times'
}

AnArrayThatBeginsEmptyFails() {
  rejects 'a=(); b "${a[@]}"' 'to bash 3.2 an empty a is unset here'
  rejects 'local x=1 a=(); b "${a[*]}"' 'to bash 3.2 an empty a is unset here'
}

AnArrayThatBeginsEmptyInAnotherFileFails() {
  add_file scripts/packages <<<'none=()'
  add_file run <<<'echo "${none[@]}"'
  commit_all
  expect_failure 123 "run:1: to bash 3.2 an empty none" "$root/scripts/check-portable" "$project"
}

AnArrayThatIsAskedForPasses() {
  accepts 'a=()' '[ "${#a[@]}" -eq 0 ] || b "${a[@]}"' 'b ${a[@]+"${a[@]}"}' 'c=(1)' 'b "${c[@]}"'
}

OneGuardedExpansionHidesNoOther() {
  rejects 'a=(); b ${a[@]+"${a[@]}"} "${a[@]}"' 'to bash 3.2 an empty a'
}

AnAssignmentThatIsExpandedTwiceFails() {
  rejects 'local a=("$1")' 'bash 3.2 expands what is assigned here twice'
}

MissingToolsFail() {
  rejects 'echo "$(nproc)"' 'macOS has no such tool'
  rejects 'getent passwd 0' 'macOS has no such tool'
  rejects 'a | tac' 'macOS has no such tool'
}

OptionsOfOtherToolsFail() {
  rejects 'sed -i s/a/b/ c' 'sed has no such option there'
  rejects 'sed -n -r s/a/b/ c' 'sed has no such option there'
  rejects 'grep -qP a' 'grep has no such option there'
  rejects 'sort -z' 'sort has no such option there'
  rejects 'x | xargs -0 --no-run-if-empty a' 'xargs has no such option there'
  rejects 'readlink -e a' 'readlink has no such option there'
  rejects 'stat -c %s a' 'stat has no such option there'
  rejects 'date --date=now' 'date has no such option there'
  rejects 'mktemp --tmpdir' 'mktemp has no such option there'
}

AScriptOfLinuxAloneIsNotChecked() {
  add_file .ci/run <<<'mapfile -t a'
  add_file scripts/check-words <<<'mapfile -t a'
  commit_all
  expect_success "$root/scripts/check-portable" "$project"
}

run_case "$@"
