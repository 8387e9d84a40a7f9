#include "2System/Time/TimeDate.h"

#include "1Base/StdUtil/StdUtilStreamCast.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/_Imp/TimeFailures.h"
#include "2System/Time/_Imp/TimeMonths.h"
#include "2System/Time/_Imp/TimeNames.h"
#include "2System/Time/_Imp/TimeTm.h"

#include <iomanip>
#include <ostream>

namespace Time {
namespace {

template <class TStream>
void dateToStream(TStream& stream, CDate const& date) {
    auto const zero = stream.widen('0');
    stream << std::right << std::setfill(zero) << std::setw(2) << date.getDay() << '.';
    stream << std::right << std::setfill(zero) << std::setw(2)
           << static_cast<Config::Int32>(date.getMonth()) << '.';
    stream << date.getYear();
}

CDate::EWeekDay doGetDayOfWeek(CDate::TDay day, CDate::EMonth month, CDate::TYear year) {
    std::tm time = Detail::toTm(day, month, year);
    if (std::mktime(&time) == -1) {
        char const* const function = "mktime";
        Error::COSErrMessage const error;
        ERROR_THROW(TExcTimeDateTime, Error::msgOSCall,
                    ERROR_PARAMS(ERROR_PARAM(function), ERROR_PARAM(error)));
    }
    return static_cast<CDate::EWeekDay>(time.tm_wday);
}

} // namespace

CDate::CDate(TDay day, EMonth month, TYear year) : day_(day), month_(month), year_(year) {
    if (isValid(day, month, year))
        return;
    ERROR_LOG(TLoggerTimeDateTime, Error::TTgtLogger, Error::TSevError,
              "'Time::CDate::CDate()': Invalid date \"@(year)/@(month)/@(day)\"!",
              ERROR_PARAMS(ERROR_PARAM(year), ERROR_PARAM(month), ERROR_PARAM(day)));
    ERROR_THROW(TExcTimeDateTime,
                Detail::wrongArgument("Date", Detail::dateKey(day, month, year), "Invalid date"));
}

CDate::CDate(CDateTime const& dateTime) : CDate(static_cast<CDate const&>(dateTime)) {}

CDate::CDate(std::tm const& time)
    : day_(time.tm_mday),
      month_(static_cast<EMonth>(Config::wrapAdd(time.tm_mon, 1))),
      year_(Config::wrapAdd(time.tm_year, 1900)) {}

void CDate::getDay(Strings::string& text) const {
    text = StdUtil::stream_cast<Strings::string>(day_);
}

void CDate::getMonth(Strings::string& text) const {
    text = StdUtil::stream_cast<Strings::string>(static_cast<Config::Int32>(month_));
}

void CDate::getYear(Strings::string& text) const {
    text = StdUtil::stream_cast<Strings::string>(year_);
}

CDate::EWeekDay CDate::getDayOfWeek() const {
    return doGetDayOfWeek(day_, month_, year_);
}

// The texts of these assertions have no blanks where the formatter would put some.

Strings::string CDate::getWeekdayNameShort(EWeekDay weekday) {
    ERROR_ASSERT_TEXT(ewdSun <= weekday && ewdSat >= weekday, "ewdSun<=weekday && ewdSat>=weekday");
    return Detail::shortWeekdayName[weekday];
}

Strings::string CDate::getWeekdayNameLong(EWeekDay weekday) {
    ERROR_ASSERT_TEXT(ewdSun <= weekday && ewdSat >= weekday, "ewdSun<=weekday && ewdSat>=weekday");
    return Detail::longWeekdayName[weekday];
}

Strings::string CDate::getMonthNameShort(EMonth month) {
    ERROR_ASSERT_TEXT(emJan <= month && emDec >= month, "emJan<=month && emDec>=month");
    return Detail::shortMonthName[month - 1];
}

Strings::string CDate::getMonthNameLong(EMonth month) {
    ERROR_ASSERT_TEXT(emJan <= month && emDec >= month, "emJan<=month && emDec>=month");
    return Detail::longMonthName[month - 1];
}

void CDate::streamTo(std::ostream& stream) const {
    dateToStream(stream, *this);
}

void CDate::streamTo(std::wostream& stream) const {
    dateToStream(stream, *this);
}

std::ostream& operator<<(std::ostream& stream, CDate const& date) {
    date.streamTo(stream);
    return stream;
}

std::wostream& operator<<(std::wostream& stream, CDate const& date) {
    date.streamTo(stream);
    return stream;
}

} // namespace Time
