# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

analyze=$root/scripts/analyze-cppcheck

# finds <check>: cppcheck names the check at the source that is given.
finds() {
  add_file "src/1Base/A b.cpp"
  add_file src/1Base/Good.cpp <<<'int good();'
  commit_all
  expect_failure 1 "[$1]" "$analyze" "$project"
  expect_said "src/1Base/A b.cpp:"
  expect_not_said "Good.cpp"
}

SourcesWithoutFindingPass() {
  add_file src/1Base/Good.cpp <<<'int good() { return 1; }'
  commit_all
  expect_success "$analyze" "$project"
}

AnErrorFails() {
  finds arrayIndexOutOfBounds <<'END'
int last() {
    int const numbers[2] = {1, 2};
    return numbers[2];
}
END
}

AWarningFails() {
  finds uninitMemberVar <<'END'
class C {
  public:
    C() {}
    int get() const { return value_; }

  private:
    int value_;
};
END
}

AWasteFails() {
  finds passedByValue <<'END'
#include <string>
std::size_t size(std::string const text) { return text.size(); }
END
}

ALeakOfADescriptorFails() {
  finds resourceLeak <<'END'
#include <fcntl.h>
bool exists(char const* path) {
    int const file = open(path, O_RDONLY);
    return file != -1;
}
END
}

ANamedExceptionPasses() {
  add_file src/1Base/A.cpp <<'END'
#include <string>
// cppcheck-suppress passedByValue ; to show how
std::size_t size(std::string const text) { return text.size(); }
END
  commit_all
  expect_success "$analyze" "$project"
}

WithoutSourcesItFails() {
  commit_all
  try "$analyze" "$project"
  expect_status 1
}

run_case "$@"
