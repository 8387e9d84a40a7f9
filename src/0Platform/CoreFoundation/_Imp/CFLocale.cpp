#include "0Platform/CoreFoundation/_Imp/CFCreate.h"
#include "0Platform/CoreFoundation/_Imp/CFLocaleObject.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <initializer_list>

using namespace CFPlatform;

namespace {

bool isLetter(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

bool isNamePart(char c) {
    return isLetter(c) || (c >= '0' && c <= '9') || c == '_';
}

// Where the language in front ends.
std::size_t endOfLanguage(char const* name, std::size_t length) {
    std::size_t end = 0;
    while (end < length && isLetter(name[end]))
        ++end;
    return end;
}

// True for a language of two or three letters, alone or with a territory behind "_".
bool isLocaleName(char const* name, std::size_t length) {
    std::size_t const language = endOfLanguage(name, length);
    if (language < 2 || language > 3 || (language < length && name[language] != '_'))
        return false;
    for (std::size_t i = language; i < length; ++i)
        if (!isNamePart(name[i]))
            return false;
    return true;
}

// The script that a name's modifier stands for, in the form of a part of ICU's names.
char const* scriptOf(char const* name) {
    struct Script {
        char const* modifier;
        char const* part;
    };
    constexpr Script scripts[] = {
        {"@latin", "_Latn"}, {"@cyrillic", "_Cyrl"}, {"@devanagari", "_Deva"}};
    char const* const modifier = std::strchr(name, '@');
    for (Script const& script : scripts) {
        if (modifier != nullptr && std::strcmp(modifier, script.modifier) == 0)
            return script.part;
    }
    return "";
}

// Brings a name of the environment into ICU's form, with `script` behind the language. What is no
// locale's name, or too long, becomes `otherwise`.
LocaleName nameOf(char const* name, char const* script, char const* otherwise) {
    LocaleName result;
    std::size_t const length = std::strcspn(name, ".@");
    if (length < LocaleName::capacity && isLocaleName(name, length)) {
        auto const language = static_cast<int>(endOfLanguage(name, length));
        int const written =
            std::snprintf(result.text, LocaleName::capacity, "%.*s%s%.*s", language, name, script,
                          static_cast<int>(length) - language, name + language);
        if (written < static_cast<int>(LocaleName::capacity))
            return result;
    }
    std::snprintf(result.text, LocaleName::capacity, "%s", otherwise);
    return result;
}

} // namespace

namespace CFPlatform {

char const* environmentLocale(char const* category) noexcept {
    for (char const* const variable : {"LC_ALL", category, "LANG"}) {
        char const* const value = std::getenv(variable);
        if (value != nullptr && *value != '\0')
            return value;
    }
    return "";
}

char const* characterIdentifierOf(CFLocaleRef locale) noexcept {
    return locale != nullptr ? locale->characters.text : "";
}

char const* dateIdentifierOf(CFLocaleRef locale) noexcept {
    return locale != nullptr ? locale->dates.text : "";
}

char const* measureIdentifierOf(CFLocaleRef locale) noexcept {
    return locale != nullptr ? locale->measures.text : "C";
}

} // namespace CFPlatform

extern "C" CFLocaleRef CFLocaleCopyCurrent(void) {
    auto* const locale = createObject<__CFLocale>();
    if (locale == nullptr)
        return nullptr;
    locale->characters = nameOf(environmentLocale("LC_CTYPE"), "", "");
    char const* const dates = environmentLocale("LC_TIME");
    locale->dates = nameOf(dates, scriptOf(dates), *dates == '\0' ? "" : "C");
    locale->measures = nameOf(environmentLocale("LC_MEASUREMENT"), "", "C");
    return locale;
}
