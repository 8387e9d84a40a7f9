/// Reading dates and times without a stream: the slow twin of the readers, for random texts.
///
///     TimeTest::scanned<3>("05.03.2021", TimeTest::scanDate);   // 5, 3, 2021
///     TimeTest::streamed<3, char>("05.03.2021", read);          // should be the same
#ifndef QORN_TESTS_TIMESCANNER_H
#define QORN_TESTS_TIMESCANNER_H

#include "2System/Time/TimeDate.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/TimeTime.h"

#include "support/MessageParameters.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <ios>
#include <iterator>
#include <optional>
#include <ostream>
#include <sstream>
#include <string>
#include <utility>

namespace TimeTest {

/// What reading ends in: the fields, or the failure, and how it leaves the stream.
template <std::size_t count>
struct CScanned {
    std::optional<std::array<int, count>> fields;
    std::wstring failure;
    int state = 0;
    std::string rest;
};

template <std::size_t count>
bool operator==(CScanned<count> const& left, CScanned<count> const& right) {
    return left.fields == right.fields && left.failure == right.failure &&
           left.state == right.state && left.rest == right.rest;
}

template <std::size_t count>
std::ostream& operator<<(std::ostream& stream, CScanned<count> const& scanned) {
    if (scanned.fields)
        for (int const field : *scanned.fields)
            stream << field << ' ';
    for (wchar_t const c : scanned.failure)
        stream << static_cast<char>(c);
    return stream << " (" << scanned.state << ") \"" << scanned.rest << '"';
}

/// What a stream of the classic locale does with a text of ASCII.
class CScanner {
  public:
    explicit CScanner(std::string text) : text_(std::move(text)) {}

    int number() {
        if (!begins())
            return 0;
        bool negative = false;
        if (text_[at_] == '+' || text_[at_] == '-')
            negative = text_[at_++] == '-';
        std::int64_t value = 0;
        std::size_t digits = 0;
        for (; at_ < text_.size() && text_[at_] >= '0' && text_[at_] <= '9'; ++at_, ++digits)
            value = std::min<std::int64_t>(value * 10 + (text_[at_] - '0'), 10000000000);
        ended_ = at_ == text_.size();
        value = negative ? -value : value;
        failed_ = digits == 0 || value != static_cast<int>(value);
        return failed_ ? 0 : static_cast<int>(value);
    }

    char character() { return begins() ? text_[at_++] : '\0'; }

    std::string word() {
        std::string word;
        if (!begins())
            return word;
        while (at_ < text_.size() && !isBlank(text_[at_]))
            word += text_[at_++];
        ended_ = at_ == text_.size();
        return word;
    }

    void clear() { ended_ = failed_ = false; }
    bool ended() const { return ended_; }
    bool failed() const { return failed_; }
    int state() const { return (ended_ ? 2 : 0) + (failed_ ? 4 : 0); }
    std::string rest() const { return text_.substr(at_); }

