// Names and signatures that callers build on: a change here is a decision. This unit has only to
// compile.

#include "2System/Time/TimeDate.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/TimeTime.h"

#include <cstdint>
#include <ctime>
#include <istream>
#include <type_traits>
#include <utility>

namespace {

using Config::Int32;
using Strings::string;
using Time::CDate;
using Time::CTime;
using Time::CTimeZone;

// Compiles only where exactly this overload is there.
template <class TSignature>
constexpr bool isOverload(TSignature) {
    return true;
}

static_assert(std::is_same_v<Int32, std::int32_t>);
static_assert(std::is_same_v<CDate::TDay, std::int32_t>);
static_assert(std::is_same_v<CDate::TYear, std::int32_t>);
static_assert(std::is_same_v<std::underlying_type_t<CDate::EMonth>, std::int32_t>);
static_assert(CDate::emJan == 1 && CDate::emFeb == 2 && CDate::emMar == 3 && CDate::emApr == 4 &&
              CDate::emMay == 5 && CDate::emJun == 6 && CDate::emJul == 7 && CDate::emAug == 8 &&
              CDate::emSep == 9 && CDate::emOct == 10 && CDate::emNov == 11 && CDate::emDec == 12);
static_assert(CDate::ewdSun == 0 && CDate::ewdMon == 1 && CDate::ewdTue == 2 &&
              CDate::ewdWed == 3 && CDate::ewdThu == 4 && CDate::ewdFri == 5 && CDate::ewdSat == 6);
static_assert(CDate::kMonthPerYear == 12);

// Values of plain fields.
static_assert(!std::is_polymorphic_v<CDate> && std::is_trivially_copyable_v<CDate>);
static_assert(!std::is_polymorphic_v<CTime> && std::is_trivially_copyable_v<CTime>);
static_assert(!std::is_polymorphic_v<CTimeZone> && std::is_trivially_copyable_v<CTimeZone>);
static_assert(sizeof(CDate) == 12 && sizeof(CTime) == 16 && sizeof(CTimeZone) == 12);

static_assert(std::is_constructible_v<CDate, CDate::TDay, CDate::EMonth, CDate::TYear>);
static_assert(!std::is_constructible_v<CDate, int, int, int>, "a month is named");
static_assert(std::is_constructible_v<CDate, string const&, string const&, string const&>);
static_assert(std::is_constructible_v<CDate, std::tm>);
static_assert(std::is_constructible_v<CDate, Time::CDateTime const&>);
static_assert(!std::is_default_constructible_v<CDate>);
static_assert(isOverload<bool (*)(int, CDate::EMonth, int)>(CDate::isValid));
static_assert(isOverload<int (CDate::*)() const>(&CDate::getDay));
static_assert(isOverload<CDate::EMonth (CDate::*)() const>(&CDate::getMonth));
static_assert(isOverload<int (CDate::*)() const>(&CDate::getYear));
static_assert(isOverload<void (CDate::*)(string&) const>(&CDate::getDay));
static_assert(isOverload<void (CDate::*)(string&) const>(&CDate::getMonth));
static_assert(isOverload<void (CDate::*)(string&) const>(&CDate::getYear));
static_assert(isOverload<CDate::EWeekDay (CDate::*)() const>(&CDate::getDayOfWeek));
static_assert(isOverload<string (*)(CDate::EWeekDay)>(CDate::getWeekdayNameShort));
static_assert(isOverload<string (*)(CDate::EWeekDay)>(CDate::getWeekdayNameLong));
static_assert(isOverload<string (*)(CDate::EMonth)>(CDate::getMonthNameShort));
static_assert(isOverload<string (*)(CDate::EMonth)>(CDate::getMonthNameLong));
static_assert(isOverload<CDate& (CDate::*)(unsigned)>(&CDate::addDays));
static_assert(isOverload<CDate& (CDate::*)(unsigned)>(&CDate::subDays));
static_assert(isOverload<CDate& (CDate::*)(int)>(&CDate::operator+=));
static_assert(isOverload<CDate& (CDate::*)()>(&CDate::operator++));
static_assert(isOverload<CDate& (CDate::*)()>(&CDate::operator--));
static_assert(isOverload<void (CDate::*)(Int32, Int32, Int32)>(&CDate::add_));
static_assert(isOverload<void (CDate::*)(Int32, Int32, Int32)>(&CDate::sub_));
static_assert(isOverload<void (CDate::*)()>(&CDate::inc_));
static_assert(isOverload<void (CDate::*)()>(&CDate::dec_));
static_assert(isOverload<void (CDate::*)(std::ostream&) const>(&CDate::streamTo));
static_assert(isOverload<void (CDate::*)(std::wostream&) const>(&CDate::streamTo));
static_assert(isOverload<CDate (*)(std::istream&)>(CDate::readDate));
static_assert(isOverload<CDate (*)(std::wistream&)>(CDate::readDate));

using TCompareDates = bool (*)(CDate const&, CDate const&);
static_assert(isOverload<TCompareDates>(Time::operator==));
static_assert(isOverload<TCompareDates>(Time::operator!=));
static_assert(isOverload<TCompareDates>(Time::operator<));
static_assert(isOverload<TCompareDates>(Time::operator>));
static_assert(isOverload<TCompareDates>(Time::operator<=));
static_assert(isOverload<TCompareDates>(Time::operator>=));
static_assert(isOverload<CDate (*)(CDate const&, int)>(Time::operator+));
static_assert(isOverload<int (*)(CDate const&, CDate const&)>(Time::operator-));
static_assert(isOverload<std::ostream& (*)(std::ostream&, CDate const&)>(Time::operator<<));
static_assert(isOverload<std::wostream& (*)(std::wostream&, CDate const&)>(Time::operator<<));

static_assert(std::is_constructible_v<CTime, int, int, int, int>);
static_assert(std::is_constructible_v<CTime, std::tm>);
static_assert(std::is_constructible_v<CTime, Time::CDateTime const&>);
static_assert(isOverload<CTime (*)(int)>(CTime::milliSecondsToTimeFormat));
static_assert(isOverload<CTime (*)(int)>(CTime::secondsToTimeFormat));
static_assert(isOverload<int (CTime::*)() const>(&CTime::getHour));
static_assert(isOverload<int (CTime::*)() const>(&CTime::getMinute));
static_assert(isOverload<int (CTime::*)() const>(&CTime::getSecond));
static_assert(isOverload<int (CTime::*)() const>(&CTime::getMilliSecond));
static_assert(isOverload<void (CTime::*)(string&) const>(&CTime::getHour));
static_assert(isOverload<void (CTime::*)(string&) const>(&CTime::getMinute));
static_assert(isOverload<void (CTime::*)(string&) const>(&CTime::getSecond));
static_assert(isOverload<void (CTime::*)(string&) const>(&CTime::getMilliSecond));
static_assert(isOverload<CTime& (CTime::*)(unsigned)>(&CTime::addSeconds));
static_assert(isOverload<CTime& (CTime::*)(unsigned)>(&CTime::subSeconds));
static_assert(isOverload<CTime& (CTime::*)(unsigned)>(&CTime::subMinutes));
static_assert(isOverload<void (CTime::*)(int, int, int, int)>(&CTime::add_));
static_assert(isOverload<void (CTime::*)(int, int, int, int)>(&CTime::sub_));
static_assert(isOverload<void (CTime::*)()>(&CTime::inc_));
static_assert(isOverload<void (CTime::*)()>(&CTime::dec_));
static_assert(isOverload<void (CTime::*)(std::ostream&) const>(&CTime::streamTo));
static_assert(isOverload<void (CTime::*)(std::wostream&) const>(&CTime::streamTo));
static_assert(isOverload<CTime (*)(std::istream&)>(CTime::readTime));
static_assert(isOverload<CTime (*)(std::wistream&)>(CTime::readTime));
static_assert(isOverload<bool (*)(CTime const&, CTime const&)>(Time::operator<));
static_assert(isOverload<bool (*)(CTime const&, CTime const&)>(Time::operator==));
static_assert(isOverload<int (*)(CTime const&, CTime const&)>(Time::operator-));
static_assert(isOverload<std::ostream& (*)(std::ostream&, CTime const&)>(Time::operator<<));
static_assert(isOverload<std::wostream& (*)(std::wostream&, CTime const&)>(Time::operator<<));

static_assert(CTimeZone::etzNone == -2 && CTimeZone::etzMinus == -1 && CTimeZone::etzUTC == 0 &&
              CTimeZone::etzPlus == 1);
static_assert(isOverload<int (CTimeZone::*)() const>(&CTimeZone::getSeconds));

// Reading goes by the static members: a stream's state alone does not say what was wrong.
template <class TStream, class TValue, class = void>
constexpr bool isExtractable = false;
template <class TStream, class TValue>
constexpr bool isExtractable<
    TStream, TValue, std::void_t<decltype(std::declval<TStream&>() >> std::declval<TValue&>())>> =
    true;
static_assert(isExtractable<std::istream, int>);
static_assert(!isExtractable<std::istream, CDate> && !isExtractable<std::wistream, CDate>);
static_assert(!isExtractable<std::istream, CTime> && !isExtractable<std::wistream, CTime>);
static_assert(!isExtractable<std::istream, Time::CDateTime> &&
              !isExtractable<std::wistream, Time::CDateTime>);

// The order of the parents is part of the type.
template <template <class> class TName, class... TParents>
using TChain = Error::TExc<TemplMeta::CTag<TName<char const*>>, TParents...>;
static_assert(
    std::is_same_v<Time::TExcTimeDate, TChain<Time::CTag_Name_TimeDate, Error::CException>>);
static_assert(
    std::is_same_v<Time::TExcTimeTime, TChain<Time::CTag_Name_TimeTime, Error::CException>>);
static_assert(
    std::is_same_v<Time::TExcTimeDateTime,
                   TChain<Time::CTag_Name_TimeDateTime, Time::TExcTimeDate, Time::TExcTimeTime>>);
static_assert(std::is_same_v<Time::TExcTimeFormatError,
                             TChain<Time::CTag_Name_TimeFormatError, Time::TExcTimeDateTime>>);
static_assert(std::is_base_of_v<Error::CException, Time::TExcTimeDate>);
static_assert(std::is_base_of_v<Error::CException, Time::TExcTimeTime>);
static_assert(std::is_base_of_v<Time::TExcTimeDate, Time::TExcTimeDateTime>);
static_assert(std::is_base_of_v<Time::TExcTimeTime, Time::TExcTimeDateTime>);
static_assert(std::is_base_of_v<Time::TExcTimeDateTime, Time::TExcTimeFormatError>);
static_assert(!std::is_base_of_v<Time::TExcTimeDate, Time::TExcTimeTime>);

} // namespace
