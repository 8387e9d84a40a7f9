/// How a benchmark is written here: one call of `add` for each operation and each contender, under
/// names that `benchmarks/report` puts into one row.
///
///     void addBenchmarks() {
///         std::string const text(48, 'a');
///         Benchmarks::add("UTF8ToWide/ascii/48", "ours",
///                         [text] { return Encoding::convert<Strings::string>(text); });
///         Benchmarks::add("UTF8ToWide/ascii/48", "icu", [text] { return icuWideOf(text); });
///     }
///     Benchmarks::CRegistrar const registrar(addBenchmarks);   // in the anonymous namespace
#ifndef QORN_BENCHMARKS_BENCHMARK_H
#define QORN_BENCHMARKS_BENCHMARK_H

#include <benchmark/benchmark.h>

#include <chrono>
#include <string>
#include <utility>

namespace Benchmarks {

/// Measures `run()`, whose result counts as used, again and again. `operation` is the row
/// ("Name/case/size"), `contender` the column: "ours", or a peer in lower case. One peer may try
/// several ways ("icu:preflighted", "icu:bounded"); the report shows the best of them.
template <class TRun>
void add(std::string const& operation, std::string const& contender, TRun run) {
    benchmark::RegisterBenchmark((operation + "/" + contender).c_str(),
                                 [run = std::move(run)](benchmark::State& state) {
                                     for (auto _ : state)
                                         benchmark::DoNotOptimize(run());
                                 });
}

/// Measures one `run()` at a time by the clock on the wall, between `prepare()` and `finish()`,
/// which don't count: for work that is done by other processes, or that needs a fresh target each
/// time.
template <class TPrepare, class TRun, class TFinish>
void addByWall(std::string const& operation, std::string const& contender, TPrepare prepare,
               TRun run, TFinish finish) {
    auto const measure = [=](benchmark::State& state) {
        for (auto _ : state) {
            prepare();
            auto const start = std::chrono::steady_clock::now();
            benchmark::DoNotOptimize(run());
            std::chrono::duration<double> const taken = std::chrono::steady_clock::now() - start;
            finish();
            state.SetIterationTime(taken.count());
        }
    };
    benchmark::RegisterBenchmark((operation + "/" + contender).c_str(), measure)
        ->UseManualTime()
        ->Iterations(1)
        ->Unit(benchmark::kMillisecond);
}

/// Calls a function of the program's own before `main`, where benchmarks have to be added.
class CRegistrar {
  public:
    explicit CRegistrar(void (*addBenchmarks)()) { addBenchmarks(); }
};

} // namespace Benchmarks

#endif
