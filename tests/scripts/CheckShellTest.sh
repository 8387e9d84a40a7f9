# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

rejects() {
  add_file "a b"
  commit_all
  expect_failure 123 SC2086 "$root/scripts/check-shell" "$project"
}

ASoundScriptPasses() {
  add_file a <<<$'#!/bin/sh\necho "$1"'
  commit_all
  expect_success "$root/scripts/check-shell" "$project"
}

ABashScriptIsChecked() { rejects <<<$'#!/usr/bin/env bash\necho $1'; }
AShellScriptIsChecked() { rejects <<<$'#!/bin/sh\necho $1'; }
ASourcedScriptIsChecked() { rejects <<<$'# shellcheck shell=bash\necho $1'; }

AnotherLanguageIsNotChecked() {
  add_file a <<<$'#!/usr/bin/awk -f\n{ print $1 }'
  commit_all
  expect_success "$root/scripts/check-shell" "$project"
}

run_case "$@"
