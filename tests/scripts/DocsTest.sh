# shellcheck shell=bash
# shellcheck disable=SC2016 # the programs that stand in expand their variables themselves
# shellcheck source=tests/scripts/system.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/system.sh"

# A project with one picture's source, on a system where dot and Doxygen only say that they ran.
project_with_picture() {
  debian
  echo graphviz >>"$work/installed"
  PATH=$PATH:/usr/bin:/bin
  add_file CMakeLists.txt <<<'project(qorn VERSION 1.2.3 LANGUAGES CXX)'
  add_file docs/Doxyfile <<<'QUIET = YES'
  add_file docs/pictures/a.dot <<<'digraph { a -> b }'
  commit_all
  stub dot <<<'echo "dot $*" >>"$WORK/calls"; echo "<svg/>"'
  stub doxygen <<<'cat >"$WORK/doxyfile"; echo doxygen >>"$WORK/calls"'
}

WhatIsMissingIsInstalled() {
  project_with_picture
  remove_package graphviz
  expect_success "$project/scripts/docs"
  expect_said "installing graphviz"
}

ThePagesAreWrittenWithTheVersion() {
  project_with_picture
  expect_success "$project/scripts/docs"
  expect_last_line "docs: written: $project/build/docs/html/index.html"
  grep -qxF 'PROJECT_NUMBER = "1.2.3"' "$work/doxyfile" || fail "no version"
  grep -qxF "OUTPUT_DIRECTORY = \"$project/build/docs\"" "$work/doxyfile" || fail "no folder"
}

APictureIsDrawnWhereItsSourceChanged() {
  project_with_picture
  expect_success "$project/scripts/docs"
  expect_success "$project/scripts/docs"
  expect_calls $'dot -Tsvg docs/pictures/a.dot\ndoxygen\ndoxygen'
  add_file docs/pictures/a.dot <<<'digraph { b -> a }'
  expect_success "$project/scripts/docs"
  expect_said "drawing docs/pictures/a.dot"
}

APictureThatCannotBeDrawnFails() {
  project_with_picture
  stub dot <<<'echo "syntax error" >&2; exit 1'
  expect_failure 1 "dot failed, see above" "$project/scripts/docs"
  [ "$(ls "$project/docs/pictures")" = a.dot ] || fail "something was left behind"
}

WhatDoxygenSaysFails() {
  project_with_picture
  stub doxygen <<<'cat >/dev/null; echo "$PWD/src/A.h:1: error: f() is not documented"; exit 1'
  expect_failure 1 "Doxygen has something to say" "$project/scripts/docs"
  expect_said "src/A.h:1: error: f()"
  expect_not_said "$project/src"
}

run_case "$@"
