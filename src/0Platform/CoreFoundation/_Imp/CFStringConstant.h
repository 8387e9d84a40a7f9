/// Strings that the platform itself owns: keys and names that are there before any initialiser
/// runs.
///
///     StringConstant key(u"CFBundleName");
///     CFStringRef const kCFBundleNameKey = &key;
#ifndef QORN_0PLATFORM_CFSTRINGCONSTANT_H
#define QORN_0PLATFORM_CFSTRINGCONSTANT_H

#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"

#include <cstddef>

namespace CFPlatform {

/// A static object. It outlives each release, also one too many, as the framework's constants do.
template <std::size_t size>
struct StringConstant : __CFString {
    constexpr explicit StringConstant(char16_t const (&text)[size])
        : __CFString(nullptr, storage, static_cast<CFIndex>(size - 1), constantOwners), storage() {
        for (std::size_t i = 0; i < size; ++i)
            storage[i] = static_cast<UniChar>(text[i]);
    }

    UniChar storage[size];
};

} // namespace CFPlatform

#endif
