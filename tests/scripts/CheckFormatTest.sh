# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

project_with() {
  cp -- "$root/.clang-format" "$project/"
  add_file "src/1Base/A b.cpp"
  commit_all
}

AFileInShapePasses() {
  project_with <<<'int f(int a);'
  expect_success "$root/scripts/check-format" "$project"
}

AFileOutOfShapeFails() {
  project_with <<<'int f( int a );'
  expect_failure 123 "A b.cpp:1" "$root/scripts/check-format" "$project"
}

AFileThatIsNotYetAddedIsChecked() {
  commit_all
  cp -- "$root/.clang-format" "$project/"
  add_file src/New.h <<<'int   a;'
  expect_failure 123 "New.h:1" "$root/scripts/check-format" "$project"
}

ObjectiveCIsReadToo() {
  commit_all
  cp -- "$root/.clang-format" "$project/"
  add_file src/New.h <<<'@class NSString;'
  add_file src/New.mm <<<'NSString   *text;'
  expect_failure 123 "New.mm:1" "$root/scripts/check-format" "$project"
  add_file src/New.mm <<<'NSString* text;'
  expect_success "$root/scripts/check-format" "$project"
}

AnIgnoredFileIsNot() {
  add_file .gitignore <<<'/build/'
  project_with <<<'int a;'
  add_file build/generated.cpp <<<'int   a;'
  expect_success "$root/scripts/check-format" "$project"
}

AFolderWithoutARepositoryFails() {
  expect_failure 128 "not a git repository" "$root/scripts/check-format" "$project"
}

run_case "$@"
