/// Platform strings in tests: owned, made of units and read back as units.
///
///     TestSupport::CPlatformString const text(u"caf\u00E9");
///     text.units();   // u"caf\u00E9"
#ifndef QORN_TESTS_PLATFORMSTRING_H
#define QORN_TESTS_PLATFORMSTRING_H

#include <CoreFoundation/CoreFoundation.h>

#include <string>

namespace TestSupport {

/// One code point as one or two units; a surrogate as itself.
inline std::u16string unitsOfCodePoint(char32_t c) {
    if (c < 0x10000)
        return std::u16string(1, static_cast<char16_t>(c));
    return {static_cast<char16_t>(0xD7C0 + (c >> 10)), static_cast<char16_t>(0xDC00 + (c & 0x3FF))};
}

/// Owns a platform string, which may be null.
class CPlatformString {
  public:
    explicit CPlatformString(CFStringRef ref) : ref_(ref) {}

    explicit CPlatformString(std::u16string const& units)
        : ref_(CFStringCreateWithCharacters(kCFAllocatorDefault,
                                            reinterpret_cast<UniChar const*>(units.data()),
                                            static_cast<CFIndex>(units.size()))) {}

    CPlatformString(std::string const& bytes, CFStringEncoding encoding, bool external = false)
        : ref_(CFStringCreateWithBytes(
              kCFAllocatorDefault, reinterpret_cast<UInt8 const*>(bytes.data()),
              static_cast<CFIndex>(bytes.size()), encoding, static_cast<Boolean>(external))) {}

    CPlatformString(CPlatformString const&) = delete;
    CPlatformString& operator=(CPlatformString const&) = delete;

    ~CPlatformString() {
        if (ref_ != nullptr)
            CFRelease(ref_);
    }

    CFStringRef get() const { return ref_; }

    std::u16string units() const { return unitsOf(ref_); }

    static std::u16string unitsOf(CFStringRef ref) {
        std::u16string units(static_cast<std::size_t>(CFStringGetLength(ref)), u'\0');
        CFStringGetCharacters(ref, CFRangeMake(0, CFStringGetLength(ref)),
                              reinterpret_cast<UniChar*>(units.data()));
        return units;
    }

  private:
    CFStringRef ref_;
};

} // namespace TestSupport

#endif
