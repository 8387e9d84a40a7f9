/// Reading ISO and PDF dates by nothing but streams, step by step: the slow twins of the readers.
///
///     EXPECT_EQ(TimeTest::readISO(text, false), TimeTest::readPlainISO(text));
#ifndef QORN_TESTS_TIMEPLAINREADERS_H
#define QORN_TESTS_TIMEPLAINREADERS_H

#include "2System/Time/TimeReadOutcome.h"
#include "2System/Time/TimeScanner.h"

#include <cstddef>
#include <ctime>
#include <ios>
#include <istream>
#include <sstream>
#include <string>

namespace TimeTest {

/// What the twins raise.
struct CPlainFailure {
    std::string text;
};

/// Year, month, day, hour, minute, second and millisecond as a text that leaves all out but the
/// year has them.
struct CPlainFields {
    int year = 0;
    int month = 1;
    int day = 1;
    int hour = 0;
    int minute = 0;
    int second = 0;
    int milliSecond = 0;

    Time::CDateTime toDateTime() const {
        if (month < 1 || month > 12)
            throw CPlainFailure{badMonth(std::to_string(month))};
        if (!isScannedDate(day, month, year))
            throw CPlainFailure{badDate(std::to_string(year) + '/' + std::to_string(month) + '/' +
                                        std::to_string(day))};
        std::tm date = {};
        date.tm_year = year - 1900;
        date.tm_mon = month - 1;
        date.tm_mday = day;
        return Time::CDateTime(Time::CTime(hour, minute, second, milliSecond), Time::CDate(date));
    }
};

/// `text` is in ASCII, and no value is moved into the local zone.
template <class TRead>
CReadOutcome plainOutcomeOf(char const* type, std::string const& text, TRead const& read) {
    CReadOutcome outcome;
    try {
        if (text.empty())
            throw CPlainFailure{
                "TimeDateTime: Argument @(type) is missing|type=" + std::string(type) + "|s="};
        CPlainFailure const invalid = {"TimeDateTime: " +
                                       wrongArgument(type, text, "Invalid format")};
        Time::CDateTime::TParts parts = 0;
        outcome.value = read(invalid, outcome.zone, parts);
        outcome.parts = parts;
    } catch (CPlainFailure const& failure) {
        outcome.failure = failure.text;
    }
    return outcome;
}

inline void addParts(Time::CDateTime::TParts& parts, int more) {
    parts = static_cast<Time::CDateTime::TParts>(parts | more);
}

class CPlainISOReader {
  public:
    CPlainISOReader(std::string const& text, CPlainFailure const& invalid)
        : stream_(text), invalid_(invalid) {}

    Time::CDateTime read(char separator, Time::CTimeZone& zone, Time::CDateTime::TParts& parts) {
        CPlainFields fields;
        zone = Time::CTimeZone(Time::CTimeZone::etzUTC, 0, 0);
        stream_ >> std::ws;
        readPart(fields.year, 4);
        checkStream('-');
        addParts(parts, 0x0001);
        if (!stream_.eof()) {
            readPart(fields.month, 2);
            checkStream('-');
            addParts(parts, 0x0002);
        }
        if (!stream_.eof()) {
            readPart(fields.day, 2);
            checkStream(separator);
            addParts(parts, 0x0004);
        }
        if (!stream_.eof()) {
            readPart(fields.hour, 2);
            checkStream(':');
            addParts(parts, 0x0008);
        }
        if (!stream_.eof()) {
            readPart(fields.minute, 2);
            addParts(parts, 0x0010);
        }
        if (comes(':')) {
            stream_.get();
            readPart(fields.second, 2);
            checkStream(0);
            addParts(parts, 0x0020);
            if (comes('.')) {
                stream_.get();
                readPart(fields.milliSecond, 2);
                checkStream(0);
                addParts(parts, 0x0040);
            }
        }
        if (comes('Z'))
            addParts(parts, 0x0080);
        else if (comes('+') || comes('-'))
            readOffset(zone, parts);
        return fields.toDateTime();
    }

  private:
    void readOffset(Time::CTimeZone& zone, Time::CDateTime::TParts& parts) {
        zone.type = stream_.get() == '-' ? Time::CTimeZone::etzMinus : Time::CTimeZone::etzPlus;
        if (!stream_.eof()) {
            readPart(zone.hours, 2);
            checkStream(0);
            addParts(parts, 0x0180);
        }
        checkStream(':');
        if (!stream_.eof()) {
            readPart(zone.minutes, 2);
            checkStream(0);
            addParts(parts, 0x0200);
        }
    }

