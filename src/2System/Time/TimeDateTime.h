/// A date with a time of day, and its written forms.
///
///     Time::CDateTime moment(5, Time::CDate::emMar, 2021, 8, 5, 9, 123);
///     moment.format(L"D.M.YY hh:mm");                    // "5.3.21 08:05"
///     moment.getAsISOdate(Time::CTimeZone());            // "2021-03-05T08:05:09"
#ifndef QORN_2SYSTEM_TIMEDATETIME_H
#define QORN_2SYSTEM_TIMEDATETIME_H

#include "1Base/Streams/StreamsTypes.h"
#include "1Base/Strings/StringsKinds.h"
#include "2System/Time/TimeDate.h"
#include "2System/Time/TimeTime.h"

#include <ctime>
#include <iosfwd>
#include <string>

namespace Time {

/// Both halves with their accessors. The date is checked where it is given as numbers, the time
/// never is. No member takes a lock; a value belongs to one thread at a time.
class CDateTime : public CDate, public CTime {
  public:
    /// The style of one half of a locale's text; any other value counts as efNone.
    enum EFormat : Config::Int32 { efNone, efShort, efMedium, efLong, efFull };

    /// What a reader of ISO or PDF passed in its text: bits of EParts.
    using TParts = unsigned short;

    /// One bit a part of the text.
    enum EParts : TParts {
        epYear = 0x0001,
        epMonth = 0x0002,
        epDay = 0x0004,
        epHour = 0x0008,
        epMinute = 0x0010,
        epSecond = 0x0020,
        epFraction = 0x0040,
        epZone = 0x0080,
        epZoneHours = 0x0100,
        epZoneMinutes = 0x0200
    };

    /// Unchecked.
    CDateTime(CTime const& time, CDate const& date);

    /// Raises TExcTimeDateTime where the date is none.
    CDateTime(int day, CDate::EMonth month, int year, int hour, int minute, int second,
              int milliSecond);

    /// Unchecked.
    CDateTime(std::tm const& time);

    /// @{
    /// CDate::readDate(), then CTime::readTime(): "05.03.2021 08:05".
    static CDateTime readDateTime(std::istream& stream);
    static CDateTime readDateTime(std::wistream& stream);
    /// @}

    /// @{
    /// The present moment, without milliseconds. Where the system's clock fails it is 1 January
    /// 2036, 17:19:38 UTC, and nothing is reported.
    static CDateTime getCurrentTimeUTC();
    static CDateTime getCurrentTimeLocal();
    /// @}

    /// Gives the local offset of this moment as well, hours and minutes with its sign.
    static CDateTime getCurrentTimeLocal(CTimeZone& zone);

    /// @{
    /// Roll the days.
    CDateTime& addSeconds(unsigned int seconds);
    CDateTime& subSeconds(unsigned int seconds);
    /// @}

    /// The text of the user's locale, date and time each in its style, with the separator between
    /// them where both have one. The value is read in the zone of the process.
    Strings::string format(EFormat dateFormat, EFormat timeFormat,
                           Strings::string const& separator) const;

    /// By a pattern of specifiers and the literals ".,:;-_#+*%&/()= " (a blank at the end): D, DD,
    /// M, MM, YY, YYYY, h, hh, m, mm, s, ss, c, cc (hundredths), t, tt (milliseconds, two places
    /// at least). Raises TExcTimeFormatError for anything else.
    Strings::string format(Strings::string const& pattern) const;

    /// Writes the specifier at `pos`, which moves on to the last character that it took. The number
    /// is written even where a third letter behind it then makes the specifier none.
    void putFormat(Strings::string const& pattern, Strings::string::size_type& pos,
                   Streams::u_ostream& out) const;

    /// ISO 8601, extended: "2021-03-05T08:05:09+01:00". A year below 1000 is padded with blanks.
    Strings::string getAsISOdate(CTimeZone const& zone) const;

    /// @{
    /// ISO 32000, 7.9.4: "D:20210305080509+01'00'". Without a zone, in the local one of this
    /// moment.
    std::string getAsPDFdate() const;
    std::string getAsPDFdate(CTimeZone const& zone) const;
    /// @}

    /// @{
    /// Reads a PDF date; the "D:" may be missing, and the text may end behind any part. Without a
    /// zone in the text `zone` stays at etzNone and the value is as written; with one, `toLocal`
    /// moves it by the difference to the local offset of this moment. `parts`, which may be null,
    /// is stored at success only. Raises TExcTimeDateTime; `zone` then holds what was read so far.
    /// The failure quotes the text: one that is no UTF-8 raises TExcEncoding in its place.
    static CDateTime readDateTimeFromPDF(std::string const& text, TParts* parts);
    static CDateTime readDateTimeFromPDF(std::string const& text, CTimeZone& zone, bool toLocal,
                                         TParts* parts);
    /// @}

    /// @{
    /// Reads an ISO date, with `separator` between date and time (callers pass 'T'; 0 stands for
    /// none). A text without a zone is UTC, and is moved as one. Otherwise as above.
    static CDateTime readDateTimeFromISO(std::string const& text, char separator, TParts* parts);
    static CDateTime readDateTimeFromISO(std::string const& text, CTimeZone& zone, bool toLocal,
                                         char separator, TParts* parts);
    /// @}

    /// Reads a date of one of the UN/CEFACT formats (list 2379): 2, 3, 4, 5, 101, 102, 201 to 204.
    /// Years of two digits get no century and are refused as dates. Raises TExcTimeDateTime, and
    /// TExcStreamCast for a field of the time that is no number.
    ///
    ///     readDateTimeFromCEFACTFormatCode(L"20210305", 102);   // 5 March 2021, 00:00:00
    static CDateTime readDateTimeFromCEFACTFormatCode(Strings::string const& text, int code);
};

/// @{
/// By date, then by time without its milliseconds. The whole set stands here, lest one half's
/// operator be taken for a comparison of both.
bool operator<(CDateTime const& left, CDateTime const& right);
bool operator>(CDateTime const& left, CDateTime const& right);
bool operator<=(CDateTime const& left, CDateTime const& right);
bool operator>=(CDateTime const& left, CDateTime const& right);
bool operator==(CDateTime const& left, CDateTime const& right);
bool operator!=(CDateTime const& left, CDateTime const& right);
/// @}

/// Seconds, wrapping in 32 bits, days counted on the scale of dates. Raises TExcTimeDateTime where
/// one of the dates is none.
int operator-(CDateTime const& left, CDateTime const& right);

/// @{
/// `dd.mm.year hh:mm:ss`.
std::ostream& operator<<(std::ostream& stream, CDateTime const& dateTime);
std::wostream& operator<<(std::wostream& stream, CDateTime const& dateTime);
/// @}

} // namespace Time

#endif
