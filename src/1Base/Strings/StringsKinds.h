/// The string kinds. Each has one fixed encoding; a value never says at run time what it holds.
///
///     Strings::string const name = L"caf\u00E9";           // UTF-32, one element a code point
///     Strings::stringUTF8 const bytes = "caf\xC3\xA9";      // UTF-8, the same type as std::string
///
/// Bytes in a legacy encoding that the caller names are a std::basic_string<unsigned char>.
#ifndef QORN_1BASE_STRINGSKINDS_H
#define QORN_1BASE_STRINGSKINDS_H

#include "1Base/Strings/StringsCharTraits.h"
#include "1Base/TemplMeta/TemplMetaTag.h"

#include <string>

namespace Strings {
namespace Detail {

TEMPLMETA_TAG_NAME(EncUTF16);

/// Traits that differ from the standard ones by their type alone, so that text in an encoding is
/// a type of its own: no other std::basic_string<short> is taken for UTF-16.
template <class TTag, class TChar>
struct CCharTraits : std::char_traits<TChar> {};

} // namespace Detail

/// The general text type: UTF-32. All paths, messages and parameter values are of this kind.
using string = std::wstring;

/// The same type as `string`, named where the encoding matters.
using stringUTF32 = string;

/// UTF-8 bytes. A narrow string in this system is always UTF-8.
using stringUTF8 = std::string;

/// UTF-16 units in host order without a byte order mark: the hub of all conversion.
using stringUTF16 = std::basic_string<
    short, Detail::CCharTraits<TemplMeta::CTag<Detail::CTag_Name_EncUTF16<char const*>>, short>>;

static_assert(sizeof(wchar_t) == 4, "wide text holds one code point an element");
static_assert(sizeof(short) == 2, "the hub of conversion holds 16-bit units");

} // namespace Strings

#endif
