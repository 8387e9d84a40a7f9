#include "2System/Time/TimeDateTime.h"

#include "1Base/StdUtil/StdUtilLocale.h"
#include "1Base/Streams/StreamsHelpers.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/_Imp/TimeFailures.h"
#include "2System/Time/_Imp/TimeInput.h"
#include "2System/Time/_Imp/TimeReading.h"

#include <sstream>

namespace Time {
namespace {

using Config::Int32;
using Detail::CReading;

constexpr char const* pdfDate = "PDF date";

/// Reads a text from its beginning on, first the date, then the zone. Digits are read by hand where
/// a stream would do the same; a stream also takes blanks and signs, and says what is wrong.
class CPDFReader {
  public:
    explicit CPDFReader(std::string const& text)
        : text_(text), isLocaleClassic_(StdUtil::isGlobalLocaleClassic()) {}

    bool isAtEnd() const { return pos_ >= text_.size(); }

    // A non-digit is not passed, and lets all objects from there on be passed instead: a zone may
    // stand right behind the year. The parts tell what was passed.
    void readDate(CReading& reading) {
        if (text_[0] == 'D') {
            if (text_[1] != ':')
                throwInvalidFormat(__LINE__);
            pos_ = 2;
        }
        readPDFDateObject(reading.year, 4, true, __LINE__);
        reading.add(CDateTime::epYear);
        struct CObject {
            CDateTime::EParts part;
            Int32& number;
        };
        for (CObject const& object :
             {CObject{CDateTime::epMonth, reading.month}, CObject{CDateTime::epDay, reading.day},
              CObject{CDateTime::epHour, reading.hour},
              CObject{CDateTime::epMinute, reading.minute},
              CObject{CDateTime::epSecond, reading.second}}) {
            if (isAtEnd())
                return;
            readPDFDateObject(object.number, 2, false, __LINE__);
            reading.add(object.part);
        }
    }

    void readZone(CTimeZone& zone, CReading& reading) const {
        if (!isLocaleClassic_ || !readPlainZone(zone, reading))
            readZoneByStream(zone, reading);
        // An offset of nothing is no zone to callers, although it stands there.
        if (zone.type != CTimeZone::etzUTC && zone.hours == 0 && zone.minutes == 0)
            zone.type = CTimeZone::etzNone;
    }

  private:
    // Passes `length` characters, however many of them the number takes.
    void readPDFDateObject(Int32& value, int length, bool required, unsigned int line) {
        char const* const next = text_.c_str() + pos_;
        if (!required && !Detail::isDigit(*next))
            return;
        if (isLocaleClassic_ && Detail::areDigits(next, length))
            value = Detail::numberIn(next, length);
        else
            readByStream(value, length, line);
        pos_ += static_cast<std::size_t>(length);
    }

    void readByStream(Int32& value, int length, unsigned int line) const {
        std::istringstream stream(text_.substr(pos_, static_cast<std::size_t>(length)));
        stream >> value;
        checkStream(stream, line);
    }

    // "Z", or an offset of two digits each; the last apostrophe may be missing.
    bool readPlainZone(CTimeZone& zone, CReading& reading) const {
        char const* const next = text_.c_str() + pos_;
        if (*next == 'Z') {
            zone.type = CTimeZone::etzUTC;
            reading.add(CDateTime::epZone);
            return true;
        }
        if ((*next != '+' && *next != '-') || !Detail::areDigits(next + 1, 2) || next[3] != '\'' ||
            !Detail::areDigits(next + 4, 2))
            return false;
        bool const isClosed = next[6] == '\'';
        if (!isClosed && pos_ + 6 != text_.size())
            return false;
        zone.type = *next == '+' ? CTimeZone::etzPlus : CTimeZone::etzMinus;
        zone.hours = Detail::numberIn(next + 1, 2);
        zone.minutes = Detail::numberIn(next + 4, 2);
        addOffsetParts(reading, isClosed);
        return true;
    }

    void readZoneByStream(CTimeZone& zone, CReading& reading) const {
        std::istringstream stream(text_.substr(pos_));
        char designator = 0;
        stream >> designator;
        if (designator == 'Z') {
            zone.type = CTimeZone::etzUTC;
            reading.add(CDateTime::epZone);
            return;
        }
        if (designator != '+' && designator != '-')
            throwInvalidFormat(__LINE__);
        zone.type = designator == '+' ? CTimeZone::etzPlus : CTimeZone::etzMinus;
        stream >> zone.hours;
        checkStream(stream, __LINE__);
        checkApostrophe(stream, __LINE__);
        stream >> zone.minutes;
        bool const goesOn = stream.good();
        if (goesOn)
            checkApostrophe(stream, __LINE__);
        else if (!stream.eof())
            throwInvalidFormat(__LINE__);
        addOffsetParts(reading, goesOn);
    }

    // The minutes count without their part too: with no apostrophe behind them.
    static void addOffsetParts(CReading& reading, bool isClosed) {
        reading.add(CDateTime::epZone | CDateTime::epZoneHours);
        if (isClosed)
            reading.add(CDateTime::epZoneMinutes);
    }

    // All parts fail alike: the line tells which one it was.

    void checkApostrophe(std::istream& stream, unsigned int line) const {
        if (!Streams::readDelimiter(stream, '\''))
            throwInvalidFormat(line);
    }

    void checkStream(std::istream const& stream, unsigned int line) const {
        Error::COrigin const origin(__FILE__, line, __PRETTY_FUNCTION__, __DATE__, __TIME__);
        Detail::checkInputStream(stream, "iss", origin, [this] { return invalidFormat(); });
    }

    [[noreturn]] void throwInvalidFormat(unsigned int line) const {
        throw Error::XExc<TExcTimeDateTime>(__FILE__, line, __PRETTY_FUNCTION__, __DATE__, __TIME__,
                                            invalidFormat());
    }

    Error::CMessage invalidFormat() const {
        return Detail::wrongArgument(pdfDate, text_, "Invalid format");
    }

    std::string const& text_;
    bool const isLocaleClassic_;
    std::size_t pos_ = 0;
};

} // namespace

CDateTime CDateTime::readDateTimeFromPDF(std::string const& text, TParts* parts) {
    CTimeZone zone;
    return readDateTimeFromPDF(text, zone, true, parts);
}

CDateTime CDateTime::readDateTimeFromPDF(std::string const& text, CTimeZone& zone, bool toLocal,
                                         TParts* parts) {
    Detail::checkNotEmpty(pdfDate, text);
    zone = CTimeZone();
    CReading reading;
    CPDFReader reader(text);
    reader.readDate(reading);
    CDateTime dateTime = reading.toDateTime();
    if (!reader.isAtEnd()) {
        reader.readZone(zone, reading);
        if (toLocal)
            Detail::moveToLocalZone(dateTime, zone);
    }
    if (parts != nullptr)
        *parts = reading.parts;
    return dateTime;
}

} // namespace Time
