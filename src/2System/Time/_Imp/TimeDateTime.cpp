#include "2System/Time/TimeDateTime.h"

#include "1Base/Error/ErrorMacros.h"
#include "2System/Time/_Imp/TimeClock.h"

#include <istream>
#include <ostream>

namespace Time {
namespace {

using Config::Int32;

constexpr unsigned int secondsPerDay = 86400;
constexpr Int32 hoursPerDay = 24;

// 1 January 2036, 17:19:38 UTC.
constexpr std::time_t momentOfFailedClock = 2082820778;

std::time_t currentTime() {
    std::time_t const moment = Detail::getClock().time(nullptr);
    return moment == -1 ? momentOfFailedClock : moment;
}

CDateTime getTime(std::tm* (*convert)(std::time_t const*, std::tm*)) {
    std::time_t const moment = currentTime();
    std::tm buffer = {};
    ERROR_ASSERT_TEXT(convert(&moment, &buffer), "func(&currTime, &buf )");
    return CDateTime(buffer);
}

// A value's date, tested, and its time, of which milliseconds do not count.
CDate checkedDate(CDateTime const& dateTime) {
    return CDate(dateTime.getDay(), dateTime.getMonth(), dateTime.getYear());
}

CTime wholeSeconds(CDateTime const& dateTime) {
    return CTime(dateTime.getHour(), dateTime.getMinute(), dateTime.getSecond(), 0);
}

CDate const& dateOf(CDateTime const& dateTime) {
    return dateTime;
}

CTime const& timeOf(CDateTime const& dateTime) {
    return dateTime;
}

template <class TStream>
CDateTime readFrom(TStream& stream) {
    CDate const date = CDate::readDate(stream);
    return CDateTime(CTime::readTime(stream), date);
}

} // namespace

CDateTime::CDateTime(CTime const& time, CDate const& date) : CDate(date), CTime(time) {}

CDateTime::CDateTime(int day, CDate::EMonth month, int year, int hour, int minute, int second,
                     int milliSecond)
    : CDate(day, month, year), CTime(hour, minute, second, milliSecond) {}

CDateTime::CDateTime(std::tm const& time) : CDate(time), CTime(time) {}

CDateTime CDateTime::readDateTime(std::istream& stream) {
    return readFrom(stream);
}

CDateTime CDateTime::readDateTime(std::wistream& stream) {
    return readFrom(stream);
}

CDateTime CDateTime::getCurrentTimeUTC() {
    return getTime(Detail::getClock().gmtime);
}

CDateTime CDateTime::getCurrentTimeLocal() {
    return getTime(Detail::getClock().localtime);
}

CDateTime CDateTime::getCurrentTimeLocal(CTimeZone& zone) {
    Detail::CClock const& clock = Detail::getClock();
    std::time_t const moment = currentTime();
    std::tm utc = {};
    ERROR_ASSERT_TEXT(clock.gmtime(&moment, &utc), "gmtime_r( &currTime, &tm_utc)");
    std::tm local = {};
    ERROR_ASSERT_TEXT(clock.localtime(&moment, &local), "localtime_r( &currTime, &tm_local)");

    CDateTime const localTime(local);
    Int32 const offset = localTime - CDateTime(utc);
    zone.hours = offset / 3600;
    zone.minutes = offset / 60 - 60 * zone.hours;
    zone.type =
        offset == 0 ? CTimeZone::etzUTC : (offset > 0 ? CTimeZone::etzPlus : CTimeZone::etzMinus);
    return localTime;
}

CDateTime& CDateTime::addSeconds(unsigned int seconds) {
    addDays(seconds / secondsPerDay);
    CTime::addSeconds(seconds % secondsPerDay);
    if (getHour() >= hoursPerDay) {
        addDays(1);
        CTime::subSeconds(secondsPerDay);
    }
    return *this;
}

CDateTime& CDateTime::subSeconds(unsigned int seconds) {
    subDays(seconds / secondsPerDay);
    CTime::subSeconds(seconds % secondsPerDay);
    if (getHour() < 0) {
        subDays(1);
        CTime::addSeconds(secondsPerDay);
    }
    return *this;
}

bool operator<(CDateTime const& left, CDateTime const& right) {
    if (dateOf(left) > dateOf(right))
        return false;
    return dateOf(left) < dateOf(right) || timeOf(left) < timeOf(right);
}

bool operator>(CDateTime const& left, CDateTime const& right) {
    return right < left;
}

bool operator<=(CDateTime const& left, CDateTime const& right) {
    return !(left > right);
}

bool operator>=(CDateTime const& left, CDateTime const& right) {
    return !(left < right);
}

bool operator==(CDateTime const& left, CDateTime const& right) {
    return dateOf(left) == dateOf(right) && timeOf(left) == timeOf(right);
}

bool operator!=(CDateTime const& left, CDateTime const& right) {
    return !(left == right);
}

int operator-(CDateTime const& left, CDateTime const& right) {
    CDate const leftDate = checkedDate(left); // fails before the right one does
    int const days = leftDate - checkedDate(right);
    int const seconds = wholeSeconds(left) - wholeSeconds(right);
    return Config::wrapAdd(Config::wrapMul(days, secondsPerDay), seconds);
}

std::ostream& operator<<(std::ostream& stream, CDateTime const& dateTime) {
    return stream << dateOf(dateTime) << ' ' << timeOf(dateTime);
}

std::wostream& operator<<(std::wostream& stream, CDateTime const& dateTime) {
    return stream << dateOf(dateTime) << L' ' << timeOf(dateTime);
}

} // namespace Time
