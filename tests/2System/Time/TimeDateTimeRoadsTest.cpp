// Random values and texts by both roads: by hand, and by a stream. Whatever comes out has to be the
// same, failures and masks included.

#include "1Base/Error/Error.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeLocales.h"
#include "2System/Time/TimePlainReaders.h"
#include "2System/Time/TimeReadOutcome.h"
#include "2System/Time/TimeStreamRoad.h"
#include "support/ObjectCount.h"

#include <algorithm>
#include <cstddef>
#include <iomanip>
#include <limits>
#include <map>
#include <random>
#include <sstream>
#include <string>
#include <vector>

namespace {

using Time::CDateTime;
using Time::CTimeZone;
using TimeTest::CReadOutcome;
using TimeTest::CStreamRoad;

constexpr unsigned int seed = 20210305;

// A sanitizer makes a raised failure many times as slow.
#ifdef QORN_SANITIZED
constexpr std::size_t slowness = 20;
#else
constexpr std::size_t slowness = 1;
#endif

class CTimeDateTimeRoadsTest : public TestSupport::CObjectCountTest {
  protected:
    std::size_t below(std::size_t limit) {
        return std::uniform_int_distribution<std::size_t>(0, limit - 1)(random_);
    }

    bool oneIn(std::size_t count) { return below(count) == 0; }

    template <class TText>
    typename TText::value_type oneOf(TText const& text) {
        return text[below(text.size())];
    }

    std::mt19937 random_{seed};
};

// Runs `make` and then `outcome` on what it made, by hand and by a stream.
template <class TMake, class TOutcome>
void compareRoads(std::size_t rounds, TMake const& make, TOutcome const& outcome) {
    constexpr std::size_t inARound = 1000;
    for (std::size_t round = 0; round < rounds / slowness; ++round) {
        using TInput = decltype(make());
        std::vector<TInput> inputs;
        std::vector<decltype(outcome(inputs[0]))> byHand;
        for (std::size_t i = 0; i < inARound; ++i) {
            inputs.push_back(make());
            byHand.push_back(outcome(inputs.back()));
        }
        CStreamRoad const stream;
        for (std::size_t i = 0; i < inARound; ++i)
            ASSERT_EQ(outcome(inputs[i]), byHand[i])
                << "seed " << seed << ", " << testing::PrintToString(inputs[i]);
    }
}

// Reading.

constexpr std::size_t dateRounds = 340;

CReadOutcome readISO(std::string const& text) {
    return TimeTest::readISO(text, false);
}

CReadOutcome readPDF(std::string const& text) {
    return TimeTest::readPDF(text, false);
}

class CTimeDateTimeReadingRoadsTest : public CTimeDateTimeRoadsTest {
  protected:
    // A number that may be none, or too long.
    std::string number(std::size_t limit, std::size_t width) {
        std::string digits = std::to_string(below(limit));
        if (digits.size() < width)
            digits.insert(0, width - digits.size(), '0');
        return digits;
    }

    // One character more, less or in the place of another, now and then.
    std::string spoilt(std::string text) {
        using namespace std::string_literals;
        static std::string const characters = "0123456789 +-:.'TZDx\t\0\xC3"s;
        while (oneIn(3) && !text.empty()) {
            std::size_t const pos = below(text.size());
            switch (below(3)) {
            case 0:
                text[pos] = oneOf(characters);
                break;
            case 1:
                text.insert(pos, 1, oneOf(characters));
                break;
            default:
                text.erase(pos, 1);
            }
        }
        if (oneIn(3))
            text.resize(below(text.size() + 1));
        return text;
    }

    std::string isoText() {
        std::string text =
            number(10001, 4) + '-' + number(14, 2) + '-' + number(33, 2) + 'T' + number(30, 2);
        text += ':' + number(70, 2);
        if (!oneIn(4))
            text += ':' + number(70, 2);
        if (oneIn(2))
            text += '.' + number(100, 2);
        return spoilt(text + isoZone());
    }

