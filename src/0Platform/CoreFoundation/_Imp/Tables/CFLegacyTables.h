/// The encodings that ICU has no table for, as read-only data.
///
/// `generate_legacy_tables.py` writes CFLegacyTables.cpp from `legacy_tables.tsv`. A test runs it
/// again and compares.
#ifndef QORN_0PLATFORM_CFLEGACYTABLES_H
#define QORN_0PLATFORM_CFLEGACYTABLES_H

#include "0Platform/CoreFoundation/_Imp/CFDecodeTable.h"

namespace CFPlatform {

extern DecodeTable const tableMacJapanese;
extern DecodeTable const tableMacChineseSimp;
extern DecodeTable const tableMacChineseTrad;
extern DecodeTable const tableMacKorean;
extern DecodeTable const tableMacArabic;
extern DecodeTable const tableMacHebrew;
extern DecodeTable const tableMacThai;
extern DecodeTable const tableWindowsKoreanJohab;

} // namespace CFPlatform

#endif
