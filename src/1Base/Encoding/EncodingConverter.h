/// The one way from one string kind to another.
///
///     std::string const utf8 = Encoding::convert<std::string>(Strings::string(L"caf\u00E9"));
///     // utf8 == "caf\xC3\xA9"
///
/// Input is read strictly: malformed UTF-8, and a UTF-32 element that is no code point, raise.
/// A character that the target lacks does not: it comes out as "?". All state is on the stack, so
/// every function may be called on any thread. A null pointer is not accepted anywhere.
#ifndef QORN_1BASE_ENCODINGCONVERTER_H
#define QORN_1BASE_ENCODINGCONVERTER_H

#include "1Base/Encoding/EncodingFailures.h"
#include "1Base/Encoding/EncodingSysEncoding.h"
#include "1Base/Strings/StringsKinds.h"

#include <string>
#include <type_traits>

namespace Encoding {

/// One pair of kinds: a static `convert`. A pair without a specialisation of its own reports an
/// endless recursion when it is called.
template <class TTarget, class TSource>
class CConverter {
  public:
    /// Fails as an assertion: there is no road from TSource to TTarget.
    static TTarget convert(TSource const&) { Detail::reportRecursion(); }
};

/// A kind into itself: the argument, by reference.
template <class TString>
class CConverter<TString, TString> {
  public:
    /// The argument itself.
    static TString const& convert(TString const& source) { return source; }
};

/// UTF-8 into UTF-16.
template <>
class CConverter<Strings::stringUTF16, std::string> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static Strings::stringUTF16 convert(std::string const& source);
};

/// UTF-16 into UTF-8. An unpaired surrogate raises.
template <>
class CConverter<std::string, Strings::stringUTF16> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static std::string convert(Strings::stringUTF16 const& source);
};

/// UTF-32 into UTF-16.
template <>
class CConverter<Strings::stringUTF16, Strings::string> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static Strings::stringUTF16 convert(Strings::string const& source);
};

/// UTF-16 into UTF-32.
template <>
class CConverter<Strings::string, Strings::stringUTF16> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static Strings::string convert(Strings::stringUTF16 const& source);
};

/// Bytes in a named encoding. Most legacy encodings hold only part of Unicode: what they lack is
/// written as "?".
template <>
class CConverter<Strings::stringUTF16, std::basic_string<unsigned char>> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static Strings::stringUTF16 convert(std::basic_string<unsigned char> const& source,
                                        ESysEncoding encoding = eseISO8859_1);
};

/// UTF-16 into bytes in a named encoding; what it lacks is written as "?".
template <>
class CConverter<std::basic_string<unsigned char>, Strings::stringUTF16> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static std::basic_string<unsigned char> convert(Strings::stringUTF16 const& source,
                                                    ESysEncoding encoding = eseISO8859_1);
};

/// UTF-32 into UTF-8.
template <>
class CConverter<std::string, Strings::string> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static std::string convert(Strings::string const& source);
};

/// UTF-8 into UTF-32.
template <>
class CConverter<Strings::string, std::string> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static Strings::string convert(std::string const& source);
};

/// Wide text into bytes is always ISO Latin 1; another encoding goes through UTF-16.
template <>
class CConverter<std::basic_string<unsigned char>, Strings::string> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static std::basic_string<unsigned char> convert(Strings::string const& source);
};

/// A zero-terminated text is a string of its kind.
template <class TTarget>
class CConverter<TTarget, char const*> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static TTarget convert(char const* source) {
        return CConverter<TTarget, std::string>::convert(source);
    }
};

/// The same for a wide text.
template <class TTarget>
class CConverter<TTarget, wchar_t const*> {
  public:
    /// Converts; raises the conversion failure for a malformed source.
    static TTarget convert(wchar_t const* source) {
        return CConverter<TTarget, Strings::string>::convert(source);
    }
};

namespace Detail {

/// The kind behind an argument: an array or a pointer to characters that are not constant is a
/// zero-terminated text like any other.
template <class TSource>
struct CSourceKind {
    using TDecayed = std::decay_t<TSource>;
    using TResult =
        std::conditional_t<std::is_pointer_v<TDecayed>,
                           std::add_pointer_t<std::add_const_t<std::remove_pointer_t<TDecayed>>>,
                           TDecayed>;
};

} // namespace Detail

/// Converts `source`, a string of any kind or a zero-terminated narrow or wide text, into TTarget.
/// Raises the conversion failure where the source is malformed.
template <class TTarget, class TSource>
TTarget convert(TSource const& source) {
    return CConverter<TTarget, typename Detail::CSourceKind<TSource>::TResult>::convert(source);
}

} // namespace Encoding

#endif
