#include "0Platform/CoreFoundation/_Imp/CFStringUTF8.h"

namespace CFPlatform {

std::optional<std::string> readUTF8(CFStringRef string) {
    CFIndex const length = CFStringGetLength(string);
    CFRange const whole = CFRangeMake(0, length);
    CFIndex size = 0;
    if (CFStringGetBytes(string, whole, kCFStringEncodingUTF8, 0, false, nullptr, 0, &size) !=
        length)
        return std::nullopt;
    std::string text(static_cast<std::size_t>(size), '\0');
    CFStringGetBytes(string, whole, kCFStringEncodingUTF8, 0, false,
                     reinterpret_cast<UInt8*>(text.data()), size, &size);
    if (text.find('\0') != std::string::npos)
        return std::nullopt;
    return text;
}

CFStringRef createFromUTF8(std::string_view bytes) {
    return CFStringCreateWithBytes(
        kCFAllocatorDefault, reinterpret_cast<UInt8 const*>(bytes.data()),
        static_cast<CFIndex>(bytes.size()), kCFStringEncodingUTF8, false);
}

} // namespace CFPlatform