  private:
    static bool isBlank(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

    bool begins() {
        if (ended_)
            failed_ = true;
        if (failed_)
            return false;
        while (at_ < text_.size() && isBlank(text_[at_]))
            ++at_;
        if (at_ == text_.size())
            ended_ = failed_ = true;
        return !failed_;
    }

    std::string text_;
    std::size_t at_ = 0;
    bool ended_ = false;
    bool failed_ = false;
};

// A failure is told by its type, key and reason: expanded in a message, "@@" would be one "@".

inline std::wstring wrongText(std::string const& type, std::string const& key,
                              std::string const& reason) {
    std::string const text = type + ' ' + key + ": " + reason;
    return std::wstring(text.begin(), text.end());
}

inline std::wstring badStreamText(CScanner const& scanner) {
    return wrongText("input stream", "is",
                     scanner.ended() ? "End of input data" : "Internal error: bad input stream");
}

inline std::wstring failureText(Error::CMessage const& message) {
    return TestSupport::parameterOf(message, "type") + L' ' +
           TestSupport::parameterOf(message, "key") + L": " +
           TestSupport::parameterOf(message, "reason");
}

/// The number of the month behind a word, or 0.
inline int monthOfWord(std::string const& word) {
    std::pair<char const*, int> const words[] = {{"JJJ", 1}, {"FFF", 2},  {"MMM", 3}, {"AAA", 4},
                                                 {"SSS", 9}, {"OOO", 10}, {"NNN", 11}};
    for (auto const& [begin, month] : words)
        if (word.substr(0, 3) == begin)
            return month;
    return 0;
}

inline bool isScannedDate(int day, int month, int year) {
    int const d = static_cast<std::uint16_t>(day);
    int const m = static_cast<std::uint16_t>(month);
    int const y = static_cast<std::uint16_t>(year);
    if (y < 1400 || y > 10000 || m < 1 || m > 12 || d < 1)
        return false;
    bool const isLeap = y % 400 == 0 || (y % 4 == 0 && y % 100 != 0);
    if (m == 2)
        return d <= (isLeap ? 29 : 28);
    return d <= (m == 4 || m == 6 || m == 9 || m == 11 ? 30 : 31);
}

/// The failure's text, or none and the day, the month and the year.
inline std::wstring scanDate(CScanner& scanner, std::array<int, 3>& fields) {
    int const first = scanner.number();
    if (scanner.failed())
        return badStreamText(scanner);
    char const delimiter = scanner.character();
    if (scanner.failed())
        return badStreamText(scanner);
    if (delimiter != '-' && delimiter != '.' && delimiter != '/')
        return wrongText("delimiter", std::string(1, delimiter), "'.' expected");
    int second = scanner.number();
    if (scanner.failed()) {
        scanner.clear();
        std::string const word = scanner.word();
        if (scanner.failed())
            return badStreamText(scanner);
        second = monthOfWord(word);
        if (second == 0)
            return wrongText("month", word, "Invalid month name");
    } else {
        char const next = scanner.character();
        if (scanner.failed())
            return badStreamText(scanner);
        if (next != delimiter)
            return wrongText("delimiter", std::string(1, next), "'.' expected");
    }
    int const third = scanner.number();
    if (scanner.failed())
        return badStreamText(scanner);

    fields = {first, second, third};
    if (delimiter == '-')
        fields = {third, second, first};
    if (delimiter == '/')
        fields = {second, first, third};
    if (!isScannedDate(fields[0], fields[1], fields[2]))
        return wrongText("Date",
                         '"' + std::to_string(fields[2]) + '/' + std::to_string(fields[1]) + '/' +
                             std::to_string(fields[0]) + '"',
                         "Invalid date");
    return std::wstring();
}

/// The same with the hour, the minute, the second and the millisecond.
inline std::wstring scanTime(CScanner& scanner, std::array<int, 4>& fields) {
    char delimiter = '\0';
    for (std::size_t i = 0; i < 4; ++i) {
        fields[i] = scanner.number();
        if (scanner.failed())
            return badStreamText(scanner);
        if (i == 3 || (i > 0 && scanner.ended()))
            return std::wstring();
        char const next = scanner.character();
        if (scanner.failed())
            return badStreamText(scanner);
        bool const isDelimiter = next == ':' || next == '`';
        if (i == 2 && !isDelimiter)
            return std::wstring();
        if (i < 2 && (!isDelimiter || (i == 1 && next != delimiter)))
            return wrongText("delimiter", std::string(1, next), "':' expected");
        delimiter = next;
    }
    return std::wstring();
}

template <std::size_t count, class TScan>
CScanned<count> scanned(std::string const& text, TScan const& scan) {
    CScanner scanner(text);
    std::array<int, count> fields = {};
    CScanned<count> result;
    result.failure = scan(scanner, fields);
    if (result.failure.empty())
        result.fields = fields;
    result.state = scanner.state();
    result.rest = scanner.rest();
    return result;
}

/// The same by a stream, which `read` takes an array of fields from. A wide one gets each byte as
/// a character of its own.
template <std::size_t count, class TCh, class TRead>
CScanned<count> streamed(std::string const& text, TRead const& read) {
    std::basic_string<TCh> characters;
    for (char const c : text)
        characters += static_cast<TCh>(static_cast<unsigned char>(c));
    std::basic_istringstream<TCh> stream(characters);
    CScanned<count> result;
    try {
        result.fields = read(stream);
    } catch (Time::TExcTimeDateTime const& exc) {
        result.failure = failureText(exc.getInfo().getMessage());
    }
    result.state = static_cast<int>(stream.rdstate());
    stream.clear();
    for (std::istreambuf_iterator<TCh> next(stream), end; next != end; ++next)
        result.rest += static_cast<char>(*next);
    return result;
}

// What `streamed` takes.

constexpr auto readDateFields = [](auto& stream) {
    Time::CDate const date = Time::CDate::readDate(stream);
    return std::array<int, 3>{date.getDay(), date.getMonth(), date.getYear()};
};

constexpr auto readTimeFields = [](auto& stream) {
    Time::CTime const time = Time::CTime::readTime(stream);
    return std::array<int, 4>{time.getHour(), time.getMinute(), time.getSecond(),
                              time.getMilliSecond()};
};

} // namespace TimeTest

#endif
