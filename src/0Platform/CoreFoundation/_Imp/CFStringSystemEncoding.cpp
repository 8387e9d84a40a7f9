// A locale's name is language[_territory][.codeset][@modifier] (POSIX). What the codeset names may
// be spelled with or without dashes and in either case.

#include "0Platform/CoreFoundation/_Imp/CFLocaleObject.h"

#include <CoreFoundation/CFStringEncodingExt.h>

#include <cstring>
#include <string>

namespace {

struct Codeset {
    char const* name; // lower-case letters and digits alone
    CFStringEncoding encoding;
};

// Codesets that a served encoding reads. EUC-KR and GB 2312 are parts of the code pages that stand
// for them here.
constexpr Codeset codesets[] = {
    {"iso88591", kCFStringEncodingISOLatin1},
    {"latin1", kCFStringEncodingISOLatin1},
    {"ibm819", kCFStringEncodingISOLatin1},
    {"cp819", kCFStringEncodingISOLatin1},
    {"cp1252", kCFStringEncodingWindowsLatin1},
    {"windows1252", kCFStringEncodingWindowsLatin1},
    {"sjis", kCFStringEncodingDOSJapanese},
    {"shiftjis", kCFStringEncodingDOSJapanese},
    {"cp932", kCFStringEncodingDOSJapanese},
    {"windows31j", kCFStringEncodingDOSJapanese},
    {"ibm943", kCFStringEncodingDOSJapanese},
    {"cp943", kCFStringEncodingDOSJapanese},
    {"gbk", kCFStringEncodingDOSChineseSimplif},
    {"cp936", kCFStringEncodingDOSChineseSimplif},
    {"windows936", kCFStringEncodingDOSChineseSimplif},
    {"gb2312", kCFStringEncodingDOSChineseSimplif},
    {"euccn", kCFStringEncodingDOSChineseSimplif},
    {"big5", kCFStringEncodingDOSChineseTrad},
    {"cp950", kCFStringEncodingDOSChineseTrad},
    {"windows950", kCFStringEncodingDOSChineseTrad},
    {"euckr", kCFStringEncodingDOSKorean},
    {"cp949", kCFStringEncodingDOSKorean},
    {"windows949", kCFStringEncodingDOSKorean},
    {"uhc", kCFStringEncodingDOSKorean},
    {"johab", kCFStringEncodingWindowsKoreanJohab},
    {"cp1361", kCFStringEncodingWindowsKoreanJohab},
    {"ibm862", kCFStringEncodingDOSHebrew},
    {"cp862", kCFStringEncodingDOSHebrew},
    {"ibm864", kCFStringEncodingDOSArabic},
    {"cp864", kCFStringEncodingDOSArabic},
    {"macgreek", kCFStringEncodingMacGreek},
    {"maccyrillic", kCFStringEncodingMacCyrillic},
};

// The codeset's letters and digits, in lower case whatever the C locale is.
std::string normalizedCodeset(char const* locale) {
    std::string codeset;
    char const* const dot = std::strchr(locale, '.');
    if (dot == nullptr)
        return codeset;
    for (char const* c = dot + 1; *c != '\0' && *c != '@'; ++c) {
        if (*c >= 'A' && *c <= 'Z')
            codeset += static_cast<char>(*c - 'A' + 'a');
        else if ((*c >= 'a' && *c <= 'z') || (*c >= '0' && *c <= '9'))
            codeset += *c;
    }
    return codeset;
}

} // namespace

extern "C" CFStringEncoding CFStringGetSystemEncoding(void) {
    std::string const codeset = normalizedCodeset(CFPlatform::environmentLocale("LC_CTYPE"));
    for (Codeset const& known : codesets) {
        if (codeset == known.name)
            return known.encoding;
    }
    return kCFStringEncodingMacRoman;
}
