// Random texts near the notations of dates and times, read by the streams and by a scanner that
// knows no stream.

#include "2System/Time/TimeDate.h"
#include "2System/Time/TimeTime.h"

#include "2System/Time/TimeFailure.h"
#include "2System/Time/TimeReading.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <cstdio>
#include <limits>
#include <optional>
#include <random>
#include <string>

namespace {

using Time::CDate;
using Time::CTime;
using TimeTest::badStream;
using TimeTest::CReading;
using TimeTest::CTimeFailure;
using TimeTest::wrongArgument;

// What a stream of the classic locale does with a text.
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
        return digits == 0 ? 0 : static_cast<int>(value);
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
    static bool isBlank(char c) { return std::string(" \t\n\v\f\r").find(c) != std::string::npos; }

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

Strings::string wide(std::string const& ascii) {
    return Strings::string(ascii.begin(), ascii.end());
}

CTimeFailure badDelimiter(char key, char const* expected) {
    return wrongArgument(L"delimiter", Strings::string(1, static_cast<wchar_t>(key)),
                         wide(expected));
}

CTimeFailure badStreamOf(CScanner const& scanner) {
    return badStream(L"is", scanner.state());
}

// The number of the month behind such a word, or 0.
int monthOfWord(std::string const& word) {
    if (word.size() < 3 || word.substr(0, 3) != std::string(3, word[0]))
        return 0;
    switch (word[0]) {
    case 'J':
        return 1;
    case 'F':
        return 2;
    case 'M':
        return 3;
    case 'A':
        return 4;
    case 'S':
        return 9;
    case 'O':
        return 10;
    case 'N':
        return 11;
    default:
        return 0;
    }
}

// Tests only dates as they come from the texts below, whose numbers are small or huge.
bool isDate(int day, int month, int year) {
    auto const cut = [](int value) { return static_cast<std::uint16_t>(value); };
    int const d = cut(day);
    int const m = cut(month);
    int const y = cut(year);
    bool const isLeap = y % 400 == 0 || (y % 4 == 0 && y % 100 != 0);
    if (y < 1400 || y > 10000 || m < 1 || m > 12 || d < 1)
        return false;
    return d <= (m == 2 ? (isLeap ? 29 : 28) : m == 4 || m == 6 || m == 9 || m == 11 ? 30 : 31);
}

std::optional<CTimeFailure> scanDate(CScanner& scanner, std::array<int, 3>& fields) {
    std::string const delimiters = "-./";
    int first = scanner.number();
    if (scanner.failed())
        return badStreamOf(scanner);
    char const delimiter = scanner.character();
    if (scanner.failed())
        return badStreamOf(scanner);
    if (delimiters.find(delimiter) == std::string::npos)
        return badDelimiter(delimiter, "'.' expected");
    int second = scanner.number();
    if (scanner.failed()) {
        scanner.clear();
        std::string const word = scanner.word();
        if (scanner.failed())
            return badStreamOf(scanner);
        second = monthOfWord(word);
        if (second == 0)
            return wrongArgument(L"month", wide(word), L"Invalid month name");
    } else {
        char const next = scanner.character();
        if (scanner.failed())
            return badStreamOf(scanner);
        if (next != delimiter)
            return badDelimiter(next, "'.' expected");
    }
    int third = scanner.number();
    if (scanner.failed())
        return badStreamOf(scanner);
    if (delimiter == '.')
        fields = {first, second, third};
    else if (delimiter == '-')
        fields = {third, second, first};
    else
        fields = {second, first, third};
    if (!isDate(fields[0], fields[1], fields[2]))
        return wrongArgument(L"Date",
                             wide('"' + std::to_string(fields[2]) + '/' +
                                  std::to_string(fields[1]) + '/' + std::to_string(fields[0]) +
                                  '"'),
                             L"Invalid date");
    return std::nullopt;
}

std::optional<CTimeFailure> scanTime(CScanner& scanner, std::array<int, 4>& fields) {
    auto const isDelimiter = [](char c) { return c == ':' || c == '`'; };
    fields = {};
    fields[0] = scanner.number();
    if (scanner.failed())
        return badStreamOf(scanner);
    char const delimiter = scanner.character();
    if (scanner.failed())
        return badStreamOf(scanner);
    if (!isDelimiter(delimiter))
        return badDelimiter(delimiter, "':' expected");
    fields[1] = scanner.number();
    if (scanner.failed())
        return badStreamOf(scanner);
    if (scanner.ended())
        return std::nullopt;
    char next = scanner.character();
    if (scanner.failed())
        return badStreamOf(scanner);
    if (next != delimiter)
        return badDelimiter(next, "':' expected");
    fields[2] = scanner.number();
    if (scanner.failed())
        return badStreamOf(scanner);
    if (scanner.ended())
        return std::nullopt;
    next = scanner.character();
    if (scanner.failed())
        return badStreamOf(scanner);
    if (isDelimiter(next))
        fields[3] = scanner.number();
    if (scanner.failed())
        return badStreamOf(scanner);
    return std::nullopt;
}

template <std::size_t count, class TScan>
CReading<count> scanned(std::string const& text, TScan const& scan) {
    CScanner scanner(text);
    std::array<int, count> fields = {};
    std::optional<CTimeFailure> const failure = scan(scanner, fields);
    CReading<count> reading = {};
    if (failure)
        reading.failure = *failure;
    else
        reading.fields = fields;
    reading.state = scanner.state();
    reading.rest = scanner.rest();
    return reading;
}

class CTimeInputRandomTest : public TestSupport::CErrorTest {
  protected:
    CTimeInputRandomTest() { std::printf("seed %u\n", seed_); }

