/// The one road by which a value of any type becomes text, and text becomes a number.
///
///     StdUtil::stream_cast<Strings::string>(42);                      // L"42"
///     StdUtil::stream_cast<int>(Strings::string(L" 12abc"));          // 12
///     StdUtil::stream_cast<Strings::string>(std::string("\xC3\xA9")); // L"\u00E9"
///
/// A type takes part by having an output operator for the wide stream. A cast is made by the
/// stream of the default locale, except from one string kind to another, which goes through
/// Encoding::convert. A `char` array is no such kind: the stream widens its bytes one by one and
/// decodes nothing, while the same bytes behind a `char const*` are decoded as UTF-8.
///
/// A text may go on behind its number: what follows is not looked at. A stream left with failbit or
/// badbit ends in Detail::throwStreamCastError; eofbit alone is no failure. An exception that a
/// type's own operator throws passes.
///
/// There is no shared state: casts may run on any thread.
#ifndef QORN_1BASE_STDUTILSTREAMCAST_H
#define QORN_1BASE_STDUTILSTREAMCAST_H

#include "1Base/StdUtil/StdUtilLocale.h"
#include "1Base/StdUtil/StdUtilStreamCastFailures.h"
#include "1Base/StdUtil/_Imp/StdUtilDecimal.h"
#include "1Base/Streams/StreamsBuffer.h"
#include "1Base/Streams/StreamsString.h"
#include "1Base/Strings/StringsKinds.h"

#include <string>
#include <type_traits>
#include <typeinfo>

namespace StdUtil {

/// One pair of types: a static `cast`. Never made as an object.
template <class TTarget, class TSource>
class CStreamCaster;

/// Text from anything that can be written to a stream.
template <class TChar, class TTraits, class TAllocator, class TSource>
class CStreamCaster<std::basic_string<TChar, TTraits, TAllocator>, TSource> {
  public:
    /// The text.
    using TString = std::basic_string<TChar, TTraits, TAllocator>;

    /// Writes the value to a stream; raises TExcStreamCast where that fails.
    static TString cast(TSource const& source) {
        if constexpr (std::is_same_v<TString, Strings::string> &&
                      Detail::isWrittenAsDecimal<TSource>) {
            using TNumber =
                std::conditional_t<std::is_signed_v<TSource>, long long, unsigned long long>;
            if (isGlobalLocaleClassic())
                return Detail::writeDecimal(static_cast<TNumber>(source));
        }
        Streams::Detail::basic_ostringstream<TChar, TTraits, TAllocator> stream(
            static_cast<unsigned int>(std::ios_base::out));
        stream << source;
        if (stream.fail())
            Detail::throwStreamCastError(__FILE__, __LINE__, __PRETTY_FUNCTION__, __DATE__,
                                         __TIME__, typeid(TSource).name(), typeid(TString).name());
        return stream.str();
    }
};

/// A number from text.
template <class TTarget, class TChar, class TTraits, class TAllocator>
class CStreamCaster<TTarget, std::basic_string<TChar, TTraits, TAllocator>> {
  public:
    /// The text.
    using TString = std::basic_string<TChar, TTraits, TAllocator>;

    /// Reads the number; raises TExcStreamCast where there is none.
    static TTarget cast(TString const& source) {
        TTarget target = 0;
        if constexpr (std::is_same_v<TString, Strings::string> &&
                      Detail::isReadAsDecimal<TTarget>) {
            if (isGlobalLocaleClassic() && Detail::readDecimal(source, target))
                return target;
        }
        Streams::basic_isbufstream<TChar, TTraits> stream(source.data(), source.size());
        stream >> target;
        if (stream.fail())
            Detail::throwStreamCastError(__FILE__, __LINE__, __PRETTY_FUNCTION__, __DATE__,
                                         __TIME__, typeid(TString).name(), typeid(TTarget).name());
        return target;
    }
};

/// Text from text uses no stream. Both schemes above would fit, so each pair stands by itself.
template <>
class CStreamCaster<Strings::string, Strings::string> {
  public:
    /// A copy.
    static Strings::string cast(Strings::string const& source) { return source; }
};

/// UTF-8.
template <>
class CStreamCaster<Strings::string, std::string> {
  public:
    /// Decodes; raises the conversion failure for a malformed text.
    static Strings::string cast(std::string const& source);
};

/// Zero-terminated UTF-8.
template <>
class CStreamCaster<Strings::string, char const*> {
  public:
    /// Decodes; raises the conversion failure for a malformed text.
    static Strings::string cast(char const* source);
};

/// A zero-terminated wide text.
template <>
class CStreamCaster<Strings::string, wchar_t const*> {
  public:
    /// A copy.
    static Strings::string cast(wchar_t const* source);
};

template <>
class CStreamCaster<Strings::string, char*> : public CStreamCaster<Strings::string, char const*> {};

template <>
class CStreamCaster<Strings::string, wchar_t*>
    : public CStreamCaster<Strings::string, wchar_t const*> {};

// The pairs that the system uses everywhere.
extern template class CStreamCaster<Strings::string, bool>;
extern template class CStreamCaster<Strings::string, char>;
extern template class CStreamCaster<Strings::string, wchar_t>;
extern template class CStreamCaster<Strings::string, unsigned char>;
extern template class CStreamCaster<Strings::string, unsigned short>;
extern template class CStreamCaster<Strings::string, int>;
extern template class CStreamCaster<Strings::string, unsigned int>;
extern template class CStreamCaster<Strings::string, long>;
extern template class CStreamCaster<Strings::string, unsigned long>;
extern template class CStreamCaster<unsigned short, Strings::string>;
extern template class CStreamCaster<int, Strings::string>;
extern template class CStreamCaster<unsigned int, Strings::string>;
extern template class CStreamCaster<long, Strings::string>;

/// Casts `source` to TTarget: a wide string from any type, or a number from a wide string. A
/// pointer to characters is a zero-terminated text and must not be null.
template <class TTarget, class TSource>
TTarget stream_cast(TSource const& source) {
    return CStreamCaster<TTarget, TSource>::cast(source);
}

} // namespace StdUtil

#endif
