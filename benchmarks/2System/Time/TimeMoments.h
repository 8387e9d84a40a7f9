/// Moments at random and what the contenders make of them: the common ground of the benchmarks of
/// dates. A contender that gives another result than ours ends the program.
#ifndef QORN_BENCHMARKS_TIMEMOMENTS_H
#define QORN_BENCHMARKS_TIMEMOMENTS_H

#include "support/Benchmark.h"
#include "support/Inputs.h"

#include <cstdint>
#include <cstdlib>
#include <ctime>
#include <iostream>
#include <random>
#include <string>
#include <vector>

namespace Benchmarks {

/// Seconds since 1970, to the year 2069.
inline CInputs<std::time_t> randomMoments() {
    std::mt19937_64 random(2379);
    std::uniform_int_distribution<std::time_t> second(0, 3155759999);
    std::vector<std::time_t> moments;
    while (moments.size() < 1024)
        moments.push_back(second(random));
    return CInputs<std::time_t>(std::move(moments));
}

inline std::tm fieldsOf(std::time_t moment) {
    std::tm fields = {};
    gmtime_r(&moment, &fields);
    return fields;
}

/// By strftime, with which every contender's text is compared.
inline std::string textOf(std::time_t moment, char const* format) {
    std::tm const fields = fieldsOf(moment);
    char text[64];
    return std::string(text, std::strftime(text, sizeof text, format, &fields));
}

inline std::string narrowOf(std::string const& text) {
    return text;
}

/// Of ASCII text.
inline std::string narrowOf(std::wstring const& text) {
    std::string narrow;
    for (wchar_t const character : text)
        narrow.push_back(static_cast<char>(character));
    return narrow;
}

[[noreturn]] inline void reject(std::string const& row, char const* contender) {
    std::cerr << row << ": " << contender << " gives another result\n";
    std::exit(EXIT_FAILURE);
}

/// `run` of each input, once checked to give what is expected, as `seenAs` shows it.
template <class TInput, class TExpected, class TRun, class TSeenAs>
void addChecked(std::string const& row, char const* contender, CInputs<TInput> const& inputs,
                CInputs<TExpected> const& expected, TRun run, TSeenAs seenAs) {
    if (!(inputs.map([&](TInput const& input) { return seenAs(run(input)); }) == expected))
        reject(row, contender);
    add(row, contender, [inputs, run] { return run(inputs.next()); });
}

} // namespace Benchmarks

#endif
