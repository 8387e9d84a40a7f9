#include "1Base/Strings/StringsCompare.h"
#include "1Base/Encoding/EncodingConverter.h"

#include <CoreFoundation/CoreFoundation.h>

namespace Strings {
namespace {

constexpr CFStringCompareFlags ignoringCase = kCFCompareCaseInsensitive;
constexpr CFStringCompareFlags naturally =
    kCFCompareCaseInsensitive | kCFCompareNumerically | kCFCompareDiacriticInsensitive;

CFStringRef createCFString(stringUTF16 const& text) {
    return CFStringCreateWithCharacters(kCFAllocatorDefault,
                                        reinterpret_cast<UniChar const*>(text.data()),
                                        static_cast<CFIndex>(text.size()));
}

// Both conversions, which can raise, come before the first platform string, so none can be left.
template <class TString>
int compare(TString const& a, TString const& b, CFStringCompareFlags options) {
    stringUTF16 const first = Encoding::convert<stringUTF16>(a);
    stringUTF16 const second = Encoding::convert<stringUTF16>(b);
    CFStringRef const firstRef = createCFString(first);
    CFStringRef const secondRef = createCFString(second);
    CFRange const whole = CFRangeMake(0, static_cast<CFIndex>(first.size()));
    CFComparisonResult const result =
        CFStringCompareWithOptions(firstRef, secondRef, whole, options);
    CFRelease(firstRef);
    CFRelease(secondRef);
    return static_cast<int>(result);
}

} // namespace

int stricmp(std::string const& a, std::string const& b) {
    return compare(a, b, ignoringCase);
}

int stricmp(string const& a, string const& b) {
    return compare(a, b, ignoringCase);
}

int stricmp(char const* a, char const* b) {
    return stricmp(std::string(a), std::string(b));
}

int stricmp(wchar_t const* a, wchar_t const* b) {
    return stricmp(string(a), string(b));
}

int strnatcmp(std::string const& a, std::string const& b) {
    return compare(a, b, naturally);
}

int strnatcmp(string const& a, string const& b) {
    return compare(a, b, naturally);
}

int strnatcmp(char const* a, char const* b) {
    return strnatcmp(std::string(a), std::string(b));
}

int strnatcmp(wchar_t const* a, wchar_t const* b) {
    return strnatcmp(string(a), string(b));
}

} // namespace Strings
