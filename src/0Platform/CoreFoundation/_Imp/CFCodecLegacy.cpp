// Which legacy encodings are served, and where each has its table from.

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"
#include "0Platform/CoreFoundation/_Imp/CFCodecTableMaker.h"
#include "0Platform/CoreFoundation/_Imp/Tables/CFLegacyTables.h"

#include <CoreFoundation/CFStringEncodingExt.h>

#include <new>

namespace CFPlatform {
namespace {

// The one codec that `make` makes, at its first use. It is never destroyed, since destructors that
// run at exit convert strings too. Where memory is short, the next use tries again.
template <std::unique_ptr<TableCodec> (*make)()>
Codec const* codecOnce() noexcept {
    try {
        static Codec const* const codec = make().release();
        return codec;
    } catch (std::bad_alloc const&) {
        return nullptr;
    }
}

template <DecodeTable const& table, Composition composition>
std::unique_ptr<TableCodec> makeOfTable() {
    return makeTableCodec(table, composition);
}

template <char const* const& name, Composition composition>
std::unique_ptr<TableCodec> makeOfConverter() {
    return makeConverterCodec(name, composition);
}

template <DecodeTable const& table, Composition composition = Composition::none>
Codec const* tableCodec() noexcept {
    return codecOnce<makeOfTable<table, composition>>();
}

template <char const* const& name, Composition composition = Composition::none>
Codec const* converterCodec() noexcept {
    return codecOnce<makeOfConverter<name, composition>>();
}

// ICU's names of its converters. Full names, each of one table alone: a short one such as
// "ibm-943" is an alias, and that of another table in another release.
constexpr char const* macRoman = "macos-0_2-10.2";
constexpr char const* macGreek = "macos-6_2-10.4";
constexpr char const* macCyrillic = "macos-7_3-10.2";
constexpr char const* japanese = "ibm-943_P15A-2003";
constexpr char const* simplifiedChinese = "windows-936-2000";
constexpr char const* traditionalChinese = "windows-950-2000";
constexpr char const* korean = "windows-949-2000";
constexpr char const* hebrew = "ibm-862_P100-1995";
constexpr char const* arabic = "ibm-864_X110-1999";

} // namespace

Codec const* findLegacyCodec(CFStringEncoding encoding) noexcept {
    switch (encoding) {
    case kCFStringEncodingISOLatin1:
        return tableCodec<tableISOLatin1, Composition::canonical>();
    case kCFStringEncodingWindowsLatin1:
        return tableCodec<tableWindowsLatin1, Composition::canonical>();
    case kCFStringEncodingMacRoman:
        return converterCodec<macRoman, Composition::canonical>();
    case kCFStringEncodingMacGreek:
        return converterCodec<macGreek>();
    case kCFStringEncodingMacCyrillic:
        return converterCodec<macCyrillic>();
    case kCFStringEncodingDOSJapanese:
        return converterCodec<japanese>();
    case kCFStringEncodingDOSChineseSimplif:
        return converterCodec<simplifiedChinese>();
    case kCFStringEncodingDOSChineseTrad:
        return converterCodec<traditionalChinese>();
    case kCFStringEncodingDOSKorean:
        return converterCodec<korean>();
    case kCFStringEncodingDOSHebrew:
        return converterCodec<hebrew>();
    case kCFStringEncodingDOSArabic:
        return converterCodec<arabic>();
    case kCFStringEncodingMacJapanese:
        return tableCodec<tableMacJapanese>();
    case kCFStringEncodingMacChineseSimp:
        return tableCodec<tableMacChineseSimp>();
    case kCFStringEncodingMacChineseTrad:
        return tableCodec<tableMacChineseTrad>();
    case kCFStringEncodingMacKorean:
        return tableCodec<tableMacKorean>();
    case kCFStringEncodingMacArabic:
        return tableCodec<tableMacArabic>();
    case kCFStringEncodingMacHebrew:
        return tableCodec<tableMacHebrew>();
    case kCFStringEncodingMacThai:
        return tableCodec<tableMacThai>();
    case kCFStringEncodingWindowsKoreanJohab:
        return tableCodec<tableWindowsKoreanJohab>();
    default:
        return nullptr;
    }
}

} // namespace CFPlatform
