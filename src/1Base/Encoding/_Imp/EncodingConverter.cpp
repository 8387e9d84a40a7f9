// Every conversion goes through the platform's string type: into it from the source's bytes, then
// out of it in passes of bounded size.

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Encoding/_Imp/EncodingTable.h"

#include <boost/smart_ptr/scoped_array.hpp>

#include <algorithm>

namespace Encoding {
namespace {

// The most bytes that one pass reads, so that working memory stays bounded however long the text.
constexpr CFIndex passBytes = 8192;

// What stands in for a character that the target lacks.
constexpr UInt8 lossByte = '?';

template <class TString>
CFIndex byteCount(TString const& text) {
    return static_cast<CFIndex>(text.size() * sizeof(typename TString::value_type));
}

template <class TString>
CFStringRef createString(TString const& source, CFStringEncoding encoding, EEncoding named,
                         EEncoding given) {
    auto const* const bytes = reinterpret_cast<UInt8 const*>(source.data());
    CFStringRef const ref =
        CFStringCreateWithBytes(kCFAllocatorDefault, bytes, byteCount(source), encoding, false);
    if (ref == nullptr)
        Detail::throwConversionError("CFStringCreateWithBytes",
                                     "Could not create string with encoding " +
                                         getEncodingName(named),
                                     static_cast<ESysEncoding>(given));
    return ref;
}

// One call of CFStringGetBytes; a null buffer measures. Reading nothing is an error, and then the
// string stays unreleased.
CFIndex readBytes(CFStringRef ref, CFRange range, CFStringEncoding encoding, UInt8* buffer,
                  CFIndex size, CFIndex& used, EEncoding named, EEncoding given) {
    CFIndex const converted =
        CFStringGetBytes(ref, range, encoding, lossByte, false, buffer, size, &used);
    if (converted == 0)
        Detail::throwConversionError("CFStringGetBytes",
                                     "Could not get string with encoding " + getEncodingName(named),
                                     static_cast<ESysEncoding>(given));
    return converted;
}

// Reads the whole string into a text of the target kind and releases it.
template <class TTarget>
TTarget takeString(CFStringRef ref, CFStringEncoding encoding, EEncoding named, EEncoding given) {
    using TElement = typename TTarget::value_type;
    constexpr CFIndex width = sizeof(TElement);

    TTarget result;
    CFIndex const length = CFStringGetLength(ref);
    CFIndex used = 0;
    readBytes(ref, CFRangeMake(0, length), encoding, nullptr, 0, used, named, given);
    CFIndex const bufferBytes = std::min(used, passBytes);
    if (length < 1) {
        CFRelease(ref);
        return result;
    }
    result.reserve(static_cast<std::size_t>(used / width));
    CFRange rest = CFRangeMake(0, length);
    for (;;) {
        boost::scoped_array<TElement> const buffer(
            new TElement[static_cast<std::size_t>(bufferBytes / width)]);
        CFIndex const converted =
            readBytes(ref, rest, encoding, reinterpret_cast<UInt8*>(buffer.get()), bufferBytes,
                      used, named, given);
        result.append(buffer.get(), static_cast<std::size_t>(used / width));
        if (converted >= rest.length)
            break;
        rest = CFRangeMake(rest.location + converted, rest.length - converted);
    }
    CFRelease(ref);
    return result;
}

template <class TString>
Strings::stringUTF16 convertToUTF16_(TString const& source, EEncoding encoding) {
    if (source.empty())
        return Strings::stringUTF16();
    CFStringRef const ref = createString(source, findEncoding(encoding), encoding, encoding);
    return takeString<Strings::stringUTF16>(ref, kCFStringEncodingUnicode, eencUTF16, encoding);
}

template <class TString>
TString convertFromUTF16_(Strings::stringUTF16 const& source, EEncoding encoding) {
    if (source.empty())
        return TString();
    CFStringRef const ref = createString(source, kCFStringEncodingUnicode, eencUTF16, encoding);
    return takeString<TString>(ref, findEncoding(encoding), encoding, encoding);
}

} // namespace

Strings::stringUTF16
CConverter<Strings::stringUTF16, std::string>::convert(std::string const& source) {
    return convertToUTF16_(source, eencUTF8);
}

std::string
CConverter<std::string, Strings::stringUTF16>::convert(Strings::stringUTF16 const& source) {
    return convertFromUTF16_<std::string>(source, eencUTF8);
}

Strings::stringUTF16
CConverter<Strings::stringUTF16, Strings::string>::convert(Strings::string const& source) {
    return convertToUTF16_(source, eencUTF32);
}

Strings::string
CConverter<Strings::string, Strings::stringUTF16>::convert(Strings::stringUTF16 const& source) {
    return convertFromUTF16_<Strings::string>(source, eencUTF32);
}

Strings::stringUTF16 CConverter<Strings::stringUTF16, std::basic_string<unsigned char>>::convert(
    std::basic_string<unsigned char> const& source, ESysEncoding encoding) {
    return convertToUTF16_(source, static_cast<EEncoding>(encoding));
}

std::basic_string<unsigned char>
CConverter<std::basic_string<unsigned char>, Strings::stringUTF16>::convert(
    Strings::stringUTF16 const& source, ESysEncoding encoding) {
    return convertFromUTF16_<std::basic_string<unsigned char>>(source,
                                                               static_cast<EEncoding>(encoding));
}

std::string CConverter<std::string, Strings::string>::convert(Strings::string const& source) {
    return convertFromUTF16_<std::string>(convertToUTF16_(source, eencUTF32), eencUTF8);
}

Strings::string CConverter<Strings::string, std::string>::convert(std::string const& source) {
    return convertFromUTF16_<Strings::string>(convertToUTF16_(source, eencUTF8), eencUTF32);
}

std::basic_string<unsigned char>
CConverter<std::basic_string<unsigned char>, Strings::string>::convert(
    Strings::string const& source) {
    return convertFromUTF16_<std::basic_string<unsigned char>>(convertToUTF16_(source, eencUTF32),
                                                               eencISO8859_1);
}

} // namespace Encoding
