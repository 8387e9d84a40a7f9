/// Platform strings and UTF-8, which paths and symbols are in on Linux.
#ifndef QORN_0PLATFORM_CFSTRINGUTF8_H
#define QORN_0PLATFORM_CFSTRINGUTF8_H

#include <CoreFoundation/CFString.h>

#include <optional>
#include <string>
#include <string_view>

namespace CFPlatform {

/// The text as a zero-terminated string; nothing where it can't be one, for an embedded zero or an
/// unpaired surrogate.
std::optional<std::string> readUTF8(CFStringRef string);

/// A string of UTF-8 bytes; null where they are malformed or memory is short.
CFStringRef createFromUTF8(std::string_view bytes);

} // namespace CFPlatform

#endif
