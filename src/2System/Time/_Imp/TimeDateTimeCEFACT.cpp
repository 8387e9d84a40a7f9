#include "2System/Time/TimeDateTime.h"

#include "1Base/StdUtil/StdUtilStreamCast.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/_Imp/TimeFailures.h"

#include <cstddef>

namespace Time {
namespace {

constexpr std::size_t none = Strings::string::npos;

/// Where the fields of a format stand. The year has its own length, all others have two characters.
struct CLayout {
    int code;
    std::size_t length; // at least
    std::size_t year, yearLength, month, day;
    std::size_t hour, minute, second;
};

constexpr CLayout layouts[] = {
    {2, 6, 4, 2, 2, 0, none, none, none},   // DDMMYY
    {3, 6, 4, 2, 0, 2, none, none, none},   // MMDDYY
    {4, 8, 4, 4, 2, 0, none, none, none},   // DDMMCCYY
    {5, 12, 4, 4, 2, 0, 8, 10, none},       // DDMMCCYYHHMM
    {101, 6, 0, 2, 2, 4, none, none, none}, // YYMMDD
    {102, 8, 0, 4, 4, 6, none, none, none}, // CCYYMMDD
    {201, 10, 0, 2, 2, 4, 6, 8, none},      // YYMMDDHHMM
    {202, 12, 0, 2, 2, 4, 6, 8, 10},        // YYMMDDHHMMSS
    {203, 12, 0, 4, 4, 6, 8, 10, none},     // CCYYMMDDHHMM
    {204, 14, 0, 4, 4, 6, 8, 10, 12},       // CCYYMMDDHHMMSS
};

CLayout const& layoutOf(int code, Strings::string const& text) {
    for (CLayout const& layout : layouts)
        if (layout.code == code && text.size() >= layout.length)
            return layout;
    ERROR_THROW(TExcTimeDateTime, Detail::wrongArgument("XML date", text, "Invalid format code"));
}

int timeField(Strings::string const& text, std::size_t pos) {
    return pos == none ? 0 : StdUtil::stream_cast<int>(text.substr(pos, 2));
}

} // namespace

CDateTime CDateTime::readDateTimeFromCEFACTFormatCode(Strings::string const& text, int code) {
    CLayout const& layout = layoutOf(code, text);
    CDate const date(text.substr(layout.day, 2), text.substr(layout.month, 2),
                     text.substr(layout.year, layout.yearLength));
    int const hour = timeField(text, layout.hour);
    int const minute = timeField(text, layout.minute);
    int const second = timeField(text, layout.second);
    return CDateTime(CTime(hour, minute, second, 0), date);
}

} // namespace Time