    std::string isoZone() {
        switch (below(4)) {
        case 0:
            return "";
        case 1:
            return "Z";
        case 2:
            return oneOf(signs) + number(24, 2);
        default:
            return oneOf(signs) + number(24, 2) + ':' + number(60, 2);
        }
    }

    std::string pdfText() {
        std::string text = oneIn(4) ? "" : "D:";
        text += number(10001, 4);
        for (std::size_t const limit : {14U, 33U, 30U, 70U, 70U})
            if (!oneIn(10))
                text += number(limit, 2);
        return spoilt(text + pdfZone());
    }

    std::string pdfZone() {
        switch (below(4)) {
        case 0:
            return "";
        case 1:
            return "Z";
        case 2:
            return oneOf(signs) + number(3, 2) + '\'' + number(3, 2);
        default:
            return oneOf(signs) + number(24, 2) + '\'' + number(60, 2) + '\'';
        }
    }

    std::string const signs = "+-";
};

// Texts of which a good part are dates.
template <class TMake, class TRead>
void compareDates(TMake const& make, TRead const& read) {
    std::size_t dates = 0;
    compareRoads(dateRounds, make, [&](std::string const& text) {
        CReadOutcome outcome = read(text);
        dates += outcome.value.has_value();
        return outcome;
    });
    EXPECT_GT(dates, dateRounds / slowness * 200) << "too few of the texts were dates";
}

TEST_F(CTimeDateTimeReadingRoadsTest, ISODates) {
    compareDates([this] { return isoText(); }, readISO);
}

TEST_F(CTimeDateTimeReadingRoadsTest, PDFDates) {
    compareDates([this] { return pdfText(); }, readPDF);
}

TEST_F(CTimeDateTimeReadingRoadsTest, ShortTextsOfTheCharactersThatCount) {
    auto const make = [this] {
        std::string text;
        for (std::size_t count = below(9); count > 0; --count)
            text += oneOf(std::string("01- +:"));
        return text;
    };
    compareRoads(140, make, readISO);
    compareRoads(140, make, readPDF);
}

TEST_F(CTimeDateTimeReadingRoadsTest, ZonesOfTheCharactersThatCount) {
    auto const zone = [this] {
        std::string text;
        for (std::size_t count = below(8); count > 0; --count)
            text += oneOf(std::string("012+-:' Z"));
        return text;
    };
    compareRoads(
        140, [&] { return "2021-03-05T12:30" + zone(); }, readISO);
    compareRoads(
        140, [&] { return "D:20210305123045" + zone(); }, readPDF);
}

// Random texts against readers of the tests' own, which do not know how a text that is no UTF-8
// fails.
template <class TMake, class TRead, class TReadPlain>
void compareToPlain(std::size_t count, TMake const& make, TRead const& read,
                    TReadPlain const& readPlain) {
    for (std::size_t i = 0; i < count; ++i) {
        std::string text = make();
        std::replace(text.begin(), text.end(), '\xC3', 'x');
        ASSERT_EQ(read(text), readPlain(text))
            << "seed " << seed << ", " << testing::PrintToString(text);
    }
}

constexpr std::size_t textsToRead = 300000 / slowness;

CReadOutcome readPlainISO(std::string const& text) {
    return TimeTest::readPlainISO(text);
}

TEST_F(CTimeDateTimeReadingRoadsTest, ISODatesAreReadAsByAPlainStream) {
    compareToPlain(
        textsToRead, [this] { return isoText(); }, readISO, readPlainISO);
    for (char const separator : {' ', '-', '0', '\0'})
        compareToPlain(
            textsToRead / 10,
            [&] {
                std::string text = isoText();
                std::size_t const at = text.find('T');
                if (at != std::string::npos && !oneIn(10))
                    text.replace(at, 1, separator == 0 ? 0U : 1U, separator);
                return text;
            },
            [&](std::string const& text) { return TimeTest::readISO(text, false, separator); },
            [&](std::string const& text) { return TimeTest::readPlainISO(text, separator); });
}

TEST_F(CTimeDateTimeReadingRoadsTest, PDFDatesAreReadAsByAPlainStream) {
    compareToPlain(
        textsToRead, [this] { return pdfText(); }, readPDF, TimeTest::readPlainPDF);
}

TEST_F(CTimeDateTimeReadingRoadsTest, GroupedDatesAreReadAsByAPlainStream) {
    TimeTest::CGroupingLocale const locale(',', "\2");
    auto const grouped = [this](std::string text) {
        while (oneIn(2))
            text.insert(below(text.size() + 1), 1, ',');
        return text;
    };
    compareToPlain(
        textsToRead / 6, [&] { return grouped(isoText()); }, readISO, readPlainISO);
    compareToPlain(
        textsToRead / 6, [&] { return grouped(pdfText()); }, readPDF, TimeTest::readPlainPDF);
}

// Writing.

class CTimeDateTimeWritingRoadsTest : public CTimeDateTimeRoadsTest {
  protected:
    // Mostly as it should be, at times any number.
    int field(int first, int last) {
        using TLimits = std::numeric_limits<int>;
        if (oneIn(8))
            return std::uniform_int_distribution<int>(-110, 110)(random_);
        if (oneIn(40))
            return std::uniform_int_distribution<int>(TLimits::min(), TLimits::max())(random_);
        return std::uniform_int_distribution<int>(first, last)(random_);
    }

