/// A time of day or a span, and an offset from UTC.
///
///     Time::CTime time(10, 0, 59, 0);
///     time.addSeconds(1);                                // 10:01:00
///     stream << time;                                    // "10:01:00"
#ifndef QORN_2SYSTEM_TIMETIME_H
#define QORN_2SYSTEM_TIMETIME_H

#include "1Base/Config/ConfigInt.h"
#include "1Base/Strings/StringsKinds.h"

#include <ctime>
#include <iosfwd>

namespace Time {

class CDateTime;

/// Four fields that nothing checks: hour 25 and hour -1 are values like any other, and the hour is
/// never wrapped at 24. All arithmetic wraps in 32 bits. Nothing here raises but the readers.
class CTime {
  public:
    /// @{
    /// The fields as they are given.
    CTime(int hour, int minute, int second, int milliSecond);
    CTime(std::tm const& time);
    /// @}

    /// The time's half of a date-time.
    CTime(CDateTime const& dateTime);

    /// @{
    /// Splits a span; a negative one yields negative fields. Seconds above 2147483 wrap.
    static CTime milliSecondsToTimeFormat(int milliSeconds);
    static CTime secondsToTimeFormat(int seconds);
    /// @}

    /// @{
    /// The fields as they stand.
    Config::Int32 getHour() const { return hour_; }
    Config::Int32 getMinute() const { return minute_; }
    Config::Int32 getSecond() const { return second_; }
    Config::Int32 getMilliSecond() const { return milliSecond_; }
    /// @}

    /// @{
    /// The field as decimal text without padding, in the place of the argument's content.
    void getHour(Strings::string& text) const;
    void getMinute(Strings::string& text) const;
    void getSecond(Strings::string& text) const;
    void getMilliSecond(Strings::string& text) const;
    /// @}

    /// @{
    /// Carries or borrows up to the hour.
    CTime& addSeconds(unsigned int seconds);
    CTime& subSeconds(unsigned int seconds);
    CTime& subMinutes(unsigned int minutes);
    /// @}

    /// @{
    /// Adds or subtracts field by field and carries up to the hour.
    void add_(int milliSeconds, int seconds, int minutes, int hours);
    void sub_(int milliSeconds, int seconds, int minutes, int hours);
    /// @}

    /// One second on. The carry looks at the old value, so the second goes 59, 60, 0.
    void inc_();

    /// One second back, in the ordinary way: not the inverse of inc_().
    void dec_();

    /// @{
    /// `hh:mm:ss`. Fill "0" stays on the stream; its adjustment is the stream's own.
    void streamTo(std::ostream& stream) const;
    void streamTo(std::wostream& stream) const;
    /// @}

    /// @{
    /// Reads `hour:minute`, with `:second` and `:milliSecond` where there is more; the grave accent
    /// does for ":". No field is tested. Raises TExcTimeDateTime.
    static CTime readTime(std::istream& stream);
    static CTime readTime(std::wistream& stream);
    /// @}

  private:
    Config::Int32 milliSecond_;
    Config::Int32 second_;
    Config::Int32 minute_;
    Config::Int32 hour_;
};

/// @{
/// None of these looks at milliseconds.
bool operator<(CTime const& left, CTime const& right);
bool operator==(CTime const& left, CTime const& right);
/// @}

/// Seconds.
int operator-(CTime const& left, CTime const& right);

/// @{
/// CTime::streamTo().
std::ostream& operator<<(std::ostream& stream, CTime const& time);
std::wostream& operator<<(std::wostream& stream, CTime const& time);
/// @}

/// An offset from UTC as the standard date forms write it. Who fills it decides on the signs: the
/// readers store hours and minutes as written, never negative for `etzMinus`;
/// CDateTime::getCurrentTimeLocal() stores them with the offset's sign.
class CTimeZone {
  public:
    /// Which of the forms the text has.
    enum EType : Config::Int32 {
        etzNone = -2, ///< no zone known
        etzMinus,     ///< behind UTC
        etzUTC,
        etzPlus ///< ahead of UTC
    };

    /// No zone known.
    CTimeZone() = default;

    /// Keeps the three as they are.
    CTimeZone(EType zoneType, Config::Int32 zoneHours, Config::Int32 zoneMinutes)
        : type(zoneType), hours(zoneHours), minutes(zoneMinutes) {}

    /// Hours and minutes in seconds, negated for `etzMinus`. A zone behind UTC that
    /// getCurrentTimeLocal() filled thus comes out positive; the readers count on the value as it
    /// is.
    Config::Int32 getSeconds() const;

    /// @{
    /// Open to whoever fills them.
    EType type = etzNone;
    Config::Int32 hours = 0;
    Config::Int32 minutes = 0;
    /// @}
};

} // namespace Time

#endif
