#include "1Base/Encoding/EncodingNormalize.h"

#include "1Base/Error/ErrorMacros.h"

#include <CoreFoundation/CoreFoundation.h>

#include <boost/smart_ptr/scoped_array.hpp>

namespace Encoding {
namespace {

CFStringNormalizationForm getMacNormalizationForm(EUTF16NormalizationForm form) {
    return form <= enfKC ? static_cast<CFStringNormalizationForm>(form)
                         : kCFStringNormalizationFormC;
}

} // namespace

Strings::stringUTF16 normalize(Strings::stringUTF16 const& source, EUTF16NormalizationForm form) {
    CFStringRef const ref = CFStringCreateWithCharacters(
        kCFAllocatorDefault, reinterpret_cast<UniChar const*>(source.data()),
        static_cast<CFIndex>(source.size()));
    ERROR_ASSERT(ref);
    CFMutableStringRef const mref = CFStringCreateMutableCopy(kCFAllocatorDefault, 0, ref);
    CFRelease(ref);
    ERROR_ASSERT(mref);
    CFStringNormalize(mref, getMacNormalizationForm(form));

    CFIndex const length = CFStringGetLength(mref);
    boost::scoped_array<short> units(new short[static_cast<std::size_t>(length) + 1]);
    CFStringGetCharacters(mref, CFRangeMake(0, length), reinterpret_cast<UniChar*>(units.get()));
    units[length] = 0;
    // The text ends at its first zero unit, not at its length: callers rely on the cut.
    Strings::stringUTF16 result(units.get());
    CFRelease(mref);
    return result;
}

} // namespace Encoding