    CDateTime value() {
        std::tm time = {};
        time.tm_year = Config::wrapSub(field(0, 10000), 1900);
        time.tm_mon = Config::wrapSub(field(0, 13), 1);
        time.tm_mday = field(0, 31);
        Time::CTime const day(field(0, 24), field(0, 60), field(0, 60), field(0, 1000));
        return CDateTime(day, Time::CDate(time));
    }

    CTimeZone zone() {
        auto const type = static_cast<CTimeZone::EType>(static_cast<int>(below(4)) - 2);
        return CTimeZone(type, field(0, 14), field(0, 59));
    }
};

// The absolute value, as the text of it goes.
int unsignedOf(int number) {
    return number < 0 ? Config::wrapSub(0, number) : number;
}

std::wstring plainISO(CDateTime const& value, CTimeZone const& zone) {
    std::wostringstream stream;
    stream << std::setw(4) << value.getYear() << std::setfill(L'0');
    stream << '-' << std::setw(2) << static_cast<int>(value.getMonth());
    stream << '-' << std::setw(2) << value.getDay();
    stream << 'T' << std::setw(2) << value.getHour();
    stream << ':' << std::setw(2) << value.getMinute();
    stream << ':' << std::setw(2) << value.getSecond();
    if (zone.type == CTimeZone::etzUTC)
        stream << 'Z';
    if (zone.type == CTimeZone::etzPlus || zone.type == CTimeZone::etzMinus) {
        stream << (zone.type == CTimeZone::etzPlus ? '+' : '-');
        stream << std::setw(2) << unsignedOf(zone.hours) << ':';
        stream << std::setw(2) << unsignedOf(zone.minutes);
    }
    return stream.str();
}

std::string plainPDF(CDateTime const& value, CTimeZone const& zone) {
    std::ostringstream stream;
    stream << "D:" << std::setw(4) << value.getYear() << std::setfill('0');
    for (int const number : {static_cast<int>(value.getMonth()), value.getDay(), value.getHour(),
                             value.getMinute(), value.getSecond()})
        stream << std::setw(2) << number;
    if (zone.type == CTimeZone::etzUTC)
        stream << 'Z';
    if (zone.type == CTimeZone::etzPlus || zone.type == CTimeZone::etzMinus) {
        stream << (zone.type == CTimeZone::etzPlus ? '+' : '-');
        stream << std::setw(2) << unsignedOf(zone.hours) << '\'';
        stream << std::setw(2) << unsignedOf(zone.minutes) << '\'';
    }
    return stream.str();
}

constexpr std::size_t valuesToWrite = 300000 / slowness;

TEST_F(CTimeDateTimeWritingRoadsTest, TextsAreThoseOfAPlainStream) {
    for (std::size_t i = 0; i < valuesToWrite; ++i) {
        CDateTime const moment = value();
        CTimeZone const offset = zone();
        ASSERT_EQ(moment.getAsISOdate(offset), plainISO(moment, offset)) << "seed " << seed;
        ASSERT_EQ(moment.getAsPDFdate(offset), plainPDF(moment, offset)) << "seed " << seed;
    }
}

class CTimeDateTimePatternRoadsTest : public CTimeDateTimeWritingRoadsTest {
  protected:
    std::wstring pattern() {
        std::wstring text;
        for (std::size_t count = below(20); count > 0; --count) {
            if (oneIn(200)) {
                text += oneOf(std::wstring(L"xTyd\u00E9"));
            } else if (oneIn(3)) {
                text += oneOf(literals);
            } else {
                wchar_t const letter = oneOf(std::wstring(L"tcsmhDMY"));
                text += std::wstring(letter == L'Y' ? (oneIn(2) ? 2 : 4) : 1 + below(2), letter);
            }
        }
        return text;
    }

