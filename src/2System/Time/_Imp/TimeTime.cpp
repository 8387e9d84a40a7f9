#include "2System/Time/TimeTime.h"

#include "1Base/StdUtil/StdUtilStreamCast.h"
#include "2System/Time/TimeDateTime.h"

#include <iomanip>
#include <ostream>

namespace Time {
namespace {

using Config::Int32;
using Config::wrapAdd;
using Config::wrapMul;
using Config::wrapSub;

// Moves whole units of the next field there.
void carry(Int32& field, Int32& next, Int32 unit) {
    if (field < unit)
        return;
    next = wrapAdd(next, field / unit);
    field %= unit;
}

// Takes as many units from the next field as a negative field lacks.
void borrow(Int32& field, Int32& next, Int32 unit) {
    if (field >= 0)
        return;
    next = wrapAdd(next, field / unit);
    field %= unit;
    if (field < 0) {
        next = wrapSub(next, 1);
        field += unit;
    }
}

// One on; the old value decides, so a field reaches 60 before it goes back to 0.
bool incrementCarries(Int32& field) {
    bool const carries = field >= 60;
    field = carries ? 0 : field + 1;
    return carries;
}

bool decrementBorrows(Int32& field) {
    bool const borrows = field <= 0;
    field = borrows ? 59 : field - 1;
    return borrows;
}

template <class TStream>
void timeToStream(TStream& stream, CTime const& time) {
    auto const zero = stream.widen('0');
    stream << std::setfill(zero) << std::setw(2) << time.getHour() << ':';
    stream << std::setfill(zero) << std::setw(2) << time.getMinute() << ':';
    stream << std::setfill(zero) << std::setw(2) << time.getSecond();
}

} // namespace

CTime::CTime(int hour, int minute, int second, int milliSecond)
    : milliSecond_(milliSecond), second_(second), minute_(minute), hour_(hour) {}

CTime::CTime(std::tm const& time) : CTime(time.tm_hour, time.tm_min, time.tm_sec, 0) {}

CTime::CTime(CDateTime const& dateTime) : CTime(static_cast<CTime const&>(dateTime)) {}

CTime CTime::milliSecondsToTimeFormat(int milliSeconds) {
    return CTime(milliSeconds / 3600000, milliSeconds / 60000 % 60, milliSeconds / 1000 % 60,
                 milliSeconds % 1000);
}

CTime CTime::secondsToTimeFormat(int seconds) {
    return milliSecondsToTimeFormat(wrapMul(seconds, 1000));
}

void CTime::getHour(Strings::string& text) const {
    text = StdUtil::stream_cast<Strings::string>(hour_);
}

void CTime::getMinute(Strings::string& text) const {
    text = StdUtil::stream_cast<Strings::string>(minute_);
}

void CTime::getSecond(Strings::string& text) const {
    text = StdUtil::stream_cast<Strings::string>(second_);
}

void CTime::getMilliSecond(Strings::string& text) const {
    text = StdUtil::stream_cast<Strings::string>(milliSecond_);
}

CTime& CTime::addSeconds(unsigned int seconds) {
    add_(0, static_cast<int>(seconds), 0, 0);
    return *this;
}

CTime& CTime::subSeconds(unsigned int seconds) {
    sub_(0, static_cast<int>(seconds), 0, 0);
    return *this;
}

CTime& CTime::subMinutes(unsigned int minutes) {
    sub_(0, 0, static_cast<int>(minutes), 0);
    return *this;
}

void CTime::add_(int milliSeconds, int seconds, int minutes, int hours) {
    milliSecond_ = wrapAdd(milliSecond_, milliSeconds);
    carry(milliSecond_, second_, 1000);
    second_ = wrapAdd(second_, seconds);
    carry(second_, minute_, 60);
    minute_ = wrapAdd(minute_, minutes);
    carry(minute_, hour_, 60);
    hour_ = wrapAdd(hour_, hours);
}

void CTime::sub_(int milliSeconds, int seconds, int minutes, int hours) {
    milliSecond_ = wrapSub(milliSecond_, milliSeconds);
    borrow(milliSecond_, second_, 1000);
    second_ = wrapSub(second_, seconds);
    borrow(second_, minute_, 60);
    minute_ = wrapSub(minute_, minutes);
    borrow(minute_, hour_, 60);
    hour_ = wrapSub(hour_, hours);
}

void CTime::inc_() {
    if (incrementCarries(second_) && incrementCarries(minute_))
        hour_ = wrapAdd(hour_, 1);
}

void CTime::dec_() {
    if (decrementBorrows(second_) && decrementBorrows(minute_))
        hour_ = wrapSub(hour_, 1);
}

void CTime::streamTo(std::ostream& stream) const {
    timeToStream(stream, *this);
}

void CTime::streamTo(std::wostream& stream) const {
    timeToStream(stream, *this);
}

bool operator<(CTime const& left, CTime const& right) {
    if (left.getHour() != right.getHour())
        return left.getHour() < right.getHour();
    if (left.getMinute() != right.getMinute())
        return left.getMinute() < right.getMinute();
    return left.getSecond() < right.getSecond();
}

bool operator==(CTime const& left, CTime const& right) {
    return left.getSecond() == right.getSecond() && left.getMinute() == right.getMinute() &&
           left.getHour() == right.getHour();
}

int operator-(CTime const& left, CTime const& right) {
    Int32 const minutes = wrapSub(left.getMinute(), right.getMinute());
    Int32 const hours = wrapSub(left.getHour(), right.getHour());
    return wrapAdd(wrapAdd(wrapSub(left.getSecond(), right.getSecond()), wrapMul(60, minutes)),
                   wrapMul(3600, hours));
}

std::ostream& operator<<(std::ostream& stream, CTime const& time) {
    time.streamTo(stream);
    return stream;
}

std::wostream& operator<<(std::wostream& stream, CTime const& time) {
    time.streamTo(stream);
    return stream;
}

Int32 CTimeZone::getSeconds() const {
    Int32 const seconds = wrapAdd(wrapMul(hours, 3600), wrapMul(minutes, 60));
    return type == etzMinus ? wrapSub(0, seconds) : seconds;
}

} // namespace Time
