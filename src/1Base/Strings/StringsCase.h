/// Upper and lower case in the language of the user.
///
///     Strings::string title = L"stra\u00DFe";
///     Strings::toUpper(title);                        // title == L"STRASSE"
///     Strings::toLower(Strings::string(L"TITLE"));    // L"title", under LANG=tr_TR L"t\u0131tle"
///
/// The mapping is the full one of Unicode: a text can change its length. The language is that of
/// the process's current locale, read at each call. A text ends at its first zero element: what
/// follows is cut off. Narrow text is UTF-8, wide text is UTF-32; malformed text ends in the
/// conversion's failure and stays unchanged. Every function may be called on any thread.
#ifndef QORN_1BASE_STRINGSCASE_H
#define QORN_1BASE_STRINGSCASE_H

#include "1Base/Strings/StringsKinds.h"

namespace Strings {

/// @{
/// Changes `text` in place and returns it.
std::string& toUpper(std::string& text);
string& toUpper(string& text);
std::string& toLower(std::string& text);
string& toLower(string& text);
/// @}

/// Returns the text in lower case. A variable that is not constant is changed in place instead, by
/// the form above.
string toLower(string const& text);

} // namespace Strings

#endif
