/// A calendar date: day, month and year.
///
///     Time::CDate date(31, Time::CDate::emDec, 2021);
///     date.addDays(1);                                   // 1 January 2022
///     stream << date;                                    // "01.01.2022"
#ifndef QORN_2SYSTEM_TIMEDATE_H
#define QORN_2SYSTEM_TIMEDATE_H

#include "1Base/Config/ConfigInt.h"
#include "1Base/Strings/StringsKinds.h"

#include <ctime>
#include <iosfwd>

namespace Time {

class CDateTime;

/// Three fields, with no running day number behind them. All arithmetic works on the fields and on
/// month lengths; validity is a test of its own that only the checked constructors and the readers
/// apply. So a value can cease to be valid: see add_().
///
/// Two rules for leap years stand side by side, and both are relied on. isValid() follows the
/// Gregorian rule from 1400 on; the arithmetic knows no leap year before 1582.
class CDate {
  public:
    /// @{
    /// Fields are kept whole; see isValid() for what counts as a date.
    using TDay = Config::Int32;
    using TYear = Config::Int32;
    /// @}

    /// Holds values outside its list as well: month 0 after whole years, or what a reader found.
    enum EMonth : Config::Int32 {
        emJan = 1,
        emFeb,
        emMar,
        emApr,
        emMay,
        emJun,
        emJul,
        emAug,
        emSep,
        emOct,
        emNov,
        emDec
    };

    /// The numbering of tm_wday.
    enum EWeekDay : Config::Int32 { ewdSun, ewdMon, ewdTue, ewdWed, ewdThu, ewdFri, ewdSat };

    /// The months of a year.
    static constexpr Config::Int32 kMonthPerYear = 12;

    /// Logs and raises TExcTimeDateTime where isValid() refuses the three.
    CDate(TDay day, EMonth month, TYear year);

    /// Reads a number from each text, leading blanks skipped, the rest behind the number ignored
    /// ("12abc" is 12); what can't be read counts as 0. A month may be a word of one repeated
    /// letter that begins a month's name ("JJJ" is January). Raises TExcTimeDateTime.
    CDate(Strings::string const& day, Strings::string const& month, Strings::string const& year);

    /// The date's half of a date-time.
    CDate(CDateTime const& dateTime);

    /// Unchecked.
    CDate(std::tm const& time);

    /// A date from the year 1400 to 10000, both included. Each value is cut to its low 16 bits
    /// before the test, so the year 67557 passes as 2021 does, and a date keeps the uncut value.
    static bool isValid(TDay day, EMonth month, TYear year);

    /// @{
    /// The fields as they stand, valid or not.
    TDay getDay() const { return day_; }
    EMonth getMonth() const { return month_; }
    TYear getYear() const { return year_; }
    /// @}

    /// @{
    /// The field as decimal text without padding, in the place of the argument's content.
    void getDay(Strings::string& text) const;
    void getMonth(Strings::string& text) const;
    void getYear(Strings::string& text) const;
    /// @}

    /// As the C library's mktime says, in the local time zone. Raises TExcTimeDateTime where
    /// mktime can't tell.
    EWeekDay getDayOfWeek() const;

    /// @{
    /// English names, "Febuary" among the long ones; a value outside the list fails an assertion.
    static Strings::string getWeekdayNameShort(EWeekDay weekday);
    static Strings::string getWeekdayNameLong(EWeekDay weekday);
    static Strings::string getMonthNameShort(EMonth month);
    static Strings::string getMonthNameLong(EMonth month);
    /// @}

    /// @{
    /// More than 2^31-1 days fail an assertion.
    CDate& addDays(unsigned int days);
    CDate& subDays(unsigned int days);
    CDate& operator+=(int days);
    CDate& operator++();
    CDate& operator--();
    /// @}

    /// Adds to each field, then carries days. None of the arguments is negative (asserted). A sum
    /// of months that is a multiple of 12 above 12 leaves month 0 of the year after, and callers
    /// have it so: 15 December 2021 plus 12 months is day 15 of month 0 of 2023. Days are never
    /// clamped: 31 January plus a month is 3 March.
    void add_(Config::Int32 days, Config::Int32 months, Config::Int32 years);

    /// Subtracts from each field, then borrows days; a day behind the month's end becomes that end:
    /// 31 March less a month is 28 February.
    void sub_(Config::Int32 days, Config::Int32 months, Config::Int32 years);

    /// @{
    /// One day on or back.
    void inc_();
    void dec_();
    /// @}

    /// @{
    /// `dd.mm.year`. Fill "0" and right adjustment stay on the stream.
    void streamTo(std::ostream& stream) const;
    void streamTo(std::wostream& stream) const;
    /// @}

    /// @{
    /// Reads `day.month.year`, `year-month-day` or `month/day/year`; the delimiter decides. The
    /// month may be a word as above, with white space behind it and no second delimiter. Raises
    /// TExcTimeDateTime, with the stream left where it failed; a refused word of bytes that are no
    /// UTF-8 can't be quoted and raises TExcEncoding.
    static CDate readDate(std::istream& stream);
    static CDate readDate(std::wistream& stream);
    /// @}

  private:
    void store_(Config::Int32 days, Config::Int32 months, Config::Int32 years);

    TDay day_;
    EMonth month_;
    TYear year_;
};

/// @{
/// By all three fields.
bool operator==(CDate const& left, CDate const& right);
bool operator!=(CDate const& left, CDate const& right);
/// @}

/// @{
/// By year, then month, then day.
bool operator<(CDate const& left, CDate const& right);
bool operator>(CDate const& left, CDate const& right);
bool operator<=(CDate const& left, CDate const& right);
bool operator>=(CDate const& left, CDate const& right);
/// @}

/// A copy, `days` later; negative ones lead back.
CDate operator+(CDate const& date, int days);

/// Days on a scale of its own, which has a leap day every four years, no rule for centuries, and is
/// uneven before 1900: 1 January 2100 less 31 December 2099 is 2.
int operator-(CDate const& left, CDate const& right);

/// @{
/// CDate::streamTo().
std::ostream& operator<<(std::ostream& stream, CDate const& date);
std::wostream& operator<<(std::wostream& stream, CDate const& date);
/// @}

} // namespace Time

#endif
