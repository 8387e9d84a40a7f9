/// ICU's own answers, by its plain C interface: the twin that dates are held against.
#ifndef QORN_TESTS_CFDATETWIN_H
#define QORN_TESTS_CFDATETWIN_H

#include "0Platform/CoreFoundation/CFDateSupport.h"

#include <string>

namespace TestSupport {

/// Whether ICU at run time, which need not be the one of the headers, is the one whose texts are
/// recorded: 72.
bool isRecordedIcu();

/// The point in time by a lenient Gregorian calendar of ICU. `zone` is a name that ICU knows.
CFAbsoluteTime twinComposed(std::string const& zone, CLocalTime const& time);

/// The text of both styles in one. An unknown locale is written as under an American default.
std::u16string twinText(std::string const& locale, std::string const& zone, CFAbsoluteTime at,
                        CFDateFormatterStyle dateStyle, CFDateFormatterStyle timeStyle);

} // namespace TestSupport

#endif
