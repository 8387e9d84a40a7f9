/// The English names of weekdays and months. They belong to no locale.
#ifndef QORN_2SYSTEM_TIMENAMES_H
#define QORN_2SYSTEM_TIMENAMES_H

namespace Time {
namespace Detail {

// One string stands in both tables of months.
inline constexpr wchar_t may[] = L"May";

/// By weekday, Sunday first.
inline constexpr wchar_t const* shortWeekdayName[] = {L"Sun", L"Mon", L"Tue", L"Wed",
                                                      L"Thu", L"Fri", L"Sat"};
inline constexpr wchar_t const* longWeekdayName[] = {
    L"Sunday", L"Monday", L"Tuesday", L"Wednesday", L"Thursday", L"Friday", L"Saturday"};

/// By month less one.
inline constexpr wchar_t const* shortMonthName[] = {L"Jan", L"Feb", L"Mar", L"Apr", may,    L"Jun",
                                                    L"Jul", L"Aug", L"Sep", L"Oct", L"Nov", L"Dec"};

/// The same; callers know the second month by this spelling.
inline constexpr wchar_t const* longMonthName[] = {
    L"January", L"Febuary", L"March",     L"April",   may,         L"June",
    L"July",    L"August",  L"September", L"October", L"November", L"December"};

} // namespace Detail
} // namespace Time

#endif
