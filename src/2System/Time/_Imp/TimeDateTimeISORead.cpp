#include "2System/Time/TimeDateTime.h"

#include "1Base/StdUtil/StdUtilLocale.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/_Imp/TimeFailures.h"
#include "2System/Time/_Imp/TimeReading.h"

#include <istream>
#include <sstream>

namespace Time {
namespace {

using Config::Int32;
using Detail::CReading;

constexpr char const* isoDate = "ISO date";

/// Reads texts of nothing but the plain form. Any other is left to the stream, also one that it
/// takes: with blanks or signs in the place of digits, say.
class CDirectReader {
  public:
    explicit CDirectReader(std::string const& text)
        : next_(text.data()), end_(text.data() + text.size()) {}

    bool read(char separator, CReading& reading, CTimeZone& zone) {
        reading.add(CDateTime::epYear);
        if (!readNumber(reading.year, 4))
            return false;
        if (isAtEnd())
            return true;
        reading.add(CDateTime::epMonth);
        if (!take('-') || !readNumber(reading.month, 2))
            return false;
        if (isAtEnd())
            return true;
        reading.add(CDateTime::epDay);
        if (!take('-') || !readNumber(reading.day, 2))
            return false;
        if (isAtEnd())
            return true;
        return separator != 0 && take(separator) && readTime(reading, zone);
    }

  private:
    bool readTime(CReading& reading, CTimeZone& zone) {
        reading.add(CDateTime::epHour);
        if (!readNumber(reading.hour, 2))
            return false;
        if (isAtEnd())
            return true;
        reading.add(CDateTime::epMinute);
        if (!take(':') || !readNumber(reading.minute, 2))
            return false;
        if (take(':')) {
            reading.add(CDateTime::epSecond);
            if (!readNumber(reading.second, 2))
                return false;
            if (take('.')) {
                reading.add(CDateTime::epFraction);
                if (!readNumber(reading.milliSecond, 2))
                    return false;
            }
        }
        return readZone(reading, zone);
    }

    bool readZone(CReading& reading, CTimeZone& zone) {
        if (take('Z')) {
            reading.add(CDateTime::epZone);
            return true;
        }
        if (take('+'))
            zone.type = CTimeZone::etzPlus;
        else if (take('-'))
            zone.type = CTimeZone::etzMinus;
        else
            return true; // any other text is passed over
        reading.add(CDateTime::epZone | CDateTime::epZoneHours);
        if (!readNumber(zone.hours, 2))
            return false;
        if (isAtEnd())
            return true;
        reading.add(CDateTime::epZoneMinutes);
        return take(':') && readNumber(zone.minutes, 2);
    }

    bool isAtEnd() const { return next_ == end_; }

    bool take(char character) {
        if (isAtEnd() || *next_ != character)
            return false;
        ++next_;
        return true;
    }

    // A number of exactly so many digits.
    bool readNumber(Int32& number, int count) {
        if (!Detail::areDigits(next_, count) || Detail::isDigit(next_[count]))
            return false;
        number = Detail::numberIn(next_, count);
        next_ += count;
        return true;
    }

    char const* next_;
    char const* end_;
};

/// Reads by a stream: the form as it is meant, with what a stream takes beside digits.
class CStreamReader {
  public:
    explicit CStreamReader(std::string const& text) : text_(text), stream_(text) {}

    void read(char separator, CReading& reading, CTimeZone& zone) {
        stream_ >> std::ws;
        readPart(reading, CDateTime::epYear, 4, reading.year, __LINE__);
        checkISOStream('-', __LINE__);
        if (isAtEnd())
            return;
        readPart(reading, CDateTime::epMonth, 2, reading.month, __LINE__);
        checkISOStream('-', __LINE__);
        if (isAtEnd())
            return;
        readPart(reading, CDateTime::epDay, 2, reading.day, __LINE__);
        checkISOStream(separator, __LINE__);
        if (isAtEnd())
            return;
        readPart(reading, CDateTime::epHour, 2, reading.hour, __LINE__);
        checkISOStream(':', __LINE__);
        if (isAtEnd())
            return;
        readPart(reading, CDateTime::epMinute, 2, reading.minute, __LINE__);
        if (take(':')) {
            readPart(reading, CDateTime::epSecond, 2, reading.second, __LINE__);
            checkISOStream(0, __LINE__);
            if (take('.')) {
                readPart(reading, CDateTime::epFraction, 2, reading.milliSecond, __LINE__);
                checkISOStream(0, __LINE__);
            }
        }
        readZone(reading, zone);
    }

