# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# A project with one benchmark program, which was built before. The folder for files is told by the
# time of the operation Folder: 1 ns for the test's own one.
project_with_benchmarks() {
  mkdir -p -- "$project/benchmarks/support" "$project/build/benchmark/benchmarks"
  cp -- "$root/benchmarks/report" "$project/benchmarks/"
  cp -- "$root/benchmarks/support/picture.py" "$project/benchmarks/support/"
  add_file build/benchmark/benchmarks/SampleBenchmark <<END
#!/usr/bin/env python3
import json, os, sys
TIMES = [("Copy/16/ours", 30), ("Copy/16/ours", 20), ("Copy/16/qt", 40), ("Copy/16/icu:kept", 12),
         ("Copy/16/icu:new", 10), ("Copy/2/ours", 5), ("Alone/ours", 7), ("Behind/2/ours", 9),
         ("Behind/2/qt", 3), ("Folder/ours", 1 if os.environ["TMPDIR"] == "$work" else 2)]
if "--benchmark_list_tests=true" in sys.argv:
    print("\n".join(dict.fromkeys(name for name, _ in TIMES)))
else:
    print(json.dumps({"benchmarks": [
        {"name": name, "run_name": name, "cpu_time": time, "real_time": 99, "time_unit": "ns"}
        for name, time in TIMES]}))
END
  chmod +x -- "$project/build/benchmark/benchmarks/SampleBenchmark"
}

report() {
  TMPDIR=$work "$project/benchmarks/report" --no-build "$@"
}

TheLeastTimesStandBesideEachOther() {
  project_with_benchmarks
  expect_success report
  expect_said "| Copy/2    | 5.00 ns | -                 | -           | -     |
| Copy/16   | 20.0 ns | icu (new) 10.0 ns | qt 40.0 ns  | 2.00  |"
}

TheTableAndTheTimesStay() {
  project_with_benchmarks
  expect_success report
  local table
  table=$(<"$project/build/benchmark/report.md")
  [[ $output == *"$table"* ]] || fail "another table was kept: $table"
  grep -q '"Copy/16"' "$project/build/benchmark/report.json" || fail "no times were kept"
}

EachOperationWithAPeerIsDrawn() {
  type -P gnuplot >/dev/null || skip "gnuplot is not installed"
  project_with_benchmarks
  expect_success report
  local picture=$project/build/benchmark/report.svg
  grep -q 'Copy/16' "$picture" || fail "Copy/16 is not drawn"
  grep -q 'Behind/2' "$picture" || fail "Behind/2 is not drawn"
  ! grep -q 'Alone' "$picture" || fail "Alone has no peer, but is drawn"
}

FilesAreMadeWhereTheCallerSays() {
  project_with_benchmarks
  expect_success report
  expect_said "| Folder    | 1.00 ns |"
}

NothingThatMatchesFails() {
  project_with_benchmarks
  expect_failure 1 "No benchmark matches Nothing" report Nothing
}

run_case "$@"
