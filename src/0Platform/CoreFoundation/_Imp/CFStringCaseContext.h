/// The places where the framework maps a character by its neighbours otherwise than ICU does.
/// Each function prepares a text so that ICU's mapping then gives the framework's result.
#ifndef QORN_0PLATFORM_CFSTRINGCASECONTEXT_H
#define QORN_0PLATFORM_CFSTRINGCASECONTEXT_H

#include <CoreFoundation/CFString.h>

namespace CFPlatform {

/// Before lower case: writes each capital sigma as the small one that it becomes, the final form
/// at the end of a word. A full stop or a colon ends a word, other than in ICU.
void resolveSigmas(UniChar* units, CFIndex length) noexcept;

/// Before Turkish and Azeri lower case: makes each I without a dot right behind it dotless. ICU
/// also takes a dot that stands behind other marks.
void resolveDotlessI(UniChar* units, CFIndex length) noexcept;

/// Before Greek upper case under the root locale: takes the tonos from composed vowels; a
/// dialytika stays, as a mark of its own. Letters with other accents keep all of them, and so do
/// letters whose accents are marks of their own. ICU takes all accents away, and puts in a
/// dialytika where two vowels would else be read as one.
void removeTonos(CFMutableStringRef string) noexcept;

} // namespace CFPlatform

#endif
