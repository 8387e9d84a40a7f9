// A message of three parameters beside other libraries. Each contender owns the text that it makes
// and must make the same one. In "texts" and "numbers" it gets values and template as its own text
// type or as numbers; in "wide" everything comes and goes as std::wstring, as it does here.
//
// The template is a value at run time for all of them. Ours and {fmt} read it anew each time, ICU
// may keep it parsed.

#include "1Base/Strings/StringsMessage.h"

#include "1Base/Error/ErrorParameter.h"
#include "support/Benchmark.h"

#ifdef QORN_HAVE_FMT
#    include <fmt/args.h>
#    include <fmt/xchar.h>
#endif
#ifdef QORN_HAVE_ICU
#    include <unicode/msgfmt.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QString>
#endif

#include <boost/format.hpp>

#include <cstdlib>
#include <iostream>
#include <string>
#include <utility>

namespace {

// Adds a contender after one trial run: a contender that gives another text measures other work.
template <class TText, class TRun>
void addChecked(std::string const& row, char const* contender, TText const& expected, TRun run) {
    if (run() != expected) {
        std::cerr << row << ": " << contender << " gives another text\n";
        std::exit(EXIT_FAILURE);
    }
    Benchmarks::add(row, contender, std::move(run));
}

// "A was not expected in B", with the kind of A in front.
struct CTexts {
    static constexpr char const* row = "ExpandMessage/texts";
    std::wstring const expected = L"File /home/ada/letter.odt was not expected in /home/ada/public";

    std::wstring const first = L"File";
    std::wstring const second = L"/home/ada/letter.odt";
    std::wstring const third = L"/home/ada/public";

    std::wstring const ours = L"@(type) @(key) was not expected in @(location)";
    std::wstring const named = L"{type} {key} was not expected in {location}";
    std::wstring const counted = L"%1% %2% was not expected in %3%";
    std::wstring const countedQt = L"%1 %2 was not expected in %3";
    char const* const names[3] = {"type", "key", "location"};
    wchar_t const* const wideNames[3] = {L"type", L"key", L"location"};
};

struct CNumbers {
    static constexpr char const* row = "ExpandMessage/numbers";
    std::wstring const expected = L"70000 too large for short (max. 32767)";

    int const first = 70000;
    std::wstring const second = L"short";
    int const third = 32767;