    std::size_t below(std::size_t end) { return random_() % end; }

    char anyOf(std::string const& characters) { return characters[below(characters.size())]; }

    // One of the texts with a few characters put in, taken out or replaced.
    template <std::size_t count>
    std::string near(char const* const (&texts)[count], std::string const& alphabet) {
        std::string text = texts[below(count)];
        for (std::size_t changes = below(4); changes > 0; --changes) {
            std::size_t const at = below(text.size() + 1);
            switch (below(3)) {
            case 0:
                text.insert(at, 1, anyOf(alphabet));
                break;
            case 1:
                text.erase(at, 1);
                break;
            default:
                if (at < text.size())
                    text[at] = anyOf(alphabet);
            }
        }
        return text;
    }

  private:
    static constexpr unsigned seed_ = 20210305;
    std::mt19937 random_{seed_};
};

TEST_F(CTimeInputRandomTest, DatesAreReadAsByTheScanner) {
    constexpr char const* texts[] = {"05.03.2021",  "2021-03-05",
                                     "03/05/2021",  "05.JJJ 2021",
                                     "2021-JJJ 05", "1.1.10000",
                                     "29.02.2000",  " 5 . 3 . 1",
                                     "31-SSS 1999", "12/31/1400",
                                     "-1.+3.67557", "2147483648.1",
                                     "5.",          ""};
    std::string const alphabet = "0123456789012345678901234567890.-/.-/+-JFMASONDjx \t\n:,";
    auto const read = [](auto& stream) {
        CDate const date = CDate::readDate(stream);
        return std::array<int, 3>{date.getDay(), date.getMonth(), date.getYear()};
    };
    int dates = 0;
    for (int i = 0; i < 100000; ++i) {
        std::string const text = near(texts, alphabet);
        CReading<3> const expected = scanned<3>(text, scanDate);
        ASSERT_EQ(TimeTest::readingOf<char>(text, read), expected) << '"' << text << '"';
        ASSERT_EQ(TimeTest::readingOf<wchar_t>(text, read), expected) << '"' << text << '"';
        dates += expected.fields ? 1 : 0;
    }
    EXPECT_GT(dates, 20000);
}

TEST_F(CTimeInputRandomTest, TimesAreReadAsByTheScanner) {
    constexpr char const* texts[] = {"08:05",    "08:05:09", "08:05:09:123", "08`05`09`123", "8:5",
                                     "25:99:99", "-1:+2:-3", "08:05 ",       "8:5:9 x",      "8:"};
    std::string const alphabet = "01234567890123456789::``.+- x\t";
    auto const read = [](auto& stream) {
        CTime const time = CTime::readTime(stream);
        return std::array<int, 4>{time.getHour(), time.getMinute(), time.getSecond(),
                                  time.getMilliSecond()};
    };
    int times = 0;
    for (int i = 0; i < 100000; ++i) {
        std::string const text = near(texts, alphabet);
        CReading<4> const expected = scanned<4>(text, scanTime);
        ASSERT_EQ(TimeTest::readingOf<char>(text, read), expected) << '"' << text << '"';
        ASSERT_EQ(TimeTest::readingOf<wchar_t>(text, read), expected) << '"' << text << '"';
        times += expected.fields ? 1 : 0;
    }
    EXPECT_GT(times, 20000);
}

} // namespace
