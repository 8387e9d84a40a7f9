/// The locale object, and the name that the environment gives the process's locale.
#ifndef QORN_0PLATFORM_CFLOCALEOBJECT_H
#define QORN_0PLATFORM_CFLOCALEOBJECT_H

#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <CoreFoundation/CFLocale.h>

#include <cstddef>

namespace CFPlatform {

/// Language, script and territory as ICU takes them ("tr_TR", "sr_Latn_RS", "lt").
struct LocaleName {
    // A longer name is no locale that any system or ICU knows.
    static constexpr std::size_t capacity = 64;

    char text[capacity];
};

} // namespace CFPlatform

struct __CFLocale : CFPlatform::Object {
    using CFPlatform::Object::Object;

    /// Of case conversion; empty for the root locale.
    CFPlatform::LocaleName characters;

    /// Of dates; empty for the root locale, "C" for what is no locale's name.
    CFPlatform::LocaleName dates;

    /// Of measures; "C" for what is no locale's name.
    CFPlatform::LocaleName measures;
};

namespace CFPlatform {

/// The first of LC_ALL, `category` and LANG that is set and not empty, codeset and modifier
/// included; "" without any. Points into the environment: valid until that changes.
char const* environmentLocale(char const* category) noexcept;

/// The locale's names as ICU takes them. A null locale is the root locale.
char const* characterIdentifierOf(CFLocaleRef locale) noexcept;
char const* dateIdentifierOf(CFLocaleRef locale) noexcept;

/// The same for measures, where it is "C": ICU takes the empty name for its own default.
char const* measureIdentifierOf(CFLocaleRef locale) noexcept;

} // namespace CFPlatform

#endif
