# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

python3 -c 'import yaml' 2>/dev/null || skip "python3-yaml is missing"

check() {
  PYTHONDONTWRITEBYTECODE=1 python3 "$root/tests/scripts/workflows.py" "$1"
}

# rejects <command of sed> <what is said of it>: a copy of the workflow for macOS with a mistake.
rejects() {
  mkdir -p -- "$project/.github/workflows" "$project/scripts"
  cp -- "$root/run" "$root/test" "$project/"
  cp -- "$root/scripts/check-exports" "$project/scripts/"
  sed "$1" "$root/.github/workflows/macos.yml" >"$project/.github/workflows/macos.yml"
  expect_failure 1 "$2" check "$project"
}

TheWorkflowsOfTheProjectPass() { expect_success check "$root"; }

AFileThatIsNoYamlFails() { rejects 's/^jobs:/jobs: [/' 'yaml'; }
AnActionThatIsNotPinnedFails() { rejects 's/@v6/@main/' 'not pinned to a major version'; }
ACommandThatIsGoneFails() { rejects 's,\./test,./tests,' 'no command of the project: ./tests'; }
AJobWithoutAnEndFails() { rejects '/timeout-minutes/d' 'macos may run for ever'; }
AJobWithoutAPlaceFails() { rejects '/runs-on/d' 'macos runs nowhere'; }
AWorkflowThatNothingStartsFails() { rejects 's/^on:/off:/' 'nothing starts it'; }

run_case "$@"
