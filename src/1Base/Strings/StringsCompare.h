/// Comparison that ignores case, and the natural order of names.
///
///     Strings::stricmp(L"stra\u00DFe", L"STRASSE");   // 0
///     Strings::stricmp("file9", "file10");         // 1: "9" comes after "1"
///     Strings::strnatcmp("file9", "file10");       // -1: 9 is less than 10
///     Strings::strnatcmp(L"Zo\u00EB", L"zoe");     // 0
///
/// All of them answer exactly -1, 0 or 1: whether `a` sorts before, with or after `b`. Both texts
/// go through the platform's string, so narrow text is UTF-8, wide text is UTF-32, and malformed
/// text ends in the conversion's failure. An embedded zero is a character like any other. A null
/// pointer is not accepted. Order is by code point and knows no locale; it is that of the platform,
/// whose answers for unusual texts need not be transitive, nor the opposite of each other with `a`
/// and `b` swapped. Every function may be called on any thread.
#ifndef QORN_1BASE_STRINGSCOMPARE_H
#define QORN_1BASE_STRINGSCOMPARE_H

#include "1Base/Strings/StringsKinds.h"

namespace Strings {

/// @{
/// Compares without regard to case. An accented letter differs from the plain one.
int stricmp(char const* a, char const* b);
int stricmp(wchar_t const* a, wchar_t const* b);
int stricmp(std::string const& a, std::string const& b);
int stricmp(string const& a, string const& b);
/// @}

/// @{
/// Compares without regard to case and accents, and orders runs of ASCII digits by their numeric
/// value, however long; leading zeros never matter.
int strnatcmp(char const* a, char const* b);
int strnatcmp(wchar_t const* a, wchar_t const* b);
int strnatcmp(std::string const& a, std::string const& b);
int strnatcmp(string const& a, string const& b);
/// @}

} // namespace Strings

#endif
