/// The one list of named encodings: X(name, platform value), in the order of their numbers from 0.
///
/// The numbers are part of the interface: they appear in message parameters. The families are the
/// classic script systems of the Macintosh, the Windows code pages, the Unix names, ISO Latin 1
/// and the Unicode forms. An encoding of which the platform has no own value is read and written
/// as UTF-16 in host order (kCFStringEncodingUnicode), and nothing reports it.
#ifndef QORN_1BASE_ENCODINGLIST_H
#define QORN_1BASE_ENCODINGLIST_H

/// Calls X for each encoding, with its name and the value that the platform has for it.
#define QORN_ENCODING_LIST(X)                                                                      \
    X(Current, CFStringGetSystemEncoding())                                                        \
    X(MacRoman, kCFStringEncodingMacRoman)                                                         \
    X(MacJapanese, kCFStringEncodingMacJapanese)                                                   \
    X(MacSimplifiedChinese, kCFStringEncodingMacChineseSimp)                                       \
    X(MacTraditionalChinese, kCFStringEncodingMacChineseTrad)                                      \
    X(MacKorean, kCFStringEncodingMacKorean)                                                       \
    X(MacArabic, kCFStringEncodingMacArabic)                                                       \
    X(MacHebrew, kCFStringEncodingMacHebrew)                                                       \
    X(MacGreek, kCFStringEncodingMacGreek)                                                         \
    X(MacRussian, kCFStringEncodingMacCyrillic)                                                    \
    X(MacRSymbol, kCFStringEncodingUnicode)                                                        \
    X(MacDevanagari, kCFStringEncodingMacDevanagari)                                               \
    X(MacGurmukhi, kCFStringEncodingMacGurmukhi)                                                   \
    X(MacGujarati, kCFStringEncodingMacGujarati)                                                   \
    X(MacOriya, kCFStringEncodingMacOriya)                                                         \
    X(MacBengali, kCFStringEncodingMacBengali)                                                     \
    X(MacTamil, kCFStringEncodingMacTamil)                                                         \
    X(MacTelugu, kCFStringEncodingMacTelugu)                                                       \
    X(MacKannada, kCFStringEncodingMacKannada)                                                     \
    X(MacMalayalam, kCFStringEncodingMacMalayalam)                                                 \
    X(MacSinhalese, kCFStringEncodingMacSinhalese)                                                 \
    X(MacBurmese, kCFStringEncodingMacBurmese)                                                     \
    X(MacKhmer, kCFStringEncodingMacKhmer)                                                         \
    X(MacThai, kCFStringEncodingMacThai)                                                           \
    X(MacLaotian, kCFStringEncodingMacLaotian)                                                     \
    X(MacGeorgian, kCFStringEncodingMacGeorgian)                                                   \
    X(MacArmenian, kCFStringEncodingMacArmenian)                                                   \
    X(MacMaldivian, kCFStringEncodingUnicode)                                                      \
    X(MacTibetan, kCFStringEncodingMacTibetan)                                                     \
    X(MacMongolian, kCFStringEncodingMacMongolian)                                                 \
    X(MacGeez, kCFStringEncodingUnicode)                                                           \
    X(MacVietnamese, kCFStringEncodingMacVietnamese)                                               \
    X(MacSindhi, kCFStringEncodingUnicode)                                                         \
    X(WinAnsi, kCFStringEncodingWindowsLatin1)                                                     \
    X(WinJapanese, kCFStringEncodingDOSJapanese)                                                   \
    X(WinSimplifiedChinese, kCFStringEncodingDOSChineseSimplif)                                    \
    X(WinTraditionalChinese, kCFStringEncodingDOSChineseTrad)                                      \
    X(WinKorean, kCFStringEncodingDOSKorean)                                                       \
    X(WinArabic, kCFStringEncodingDOSArabic)                                                       \
    X(WinHebrew, kCFStringEncodingDOSHebrew)                                                       \
    X(WinSymbol, kCFStringEncodingUnicode)                                                         \
    X(WinShiftJIS, kCFStringEncodingDOSJapanese)                                                   \
    X(WinPRC, kCFStringEncodingDOSChineseSimplif)                                                  \
    X(WinBig5, kCFStringEncodingDOSChineseTrad)                                                    \
    X(WinWansung, kCFStringEncodingDOSKorean)                                                      \
    X(WinJohab, kCFStringEncodingWindowsKoreanJohab)                                               \
    X(UNIXJapanese, kCFStringEncodingDOSJapanese)                                                  \
    X(UNIXSimplifiedChinese, kCFStringEncodingDOSChineseSimplif)                                   \
    X(UNIXTraditionalChinese, kCFStringEncodingDOSChineseTrad)                                     \
    X(UNIXKorean, kCFStringEncodingDOSKorean)                                                      \
    X(UNIXArabic, kCFStringEncodingDOSArabic)                                                      \
    X(UNIXHebrew, kCFStringEncodingDOSHebrew)                                                      \
    X(ISO8859_1, kCFStringEncodingISOLatin1)                                                       \
    X(UTF8, kCFStringEncodingUTF8)                                                                 \
    X(UTF16, kCFStringEncodingUTF16LE)                                                             \
    X(UTF32, kCFStringEncodingUTF32LE)                                                             \
    X(UTF16CanonicalComposed, kCFStringEncodingMacHFS)

#endif
