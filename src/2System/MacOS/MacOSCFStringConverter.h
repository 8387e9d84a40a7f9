/// The platform's string type and the string kinds, into one another.
///
///     CFStringRef const ref = MacOS::GetCFString(Strings::string(L"Desktop"));
///     Strings::string const text = MacOS::GetStringFromCFString(ref);   // L"Desktop"
///     CFRelease(ref);
#ifndef QORN_2SYSTEM_MACOSCFSTRINGCONVERTER_H
#define QORN_2SYSTEM_MACOSCFSTRINGCONVERTER_H

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Strings/StringsKinds.h"

#include <CoreFoundation/CoreFoundation.h>

#include <type_traits>

namespace MacOS {

/// The string's UTF-16 units. A unit that can't be converted becomes a blank. Fails a check for a
/// null reference.
Strings::stringUTF16 GetStringUTF16FromCFString(CFStringRef ref);

/// The string's text. Raises the conversion failure as Encoding::convert does.
Strings::string GetStringFromCFString(CFStringRef ref);

/// A platform string of UTF-8 bytes; null where they are malformed. Owned by the caller.
CFStringRef GetCFString(std::string const& text);

/// A platform string of the units as they are. Owned by the caller.
CFStringRef GetCFString(Strings::stringUTF16 const& text);

/// A platform string of a Pascal string in MacRoman: a length byte, then the characters. Owned by
/// the caller.
CFStringRef GetCFString(unsigned char const* text);

/// A platform string of any other string kind. Owned by the caller.
template <class TString>
std::enable_if_t<!std::is_convertible_v<TString const&, unsigned char const*>, CFStringRef>
GetCFString(TString const& text) {
    return GetCFString(Encoding::convert<Strings::stringUTF16>(text));
}

} // namespace MacOS

#endif
