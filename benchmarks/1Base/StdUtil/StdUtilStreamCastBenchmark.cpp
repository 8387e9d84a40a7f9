// Numbers to wide text and back beside other libraries, in the classic locale. Every contender
// makes a text that it owns, or reads one of the kind that it takes by nature, and must give the
// same.

#include "1Base/StdUtil/StdUtil.h"

#include "support/Benchmark.h"
#include "support/Inputs.h"

#include <boost/lexical_cast.hpp>

#ifdef QORN_HAVE_FMT
#    include <fmt/compile.h>
#    include <fmt/xchar.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QString>
#endif

#include <charconv>
#include <cstdlib>
#include <cwchar>
#include <iostream>
#include <iterator>
#include <random>
#include <sstream>
#include <string>
#include <vector>

namespace {

using Benchmarks::CInputs;

template <class TNumber>
CInputs<TNumber> randomNumbers(int digits) {
    TNumber least = 1;
    for (int digit = 1; digit < digits; ++digit)
        least = static_cast<TNumber>(least * 10);
    std::mt19937_64 random(static_cast<unsigned int>(digits));
    std::uniform_int_distribution<TNumber> magnitude(least, static_cast<TNumber>(least * 10 - 1));
    std::vector<TNumber> numbers;
    while (numbers.size() < 1024) {
        TNumber const number = magnitude(random);
        numbers.push_back(random() % 4 == 0 ? -number : number);
    }
    return CInputs<TNumber>(std::move(numbers));
}

std::wstring wideOf(std::wstring const& text) {
    return text;
}

#ifdef QORN_HAVE_QT
std::wstring wideOf(QString const& text) {
    return text.toStdWString();
}
#endif

[[noreturn]] void reject(std::string const& row, char const* contender) {
    std::cerr << row << ": " << contender << " gives another result\n";
    std::exit(EXIT_FAILURE);
}

template <class TNumber, class TWrite>
void addWriter(std::string const& row, char const* contender, CInputs<TNumber> const& numbers,
               TWrite write) {
    auto const writeWide = [&write](TNumber number) { return wideOf(write(number)); };
    auto const writeStream = [](TNumber number) {
        std::wostringstream out;
        out << number;
        return out.str();
    };
    if (!(numbers.map(writeWide) == numbers.map(writeStream)))
        reject(row, contender);
    Benchmarks::add(row, contender, [numbers, write] { return write(numbers.next()); });
}

template <class TNumber, class TText, class TRead>
void addReader(std::string const& row, char const* contender, CInputs<TNumber> const& numbers,
               CInputs<TText> const& texts, TRead read) {
    if (!(texts.map(read) == numbers))
        reject(row, contender);
    Benchmarks::add(row, contender, [texts, read] { return read(texts.next()); });
}

template <class TNumber>
void addWriters(std::string const& caseName, CInputs<TNumber> const& numbers) {
    std::string const row = "NumberToWide" + caseName;
    addWriter(row, "ours", numbers,
              [](TNumber number) { return StdUtil::stream_cast<std::wstring>(number); });
    addWriter(row, "std:to_chars", numbers, [](TNumber number) {
        char digits[24];
        char const* const end = std::to_chars(std::begin(digits), std::end(digits), number).ptr;
        return std::wstring(static_cast<char const*>(digits), end);
    });
    addWriter(row, "std:to_wstring", numbers,
              [](TNumber number) { return std::to_wstring(number); });
    addWriter(row, "stream", numbers, [](TNumber number) {
        std::wostringstream out;
        out << number;
        return out.str();
    });
    addWriter(row, "boost", numbers,
              [](TNumber number) { return boost::lexical_cast<std::wstring>(number); });
#ifdef QORN_HAVE_FMT
    addWriter(row, "fmt:format", numbers,
              [](TNumber number) { return fmt::format(L"{}", number); });
    addWriter(row, "fmt:format_to", numbers, [](TNumber number) {
        fmt::wmemory_buffer buffer;
        fmt::format_to(std::back_inserter(buffer), L"{}", number);
        return std::wstring(buffer.data(), buffer.size());
    });
    addWriter(row, "fmt:compiled", numbers,
              [](TNumber number) { return fmt::format(FMT_COMPILE(L"{}"), number); });
#endif
#ifdef QORN_HAVE_QT
    addWriter(row, "qt", numbers, [](TNumber number) { return QString::number(number); });
#endif
}

template <class TNumber>
void addReaders(std::string const& caseName, CInputs<TNumber> const& numbers) {
    std::string const row = "WideToNumber" + caseName;
    auto const texts = numbers.map([](TNumber number) { return std::to_wstring(number); });
    addReader(row, "ours", numbers, texts,
              [](std::wstring const& text) { return StdUtil::stream_cast<TNumber>(text); });
    addReader(row, "std:from_chars", numbers, texts, [](std::wstring const& text) {
        std::string narrow;
        for (wchar_t const digit : text)
            narrow.push_back(static_cast<char>(digit));
        TNumber number = 0;
        std::from_chars(narrow.data(), narrow.data() + narrow.size(), number);
        return number;
    });
    addReader(row, "std:wcstol", numbers, texts, [](std::wstring const& text) {
        return static_cast<TNumber>(std::wcstol(text.c_str(), nullptr, 10));
    });
    addReader(row, "stream", numbers, texts, [](std::wstring const& text) {
        std::wistringstream in(text);
        TNumber number = 0;
        in >> number;
        return number;
    });
    addReader(row, "boost", numbers, texts,
              [](std::wstring const& text) { return boost::lexical_cast<TNumber>(text); });
#ifdef QORN_HAVE_QT
    addReader(row, "qt", numbers, texts.map(QString::fromStdWString),
              [](QString const& text) { return static_cast<TNumber>(text.toLongLong()); });
#endif
}

template <class TNumber>
void addCase(std::string const& type, int digits) {
    std::string const caseName = "/" + type + "/" + std::to_string(digits);
    CInputs<TNumber> const numbers = randomNumbers<TNumber>(digits);
    addWriters(caseName, numbers);
    addReaders(caseName, numbers);
}

void addBenchmarks() {
    addCase<int>("int", 1);
    addCase<int>("int", 4);
    addCase<int>("int", 9);
    addCase<long>("long", 18);
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
