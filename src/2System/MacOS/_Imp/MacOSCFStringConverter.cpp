#include "2System/MacOS/MacOSCFStringConverter.h"

#include "1Base/Error/ErrorMacros.h"

#include <boost/smart_ptr/scoped_array.hpp>

namespace MacOS {
namespace {

// What stands in for a unit that can't be converted.
constexpr UInt8 lossByte = ' ';

using TAutoBuffer = boost::scoped_array<short>;

Strings::stringUTF16 readUnits(CFStringRef ref) {
    CFRange const whole = CFRangeMake(0, CFStringGetLength(ref));
    CFIndex bytes = 0;
    CFStringGetBytes(ref, whole, kCFStringEncodingUnicode, lossByte, false, nullptr, 0, &bytes);
    TAutoBuffer const units(new short[static_cast<std::size_t>(bytes / 2)]);
    CFStringGetBytes(ref, whole, kCFStringEncodingUnicode, lossByte, false,
                     reinterpret_cast<UInt8*>(units.get()), bytes, &bytes);
    return Strings::stringUTF16(units.get(), static_cast<std::size_t>(bytes / 2));
}

} // namespace

Strings::stringUTF16 GetStringUTF16FromCFString(CFStringRef ref) {
    ERROR_ASSERT(ref);
    UniChar const* const units = CFStringGetCharactersPtr(ref);
    CFIndex const length = units == nullptr ? 0 : CFStringGetLength(ref);
    if (length > 0)
        return Strings::stringUTF16(reinterpret_cast<short const*>(units),
                                    static_cast<std::size_t>(length));
    return readUnits(ref);
}

Strings::string GetStringFromCFString(CFStringRef ref) {
    return Encoding::convert<Strings::string>(GetStringUTF16FromCFString(ref));
}

CFStringRef GetCFString(std::string const& text) {
    return CFStringCreateWithBytes(kCFAllocatorDefault, reinterpret_cast<UInt8 const*>(text.data()),
                                   static_cast<CFIndex>(text.size()), kCFStringEncodingUTF8, false);
}

CFStringRef GetCFString(Strings::stringUTF16 const& text) {
    return CFStringCreateWithCharacters(kCFAllocatorDefault,
                                        reinterpret_cast<UniChar const*>(text.data()),
                                        static_cast<CFIndex>(text.size()));
}

CFStringRef GetCFString(unsigned char const* text) {
    return CFStringCreateWithPascalString(kCFAllocatorDefault, text, kCFStringEncodingMacRoman);
}

} // namespace MacOS
