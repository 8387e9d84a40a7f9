/// Text in the platform's legacy encodings, for tests.
///
///     TestSupport::decode("\x8E", kCFStringEncodingMacRoman);    // u"\u00E9"
///     TestSupport::encode(u"\u00E9", kCFStringEncodingMacRoman); // 1 unit, "\x8E"
#ifndef QORN_TESTS_LEGACYENCODINGS_H
#define QORN_TESTS_LEGACYENCODINGS_H

#include <CoreFoundation/CoreFoundation.h>

#include <optional>
#include <string>
#include <vector>

namespace TestSupport {

struct CLegacyEncoding {
    char const* name;
    CFStringEncoding value;
    bool hasPairs; // codes of two bytes
};

/// All that are served.
std::vector<CLegacyEncoding> const& legacyEncodings();

/// A line of the generated tables' source.
struct CLegacyCode {
    CFStringEncoding encoding;
    std::string bytes;
    std::u16string units;
};
std::vector<CLegacyCode> const& legacyCodes();

/// The text of the bytes; nothing where the platform refuses them.
std::optional<std::u16string> decode(std::string const& bytes, CFStringEncoding encoding);

/// How many units the platform converted, and into what.
struct CEncoded {
    CFIndex units;
    std::string bytes;
};
inline bool operator==(CEncoded const& left, CEncoded const& right) {
    return left.units == right.units && left.bytes == right.bytes;
}

/// Encodes from the unit `from` on. The buffer ends where the limit does, so that a checker of
/// memory sees a byte beyond it.
CEncoded encode(std::u16string const& units, CFStringEncoding encoding, UInt8 lossByte = '?');
CEncoded encodeWithin(CFIndex limit, std::u16string const& units, CFStringEncoding encoding,
                      CFIndex from = 0);

/// What encoding has to write, without a buffer.
CFIndex measure(std::u16string const& units, CFStringEncoding encoding);

/// Two digits a byte, four a unit; "-" is nothing.
std::string bytesOfHex(std::string const& text);
std::string hexOf(std::string const& bytes);
std::string hexOf(std::u16string const& units);

} // namespace TestSupport

#endif
