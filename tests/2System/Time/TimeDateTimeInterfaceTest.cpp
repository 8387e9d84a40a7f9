// Names and signatures of date-times: this unit has only to compile.

#include "2System/Time/TimeDateTime.h"

#include <istream>
#include <ostream>
#include <string>
#include <type_traits>

namespace {

using Strings::string;
using Time::CDate;
using Time::CDateTime;
using Time::CTime;
using Time::CTimeZone;
using TParts = CDateTime::TParts;

static_assert(std::is_same_v<TParts, unsigned short>);
static_assert(std::is_constructible_v<CDateTime, CTime const&, CDate const&>);
static_assert(!std::is_constructible_v<CDateTime, CDate const&, CTime const&>);
static_assert(std::is_constructible_v<CDateTime, int, CDate::EMonth, int, int, int, int, int>);
static_assert(std::is_constructible_v<CDateTime, std::tm const&>);
static_assert(std::is_convertible_v<CDateTime const&, CDate>);
static_assert(std::is_convertible_v<CDateTime const&, CTime>);

static_assert(CDateTime::efNone == 0 && CDateTime::efShort == 1 && CDateTime::efMedium == 2 &&
              CDateTime::efLong == 3 && CDateTime::efFull == 4);
static_assert(CDateTime::epYear == 0x0001 && CDateTime::epMonth == 0x0002 &&
              CDateTime::epDay == 0x0004 && CDateTime::epHour == 0x0008 &&
              CDateTime::epMinute == 0x0010 && CDateTime::epSecond == 0x0020 &&
              CDateTime::epFraction == 0x0040 && CDateTime::epZone == 0x0080 &&
              CDateTime::epZoneHours == 0x0100 && CDateTime::epZoneMinutes == 0x0200);

template <auto function>
constexpr bool exists = true;

static_assert(exists<static_cast<CDateTime (*)(std::istream&)>(CDateTime::readDateTime)>);
static_assert(exists<static_cast<CDateTime (*)(std::wistream&)>(CDateTime::readDateTime)>);
static_assert(exists<static_cast<CDateTime (*)()>(CDateTime::getCurrentTimeUTC)>);
static_assert(exists<static_cast<CDateTime (*)()>(CDateTime::getCurrentTimeLocal)>);
static_assert(exists<static_cast<CDateTime (*)(CTimeZone&)>(CDateTime::getCurrentTimeLocal)>);
static_assert(exists<static_cast<CDateTime& (CDateTime::*)(unsigned int)>(&CDateTime::addSeconds)>);
static_assert(exists<static_cast<CDateTime& (CDateTime::*)(unsigned int)>(&CDateTime::subSeconds)>);

using TFormatByStyle = string (CDateTime::*)(CDateTime::EFormat, CDateTime::EFormat,
                                             string const&) const;
static_assert(exists<static_cast<TFormatByStyle>(&CDateTime::format)>);
static_assert(exists<static_cast<string (CDateTime::*)(string const&) const>(&CDateTime::format)>);
static_assert(std::is_same_v<decltype(&CDateTime::putFormat),
                             void (CDateTime::*)(string const&, string::size_type&,
                                                 Streams::u_ostream&) const>);

static_assert(std::is_same_v<decltype(&CDateTime::getAsISOdate),
                             string (CDateTime::*)(CTimeZone const&) const>);
static_assert(exists<static_cast<std::string (CDateTime::*)() const>(&CDateTime::getAsPDFdate)>);
static_assert(exists<static_cast<std::string (CDateTime::*)(CTimeZone const&) const>(
                  &CDateTime::getAsPDFdate)>);
static_assert(exists<static_cast<CDateTime (*)(std::string const&, TParts*)>(
                  CDateTime::readDateTimeFromPDF)>);
static_assert(exists<static_cast<CDateTime (*)(std::string const&, CTimeZone&, bool, TParts*)>(
                  CDateTime::readDateTimeFromPDF)>);
static_assert(exists<static_cast<CDateTime (*)(std::string const&, char, TParts*)>(
                  CDateTime::readDateTimeFromISO)>);
static_assert(exists<static_cast<CDateTime (*)(std::string const&, CTimeZone&, bool, char,
                                               TParts*)>(CDateTime::readDateTimeFromISO)>);
static_assert(exists<static_cast<CDateTime (*)(string const&, int)>(
                  CDateTime::readDateTimeFromCEFACTFormatCode)>);

using TCompare = bool (*)(CDateTime const&, CDateTime const&);
static_assert(exists<static_cast<TCompare>(Time::operator<)> &&
              exists<static_cast<TCompare>(Time::operator>)> &&
              exists<static_cast<TCompare>(Time::operator<=)> &&
              exists<static_cast<TCompare>(Time::operator>=)> &&
              exists<static_cast<TCompare>(Time::operator==)> &&
              exists<static_cast<TCompare>(Time::operator!=)>);
static_assert(exists<static_cast<int (*)(CDateTime const&, CDateTime const&)>(Time::operator-)>);
static_assert(
    exists<static_cast<std::ostream& (*)(std::ostream&, CDateTime const&)>(Time::operator<<)>);
static_assert(
    exists<static_cast<std::wostream& (*)(std::wostream&, CDateTime const&)>(Time::operator<<)>);

} // namespace