    std::wstring const ours = L"@(value) too large for @(type) (max. @(max))";
    std::wstring const named = L"{value} too large for {type} (max. {max})";
    std::wstring const counted = L"%1% too large for %2% (max. %3%)";
    std::wstring const countedQt = L"%1 too large for %2 (max. %3)";
    char const* const names[3] = {"value", "type", "max"};
    wchar_t const* const wideNames[3] = {L"value", L"type", L"max"};
};

template <class TCase>
Strings::CParameterList<wchar_t> parametersOf(TCase const& c) {
    return Error::inOrder(Error::buildNamedParameter(c.names[0], c.first),
                          Error::buildNamedParameter(c.names[1], c.second),
                          Error::buildNamedParameter(c.names[2], c.third));
}

template <class TCase>
void addOurs(std::string const& row, TCase const& c) {
    using TMessage = Strings::CMessage<wchar_t, Strings::CParameterList<wchar_t>>;
    addChecked(row, "ours", c.expected, [c] {
        TMessage const message(c.ours, parametersOf(c));
        return message.getString(true);
    });
}

#ifdef QORN_HAVE_FMT
template <class TCase>
void addFmt(std::string const& row, TCase const& c) {
    addChecked(row, "fmt", c.expected, [c] {
        return fmt::format(fmt::runtime(c.named), fmt::arg(c.wideNames[0], c.first),
                           fmt::arg(c.wideNames[1], c.second), fmt::arg(c.wideNames[2], c.third));
    });
    addChecked(row, "fmtdynamic", c.expected, [c] {
        fmt::dynamic_format_arg_store<fmt::wformat_context> store;
        store.push_back(fmt::arg(c.wideNames[0], c.first));
        store.push_back(fmt::arg(c.wideNames[1], c.second));
        store.push_back(fmt::arg(c.wideNames[2], c.third));
        return fmt::vformat(fmt::wstring_view(c.named), store);
    });
}
#endif

#ifdef QORN_HAVE_ICU
icu::UnicodeString icuText(std::wstring const& text) {
    return icu::UnicodeString::fromUTF32(reinterpret_cast<UChar32 const*>(text.data()),
                                         static_cast<int32_t>(text.size()));
}

icu::UnicodeString icuText(char const* text) {
    return icu::UnicodeString(text);
}

int icuValue(int value) {
    return value;
}

icu::UnicodeString icuValue(std::wstring const& value) {
    return icuText(value);
}

// Numbers without the locale's grouping, as the others write them.
icu::UnicodeString icuPattern(CTexts const& c) {
    return icuText(c.named);
}

icu::UnicodeString icuPattern(CNumbers const&) {
    return "{value,number,#0} too large for {type} (max. {max,number,#0})";
}

template <class TCase>
void addICU(TCase const& c) {
    icu::UnicodeString const expected = icuText(c.expected);
    icu::UnicodeString const names[] = {icuText(c.names[0]), icuText(c.names[1]),
                                        icuText(c.names[2])};
    icu::UnicodeString const pattern = icuPattern(c);
    auto const first = icuValue(c.first);
    auto const second = icuValue(c.second);
    auto const third = icuValue(c.third);
    auto const expand = [=](icu::MessageFormat const& format) {
        UErrorCode status = U_ZERO_ERROR;
        icu::Formattable const values[] = {first, second, third};
        icu::UnicodeString result;
        format.format(names, values, 3, result, status);
        return result;
    };
    UErrorCode status = U_ZERO_ERROR;
    icu::MessageFormat const parsed(pattern, status);
    addChecked(TCase::row, "icu:kept", expected, [=] { return expand(parsed); });
    addChecked(TCase::row, "icu:parsed", expected, [=] {
        UErrorCode parseStatus = U_ZERO_ERROR;
        return expand(icu::MessageFormat(pattern, parseStatus));
    });
}
#endif

#ifdef QORN_HAVE_QT
QString qtText(std::wstring const& text) {
    return QString::fromStdWString(text);
}

void addQt(CTexts const& c) {
    addChecked(CTexts::row, "qt:together", qtText(c.expected),
               [pattern = qtText(c.countedQt), first = qtText(c.first), second = qtText(c.second),
                third = qtText(c.third)] { return pattern.arg(first, second, third); });
    addChecked(CTexts::row, "qt:chained", qtText(c.expected),
               [pattern = qtText(c.countedQt), first = qtText(c.first), second = qtText(c.second),
                third = qtText(c.third)] { return pattern.arg(first).arg(second).arg(third); });
}

void addQt(CNumbers const& c) {
    addChecked(CNumbers::row, "qt", qtText(c.expected),
               [pattern = qtText(c.countedQt), first = c.first, second = qtText(c.second),
                third = c.third] { return pattern.arg(first).arg(second).arg(third); });
}
#endif

template <class TCase>
void addBoost(std::string const& row, TCase const& c) {
    addChecked(row, "boost", c.expected,
               [c] { return (boost::wformat(c.counted) % c.first % c.second % c.third).str(); });
}

template <class TCase>
void addCase(TCase const& c) {
    addOurs(TCase::row, c);
#ifdef QORN_HAVE_FMT
    addFmt(TCase::row, c);
#endif
#ifdef QORN_HAVE_ICU
    addICU(c);
#endif
#ifdef QORN_HAVE_QT
    addQt(c);
#endif
    addBoost(TCase::row, c);
}

// The values of CTexts, for callers whose texts are wide.
void addWideCase(CTexts const& c) {
    std::string const row = "ExpandMessage/wide";
    addOurs(row, c);
#ifdef QORN_HAVE_FMT
    addFmt(row, c);
#endif
#ifdef QORN_HAVE_ICU
    icu::UnicodeString const names[] = {icuText(c.names[0]), icuText(c.names[1]),
                                        icuText(c.names[2])};
    UErrorCode status = U_ZERO_ERROR;
    icu::MessageFormat const parsed(icuPattern(c), status);
    addChecked(row, "icu", c.expected, [=] {
        UErrorCode formatStatus = U_ZERO_ERROR;
        icu::Formattable const values[] = {icuText(c.first), icuText(c.second), icuText(c.third)};
        icu::UnicodeString result;
        parsed.format(names, values, 3, result, formatStatus);
        std::wstring wide(static_cast<std::size_t>(result.length()), L'\0');
        int32_t const length =
            result.toUTF32(reinterpret_cast<UChar32*>(&wide[0]), result.length(), formatStatus);
        wide.resize(static_cast<std::size_t>(length));
        return wide;
    });
#endif
#ifdef QORN_HAVE_QT
    addChecked(row, "qt", c.expected, [pattern = qtText(c.countedQt), c] {
        return pattern.arg(qtText(c.first), qtText(c.second), qtText(c.third)).toStdWString();
    });
#endif
    addBoost(row, c);
}

void addBenchmarks() {
    addCase(CTexts());
    addWideCase(CTexts());
    addCase(CNumbers());
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