  private:
    void readZone(CReading& reading, CTimeZone& zone) {
        if (take('Z')) {
            reading.add(CDateTime::epZone);
            return;
        }
        if (take('-'))
            zone.type = CTimeZone::etzMinus;
        else if (take('+'))
            zone.type = CTimeZone::etzPlus;
        else
            return;
        readPart(reading, CDateTime::epZone | CDateTime::epZoneHours, 2, zone.hours, __LINE__);
        checkISOStream(0, __LINE__);
        checkISOStream(':', __LINE__);
        if (isAtEnd())
            return;
        readPart(reading, CDateTime::epZoneMinutes, 2, zone.minutes, __LINE__);
        checkISOStream(0, __LINE__);
    }

    bool isAtEnd() const { return stream_.eof(); }

    bool take(char character) {
        if (isAtEnd() || stream_.peek() != std::char_traits<char>::to_int_type(character))
            return false;
        stream_.ignore();
        return true;
    }

    void readPart(CReading& reading, int part, int length, Int32& number, unsigned int line) {
        std::streampos const start = stream_.tellg();
        stream_ >> number;
        checkISOPartLen(start, length, number, line);
        reading.add(part);
    }

    // A part takes exactly `expected` characters, blanks and sign included. Only a stream that is
    // not at its end tells its position.
    void checkISOPartLen(std::streampos start, int expected, Int32 number, unsigned int line) {
        bool const wasAtEnd = isAtEnd();
        if (wasAtEnd)
            stream_.clear();
        if (number < 0 || stream_.tellg() - start != expected)
            throwInvalidFormat(line);
        if (wasAtEnd)
            stream_.setstate(std::ios_base::eofbit);
    }

    // Nothing has to follow at the end. A delimiter of 0 stands for none.
    void checkISOStream(char delimiter, unsigned int line) {
        if (isAtEnd())
            return;
        char character = delimiter;
        if (delimiter != 0)
            stream_.get(character);
        if (stream_.fail() || character != delimiter)
            throwInvalidFormat(line);
    }

    // All parts fail alike: the line tells which one it was.
    [[noreturn]] void throwInvalidFormat(unsigned int line) const {
        throw Error::XExc<TExcTimeDateTime>(
            __FILE__, line, __PRETTY_FUNCTION__, __DATE__, __TIME__,
            Detail::wrongArgument(isoDate, text_, "Invalid format"));
    }

    std::string const& text_;
    std::istringstream stream_;
};

// A text without a zone is taken for one of UTC.
CReading readText(std::string const& text, char separator, CTimeZone& zone) {
    if (StdUtil::isGlobalLocaleClassic()) {
        CReading reading;
        zone = CTimeZone(CTimeZone::etzUTC, 0, 0);
        if (CDirectReader(text).read(separator, reading, zone))
            return reading;
    }
    CReading reading;
    zone = CTimeZone(CTimeZone::etzUTC, 0, 0);
    CStreamReader(text).read(separator, reading, zone);
    return reading;
}

} // namespace

CDateTime CDateTime::readDateTimeFromISO(std::string const& text, char separator, TParts* parts) {
    CTimeZone zone;
    return readDateTimeFromISO(text, zone, true, separator, parts);
}

CDateTime CDateTime::readDateTimeFromISO(std::string const& text, CTimeZone& zone, bool toLocal,
                                         char separator, TParts* parts) {
    Detail::checkNotEmpty(isoDate, text);
    CReading const reading = readText(text, separator, zone);
    CDateTime dateTime = reading.toDateTime();
    if (toLocal)
        Detail::moveToLocalZone(dateTime, zone);
    if (parts != nullptr)
        *parts = reading.parts;
    return dateTime;
}

} // namespace Time
