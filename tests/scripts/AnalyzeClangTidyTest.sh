# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

analyze=$root/scripts/analyze-clang-tidy

# A project of these sources, with the checks of this one.
project_of() {
  local file entries=()
  for file; do
    entries+=("{\"directory\": \"$project\", \"file\": \"$file\", \"arguments\":
      [\"g++\", \"-Isrc\", \"-c\", \"$file\"]}")
  done
  cp -- "$root/.clang-tidy" "$project/"
  (IFS=, && printf '[%s]\n' "${entries[*]}") | add_file build/release/compile_commands.json
  commit_all
}

# finds <check>: clang-tidy names the check at the source that is given.
finds() {
  add_file "src/1Base/A b.cpp"
  add_file src/1Base/Good.cpp <<<'int good();'
  project_of "src/1Base/A b.cpp" src/1Base/Good.cpp
  expect_failure 123 "[$1" "$analyze" "$project"
  expect_said "src/1Base/A b.cpp:"
  expect_not_said "Good.cpp"
}

SourcesWithoutFindingPass() {
  add_file src/1Base/Good.cpp <<'END'
#include <type_traits>
static_assert(std::is_same_v<int, int>);
END
  project_of src/1Base/Good.cpp
  expect_success "$analyze" "$project"
  expect_not_said "warning"
}

ALikelyMistakeFails() {
  finds bugprone-use-after-move <<'END'
#include <string>
#include <utility>
std::size_t take(std::string text, std::string& target) {
    target = std::move(text);
    return text.size();
}
END
}

AWasteFails() {
  finds performance-for-range-copy <<'END'
#include <string>
#include <vector>
std::size_t total(std::vector<std::string> const& texts) {
    std::size_t sum = 0;
    for (auto const text : texts)
        sum += text.size();
    return sum;
}
END
}

AnUnclearLineFails() {
  finds readability-container-size-empty <<'END'
#include <string>
bool isEmpty(std::string const& text) {
    return text.size() == 0;
}
END
}

AWayToANullPointerFails() {
  finds clang-analyzer-core.NullDereference <<'END'
int value(int const* number) {
    if (number == nullptr)
        return *number;
    return 0;
}
END
}

AFindingInAHeaderFails() {
  add_file src/1Base/A.h <<'END'
#include <string>
inline bool isEmpty(std::string const& text) {
    return text.size() == 0;
}
END
  add_file src/1Base/A.cpp <<<'#include "1Base/A.h"'
  project_of src/1Base/A.cpp
  expect_failure 123 "src/1Base/A.h:3" "$analyze" "$project"
}

ASourceThatDoesNotCompileFails() {
  finds clang-diagnostic-error <<<'int value() { return missing; }'
}

ANamedExceptionPasses() {
  add_file src/1Base/A.cpp <<'END'
#include <string>
bool isEmpty(std::string const& text) {
    // NOLINTNEXTLINE(readability-container-size-empty): to show how
    return text.size() == 0;
}
END
  project_of src/1Base/A.cpp
  expect_success "$analyze" "$project"
}

WithoutSourcesItFails() {
  project_of
  expect_failure 1 "there are no sources" "$analyze" "$project"
  expect_one_line
}

WithoutCompileCommandsItFails() {
  add_file src/A.cpp <<<'int a();'
  commit_all
  expect_failure 1 "the preset release is not configured" "$analyze" "$project"
  expect_one_line
}

run_case "$@"
