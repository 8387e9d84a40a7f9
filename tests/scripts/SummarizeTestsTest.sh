# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# Runs the tests of the CTest file in the standard input and summarises them.
summarize() {
  add_file CTestTestfile.cmake
  ctest --test-dir "$project" --output-junit "$work/results.xml" >/dev/null 2>&1 || true
  try "$root/scripts/summarize-tests" "$work/results.xml"
}

PassedTestsAreCounted() {
  summarize <<'END'
add_test(one true)
add_test([[two "2" <&>]] echo "passed <&>")
END
  expect_status 0
  expect_last_line "2 passed, 0 failed, 0 skipped"
}

AFailedTestIsNamed() {
  summarize <<'END'
add_test(good true)
add_test([[bad "2" <&>]] false)
add_test(crash bash -c "kill -SEGV $$")
add_test(absent no-such-program)
END
  expect_status 1
  expect_said 'failed: bad "2" <&>'
  expect_said 'failed: crash'
  expect_said 'failed: absent: Unable to find executable'
  expect_last_line "1 passed, 3 failed, 0 skipped"
}

ATestWhoseFixtureFailedIsNoSkippedOne() {
  summarize <<'END'
add_test(setup false)
add_test(user true)
set_tests_properties(setup PROPERTIES FIXTURES_SETUP f)
set_tests_properties(user PROPERTIES FIXTURES_REQUIRED f)
END
  expect_status 1
  expect_last_line "0 passed, 2 failed, 0 skipped"
}

ASkippedTestHasItsReason() {
  summarize <<'END'
add_test(unit printf "[ RUN      ] A.B\n/x/ATest.cpp:12: Skipped\nno <second>\nvolume\n\n[  SKIPPED ] A.B (0 ms)\n[----------]\n[  SKIPPED ] 1 test, listed below:\n[  SKIPPED ] A.B\n")
add_test(mute printf "/x/ATest.cpp:12: Skipped\n\n[  SKIPPED ] A.B (0 ms)\n[  SKIPPED ] A.B\n")
add_test(script echo "[  SKIPPED ] no such tool")
add_test(code bash -c "exit 77")
add_test(off true)
set_tests_properties(unit mute script PROPERTIES SKIP_REGULAR_EXPRESSION "\\[  SKIPPED \\]")
set_tests_properties(code PROPERTIES SKIP_RETURN_CODE 77)
set_tests_properties(off PROPERTIES DISABLED TRUE)
END
  expect_status 0
  expect_said "skipped: unit: no <second> volume"
  expect_said "skipped: mute: no reason given"
  expect_said "skipped: script: no such tool"
  expect_said "skipped: code: no reason given"
  expect_said "skipped: off: disabled"
  expect_last_line "0 passed, 0 failed, 5 skipped"
}

ThatAPassedTestSaysSkippedMakesItNoSkippedOne() {
  summarize <<'END'
add_test(talk echo "a.cpp:1: Skipped")
END
  expect_status 0
  expect_last_line "1 passed, 0 failed, 0 skipped"
}

NoTestAtAllIsAFailure() {
  summarize </dev/null
  expect_status 1
  expect_last_line "0 passed, 0 failed, 0 skipped"
}

run_case "$@"
