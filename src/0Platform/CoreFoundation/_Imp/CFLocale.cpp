#include "0Platform/CoreFoundation/_Imp/CFLocaleObject.h"

#include <cstdlib>
#include <cstring>
#include <initializer_list>
#include <new>

using namespace CFPlatform;

namespace {

void finalizeNothing(Object&) {}

bool isLetter(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

bool isNamePart(char c) {
    return isLetter(c) || (c >= '0' && c <= '9') || c == '_';
}

// True for a language of two or three letters, alone or with a territory behind "_". So "C",
// "POSIX" and names of other shapes fall back to the root locale.
bool isLocaleName(char const* name, std::size_t length) {
    std::size_t language = 0;
    while (language < length && isLetter(name[language]))
        ++language;
    if (language < 2 || language > 3 || (language < length && name[language] != '_'))
        return false;
    for (std::size_t i = language; i < length; ++i)
        if (!isNamePart(name[i]))
            return false;
    return true;
}

} // namespace

namespace CFPlatform {

char const* environmentLocale() noexcept {
    for (char const* const variable : {"LC_ALL", "LC_CTYPE", "LANG"}) {
        char const* const value = std::getenv(variable);
        if (value != nullptr && *value != '\0')
            return value;
    }
    return "";
}

char const* identifierOf(CFLocaleRef locale) noexcept {
    return locale != nullptr ? locale->identifier : "";
}

} // namespace CFPlatform

extern "C" CFLocaleRef CFLocaleCopyCurrent(void) {
    void* const memory = CFObjectAllocate_(sizeof(__CFLocale));
    if (memory == nullptr)
        return nullptr;
    auto* const locale = new (memory) __CFLocale(finalizeNothing);
    char const* const name = environmentLocale();
    std::size_t length = std::strcspn(name, ".@");
    if (length >= __CFLocale::capacity || !isLocaleName(name, length))
        length = 0;
    std::memcpy(locale->identifier, name, length);
    locale->identifier[length] = '\0';
    return locale;
}
