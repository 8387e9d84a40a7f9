// Full case mapping by ICU: Unicode's SpecialCasing and the rules of the locale's language.

#include "0Platform/CoreFoundation/_Imp/CFLocaleObject.h"
#include "0Platform/CoreFoundation/_Imp/CFStringCaseContext.h"
#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"

#include <unicode/uloc.h>
#include <unicode/ustring.h>

#include <cstdlib>
#include <cstring>

using namespace CFPlatform;

namespace {

constexpr char const* rootLocale = "";

// u_strToUpper or u_strToLower.
using TMapping = int32_t (*)(UChar* target, int32_t capacity, UChar const* source, int32_t length,
                             char const* locale, UErrorCode* status);

void mapCase(__CFString& string, char const* locale, TMapping map) {
    int32_t const length = static_cast<int32_t>(string.length);
    UErrorCode status = U_BUFFER_OVERFLOW_ERROR;
    int32_t needed = length;
    // Most texts keep their length; the second pass is for those that grow.
    for (int pass = 0; pass < 2 && status == U_BUFFER_OVERFLOW_ERROR; ++pass) {
        int32_t const capacity = needed;
        UniChar* const units = allocateUnits(capacity);
        status = U_ZERO_ERROR;
        needed = map(reinterpret_cast<UChar*>(units), capacity,
                     reinterpret_cast<UChar const*>(string.units), length, locale, &status);
        if (U_SUCCESS(status))
            replaceUnits(string, units, needed);
        else
            std::free(units);
    }
}

class Language {
  public:
    explicit Language(char const* locale) {
        UErrorCode status = U_ZERO_ERROR;
        uloc_getLanguage(locale, code_, ULOC_LANG_CAPACITY, &status);
        if (U_FAILURE(status))
            code_[0] = '\0';
    }

    bool is(char const* code) const { return std::strcmp(code_, code) == 0; }

  private:
    char code_[ULOC_LANG_CAPACITY];
};

} // namespace

extern "C" void CFStringUppercase(CFMutableStringRef string, CFLocaleRef locale) {
    char const* const identifier = characterIdentifierOf(locale);
    bool const isGreek = Language(identifier).is("el");
    if (isGreek)
        removeTonos(string);
    mapCase(*string, isGreek ? rootLocale : identifier, u_strToUpper);
}

extern "C" void CFStringLowercase(CFMutableStringRef string, CFLocaleRef locale) {
    char const* const identifier = characterIdentifierOf(locale);
    Language const language(identifier);
    resolveSigmas(string->units, string->length);
    if (language.is("tr") || language.is("az"))
        resolveDotlessI(string->units, string->length);
    mapCase(*string, identifier, u_strToLower);
}