    bool comes(char character) { return !stream_.eof() && stream_.peek() == character; }

    void readPart(int& number, int length) {
        std::streamoff const start = stream_.tellg();
        stream_ >> number;
        std::ios_base::iostate const end = stream_.rdstate() & std::ios_base::eofbit;
        if (end != 0)
            stream_.clear();
        std::streamoff const taken = stream_.tellg() - start;
        if (number < 0 || taken != length)
            throw invalid_;
        stream_.setstate(end);
    }

    void checkStream(char delimiter) {
        if (stream_.eof())
            return;
        if (delimiter != 0 && stream_.get() != delimiter)
            throw invalid_;
        if (stream_.fail())
            throw invalid_;
    }

    std::istringstream stream_;
    CPlainFailure const invalid_;
};

inline CReadOutcome readPlainISO(std::string const& text, char separator = 'T') {
    return plainOutcomeOf("ISO date", text, [&](auto const& invalid, auto& zone, auto& parts) {
        return CPlainISOReader(text, invalid).read(separator, zone, parts);
    });
}

class CPlainPDFReader {
  public:
    CPlainPDFReader(std::string const& text, CPlainFailure const& invalid)
        : text_(text), invalid_(invalid) {}

    Time::CDateTime read(Time::CTimeZone& zone, Time::CDateTime::TParts& parts) const {
        zone = Time::CTimeZone();
        std::size_t pos = 0;
        if (text_[0] == 'D') {
            if (text_.substr(0, 2) != "D:")
                throw invalid_;
            pos = 2;
        }
        CPlainFields fields;
        readObject(fields.year, pos, 4, true);
        addParts(parts, 0x0001);
        int part = 0x0002;
        for (int* const number :
             {&fields.month, &fields.day, &fields.hour, &fields.minute, &fields.second}) {
            if (pos >= text_.size())
                break;
            readObject(*number, pos, 2, false);
            addParts(parts, part);
            part *= 2;
        }
        Time::CDateTime const value = fields.toDateTime();
        if (pos < text_.size())
            readZone(text_.substr(pos), zone, parts);
        return value;
    }

  private:
    void readObject(int& number, std::size_t& pos, std::size_t length, bool required) const {
        if (!required && std::string("0123456789").find(text_[pos]) == std::string::npos)
            return;
        std::istringstream stream(text_.substr(pos, length));
        stream >> number;
        check(stream);
        pos += length;
    }

    void readZone(std::string const& rest, Time::CTimeZone& zone,
                  Time::CDateTime::TParts& parts) const {
        std::istringstream stream(rest);
        char designator = 0;
        if (!(stream >> designator))
            throw invalid_;
        if (designator == 'Z') {
            zone.type = Time::CTimeZone::etzUTC;
            addParts(parts, 0x0080);
            return;
        }
        if (designator != '+' && designator != '-')
            throw invalid_;
        zone.type = designator == '+' ? Time::CTimeZone::etzPlus : Time::CTimeZone::etzMinus;
        stream >> zone.hours;
        check(stream);
        takeApostrophe(stream);
        stream >> zone.minutes;
        if (stream.good()) {
            takeApostrophe(stream);
            addParts(parts, 0x0380);
        } else if (stream.eof()) {
            addParts(parts, 0x0180);
        } else {
            throw invalid_;
        }
        if (zone.hours == 0 && zone.minutes == 0)
            zone.type = Time::CTimeZone::etzNone;
    }

    void takeApostrophe(std::istream& stream) const {
        char character = 0;
        stream >> std::ws >> character;
        if (stream.fail() || character != '\'')
            throw invalid_;
    }

    void check(std::istream const& stream) const {
        if (stream.fail())
            throw CPlainFailure{invalid_.text + "|stream_name=iss|is.rdstate()=" +
                                std::to_string(static_cast<int>(stream.rdstate()))};
    }

    std::string const& text_;
    CPlainFailure const invalid_;
};

inline CReadOutcome readPlainPDF(std::string const& text) {
    return plainOutcomeOf("PDF date", text, [&](auto const& invalid, auto& zone, auto& parts) {
        return CPlainPDFReader(text, invalid).read(zone, parts);
    });
}

} // namespace TimeTest

#endif