    static inline std::wstring const literals = L".,:;-_#+*%&/()= ";
};

std::string formatted(CDateTime const& value, std::wstring const& pattern) {
    return TimeTest::outcomeOf([&] { return value.format(pattern); });
}

TEST_F(CTimeDateTimePatternRoadsTest, Patterns) {
    compareRoads(
        300, [&] { return std::make_pair(value(), pattern()); },
        [](auto const& input) { return formatted(input.first, input.second); });
}

// By runs of one letter: no place in the pattern is looked at twice.
class CPlainPattern {
  public:
    CPlainPattern(CDateTime const& value, std::wstring const& literals)
        : value_(value), literals_(literals) {}

    std::string fill(std::wstring const& pattern) {
        std::size_t end = 0;
        for (std::size_t pos = 0; pos < pattern.size(); pos = end) {
            wchar_t const letter = pattern[pos];
            end = std::min(pattern.find_first_not_of(letter, pos), pattern.size());
            char const* reason = nullptr;
            if (literals_.find(letter) != std::wstring::npos)
                stream_ << pattern.substr(pos, end - pos);
            else if (letter == L'Y')
                reason = putYear(end - pos);
            else
                reason = put(letter, end - pos);
            if (reason != nullptr)
                return "TimeFormatError: " +
                       TimeTest::wrongArgument("string", TimeTest::narrow(pattern), reason);
        }
        return TimeTest::narrow(stream_.str());
    }

  private:
    char const* putYear(std::size_t length) {
        if (length == 1)
            return "Invalid format";
        if (length != 2 && length != 4)
            return "Invalid format string";
        putNumber(length == 2 ? value_.getYear() % 100 : value_.getYear(), length);
        return nullptr;
    }

    char const* put(wchar_t letter, std::size_t length) {
        std::map<wchar_t, int> const numbers = {
            {L'D', value_.getDay()},        {L'M', value_.getMonth()},
            {L'h', value_.getHour()},       {L'm', value_.getMinute()},
            {L's', value_.getSecond()},     {L'c', value_.getMilliSecond() / 10},
            {L't', value_.getMilliSecond()}};
        auto const number = numbers.find(letter);
        if (number == numbers.end() || length > 2)
            return "Invalid format string";
        putNumber(number->second, length == 2 ? 2 : 0);
        return nullptr;
    }

    void putNumber(int number, std::size_t width) {
        stream_ << std::setfill(L'0') << std::setw(static_cast<int>(width)) << number;
    }

    CDateTime const value_;
    std::wstring const literals_;
    std::wostringstream stream_;
};

TEST_F(CTimeDateTimePatternRoadsTest, PatternsAreFilledInAsOnAPlainStream) {
    for (std::size_t i = 0; i < valuesToWrite / 3; ++i) {
        CDateTime const moment = value();
        std::wstring const text = pattern();
        ASSERT_EQ(formatted(moment, text), CPlainPattern(moment, literals).fill(text))
            << "seed " << seed << ", " << testing::PrintToString(text);
    }
}

} // namespace
