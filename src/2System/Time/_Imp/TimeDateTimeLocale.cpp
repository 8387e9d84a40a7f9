#include "2System/MacOS/MacOSCFStringConverter.h"
#include "2System/MacOS/MacOSTempCFString.h"
#include "2System/Time/TimeDateTime.h"

#include <CoreFoundation/CoreFoundation.h>

#include <memory>
#include <type_traits>

namespace Time {
namespace {

struct CRelease {
    void operator()(CFTypeRef object) const { CFRelease(object); }
};

template <class TRef>
using TOwned = std::unique_ptr<std::remove_pointer_t<TRef>, CRelease>;

CFDateFormatterStyle getFormat(CDateTime::EFormat format) {
    switch (format) {
    case CDateTime::efShort:
        return kCFDateFormatterShortStyle;
    case CDateTime::efMedium:
        return kCFDateFormatterMediumStyle;
    case CDateTime::efLong:
        return kCFDateFormatterLongStyle;
    case CDateTime::efFull:
        return kCFDateFormatterFullStyle;
    default:
        return kCFDateFormatterNoStyle;
    }
}

// In the zone of a new calendar, which is that of a new formatter.
TOwned<CFDateRef> makeDate(CDateTime const& dateTime) {
    TOwned<CFCalendarRef> const calendar(
        CFCalendarCreateWithIdentifier(kCFAllocatorDefault, kCFGregorianCalendar));
    CFAbsoluteTime moment = 0;
    CFCalendarComposeAbsoluteTime(calendar.get(), &moment, "yMdHms", dateTime.getYear(),
                                  Config::Int32(dateTime.getMonth()), dateTime.getDay(),
                                  dateTime.getHour(), dateTime.getMinute(), dateTime.getSecond());
    return TOwned<CFDateRef>(CFDateCreate(kCFAllocatorDefault, moment));
}

using TFormatter = TOwned<CFDateFormatterRef>;

Strings::string makeText(TFormatter const& formatter, TOwned<CFDateRef> const& date) {
    MacOS::CTempCFString const text(
        CFDateFormatterCreateStringWithDate(kCFAllocatorDefault, formatter.get(), date.get()));
    return MacOS::GetStringFromCFString(text.get());
}

} // namespace

Strings::string CDateTime::format(EFormat dateFormat, EFormat timeFormat,
                                  Strings::string const& separator) const {
    TOwned<CFDateRef> const date = makeDate(*this);
    TOwned<CFLocaleRef> const locale(CFLocaleCopyCurrent());
    TFormatter const dateFormatter(CFDateFormatterCreate(
        kCFAllocatorDefault, locale.get(), getFormat(dateFormat), kCFDateFormatterNoStyle));
    TFormatter const timeFormatter(CFDateFormatterCreate(
        kCFAllocatorDefault, locale.get(), kCFDateFormatterNoStyle, getFormat(timeFormat)));
    Strings::string text = makeText(dateFormatter, date);
    Strings::string timeText = makeText(timeFormatter, date);

    if (dateFormat == efNone)
        text.clear();
    if (timeFormat == efNone)
        timeText.clear();
    if (!text.empty() && !timeText.empty())
        text += separator;
    return text + timeText;
}

} // namespace Time
