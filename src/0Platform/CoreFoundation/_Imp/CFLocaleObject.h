/// The locale object, and the name that the environment gives the process's locale.
#ifndef QORN_0PLATFORM_CFLOCALEOBJECT_H
#define QORN_0PLATFORM_CFLOCALEOBJECT_H

#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <CoreFoundation/CFLocale.h>

#include <cstddef>

struct __CFLocale : CFPlatform::Object {
    using CFPlatform::Object::Object;

    // A longer name is no locale that any system or ICU knows.
    static constexpr std::size_t capacity = 64;

    /// Language and territory ("tr_TR", "lt"); empty for the root locale.
    char identifier[capacity];
};

namespace CFPlatform {

/// The first of LC_ALL, LC_CTYPE and LANG that is set and not empty, codeset and modifier
/// included; "" without any. Points into the environment: valid until that changes.
char const* environmentLocale() noexcept;

/// The locale's name as ICU takes it. A null locale is the root locale.
char const* identifierOf(CFLocaleRef locale) noexcept;

} // namespace CFPlatform

#endif
