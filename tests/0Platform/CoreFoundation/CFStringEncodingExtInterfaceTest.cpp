// Names, values and types of CFStringEncodingExt.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isKeptIn<CFStringEncodings, CFIndex>);
static_assert(kCFStringEncodingMacJapanese == 1);
static_assert(kCFStringEncodingMacChineseTrad == 2);
static_assert(kCFStringEncodingMacKorean == 3);
static_assert(kCFStringEncodingMacArabic == 4);
static_assert(kCFStringEncodingMacHebrew == 5);
static_assert(kCFStringEncodingMacGreek == 6);
static_assert(kCFStringEncodingMacCyrillic == 7);
static_assert(kCFStringEncodingMacDevanagari == 9);
static_assert(kCFStringEncodingMacGurmukhi == 10);
static_assert(kCFStringEncodingMacGujarati == 11);
static_assert(kCFStringEncodingMacOriya == 12);
static_assert(kCFStringEncodingMacBengali == 13);
static_assert(kCFStringEncodingMacTamil == 14);
static_assert(kCFStringEncodingMacTelugu == 15);
static_assert(kCFStringEncodingMacKannada == 16);
static_assert(kCFStringEncodingMacMalayalam == 17);
static_assert(kCFStringEncodingMacSinhalese == 18);
static_assert(kCFStringEncodingMacBurmese == 19);
static_assert(kCFStringEncodingMacKhmer == 20);
static_assert(kCFStringEncodingMacThai == 21);
static_assert(kCFStringEncodingMacLaotian == 22);
static_assert(kCFStringEncodingMacGeorgian == 23);
static_assert(kCFStringEncodingMacArmenian == 24);
static_assert(kCFStringEncodingMacChineseSimp == 25);
static_assert(kCFStringEncodingMacTibetan == 26);
static_assert(kCFStringEncodingMacMongolian == 27);
static_assert(kCFStringEncodingMacVietnamese == 30);
static_assert(kCFStringEncodingMacHFS == 255);
static_assert(kCFStringEncodingDOSHebrew == 1047);
static_assert(kCFStringEncodingDOSArabic == 1049);
static_assert(kCFStringEncodingDOSJapanese == 1056);
static_assert(kCFStringEncodingDOSChineseSimplif == 1057);
static_assert(kCFStringEncodingDOSKorean == 1058);
static_assert(kCFStringEncodingDOSChineseTrad == 1059);
static_assert(kCFStringEncodingWindowsKoreanJohab == 1296);

} // namespace
