# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

rejects_header() {
  add_file "src/1Base/A b.h"
  add_file src/1Base/Good.h <<<'#include <string>'
  commit_all
  expect_failure 123 "src/1Base/A b.h: does not compile alone" \
    "$root/scripts/check-headers" "$project"
  expect_not_said "Good.h: does not"
}

AHeaderThatBringsWhatItUsesPasses() {
  add_file "src/1Base/A b.h" <<'END'
#ifndef A_H
#define A_H
#include "1Base/B.h"
#include <string>
struct A : B {
    std::string text;
};
#endif
END
  add_file src/1Base/B.h <<'END'
#ifndef B_H
#define B_H
struct B {};
#endif
END
  commit_all
  expect_success "$root/scripts/check-headers" "$project"
}

AHeaderThatNeedsAnotherFails() {
  rejects_header <<<'inline std::string text() { return {}; }'
}

AHeaderWithoutGuardFails() {
  rejects_header <<<'struct A {};'
}

AWarningFails() {
  rejects_header <<'END'
#ifndef A_H
#define A_H
inline int narrow(long value) {
    return value;
}
#endif
END
}

run_case "$@"
