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

// The platform's value for an encoding, and the two that a failure tells: the one in its text and
// the one that the conversion was called with.
struct CEncoding {
    CFStringEncoding platform;
    EEncoding named;
    EEncoding given;
};

[[noreturn]] void fail(char const* function, std::string const& error, CEncoding const& encoding) {
    Detail::throwConversionError(function, error + getEncodingName(encoding.named),
                                 static_cast<ESysEncoding>(encoding.given));
}

template <class TText>
CFStringRef createString(TText const& text, CEncoding const& encoding) {
    CFStringRef const ref = CFStringCreateWithBytes(
        kCFAllocatorDefault, reinterpret_cast<UInt8 const*>(text.data()),
        static_cast<CFIndex>(text.size() * sizeof(typename TText::value_type)), encoding.platform,
        false);
    if (ref == nullptr)
        fail("CFStringCreateWithBytes", "Could not create string with encoding ", encoding);
    return ref;
}

// One call of CFStringGetBytes; a null buffer measures. Reading nothing is an error, and then the
// string stays unreleased.
CFIndex readBytes(CFStringRef ref, CFRange range, CEncoding const& encoding, void* buffer,
                  CFIndex size, CFIndex& used) {
    CFIndex const converted = CFStringGetBytes(ref, range, encoding.platform, lossByte, false,
                                               static_cast<UInt8*>(buffer), size, &used);
    if (converted == 0)
        fail("CFStringGetBytes", "Could not get string with encoding ", encoding);
    return converted;
}

// One pass over a string: a fresh buffer, and in it what it could hold of the units from `done` on,
// which moves behind them.
template <class TElement>
class CPass {
  public:
    CPass(CFStringRef ref, CFIndex length, CFIndex& done, CEncoding const& encoding, CFIndex bytes)
        : buffer_(new TElement[static_cast<std::size_t>(bytes) / sizeof(TElement)]) {
        done +=
            readBytes(ref, CFRangeMake(done, length - done), encoding, buffer_.get(), bytes, used_);
    }

    TElement const* data() const { return buffer_.get(); }
    std::size_t size() const { return static_cast<std::size_t>(used_) / sizeof(TElement); }

  private:
    boost::scoped_array<TElement> buffer_;
    CFIndex used_ = 0;
};

// Reads the whole string into a text of the target kind and releases it.
template <class TText>
TText takeString(CFStringRef ref, CEncoding const& encoding) {
    using TElement = typename TText::value_type;

    CFIndex const length = CFStringGetLength(ref);
    CFIndex total = 0;
    readBytes(ref, CFRangeMake(0, length), encoding, nullptr, 0, total);
    CFIndex const bufferBytes = std::min(total, passBytes);
    CFIndex done = 0;
    // What fits into one pass is made from it in its size.
    auto const readAtOnce = [&] {
        if (length < 1 || total > passBytes)
            return TText();
        CPass<TElement> const pass(ref, length, done, encoding, bufferBytes);
        return TText(pass.data(), pass.size());
    };
    TText text = readAtOnce();
    while (done < length) {
        text.reserve(static_cast<std::size_t>(total) / sizeof(TElement));
        CPass<TElement> const pass(ref, length, done, encoding, bufferBytes);
        text.append(pass.data(), pass.size());
    }
    CFRelease(ref);
    return text;
}

// UTF-16 between the two steps of a conversion. Short, as most texts are, it needs no heap.
class CHub {
  public:
    using value_type = short;

    CHub() {}
    CHub(short const* text, std::size_t count) { append(text, count); }

    void reserve(std::size_t size) { long_.reserve(size); }

    void append(short const* text, std::size_t count) {
        if (size_ + count <= shortSize) {
            std::copy_n(text, count, short_ + size_);
        } else {
            if (long_.empty())
                long_.assign(short_, size_);
            long_.append(text, count);
        }
        size_ += count;
    }

    short const* data() const { return size_ <= shortSize ? short_ : long_.data(); }
    std::size_t size() const { return size_; }
    bool empty() const { return size_ == 0; }

  private:
    static constexpr std::size_t shortSize = 256;

    short short_[shortSize]; // the text up to this size, unused beyond it
    Strings::stringUTF16 long_;
    std::size_t size_ = 0;
};

template <class TUTF16, class TString>
TUTF16 convertToUTF16_(TString const& source, EEncoding encoding) {
    if (source.empty())
        return TUTF16();
    CFStringRef const ref = createString(source, {findEncoding(encoding), encoding, encoding});
    return takeString<TUTF16>(ref, {kCFStringEncodingUnicode, eencUTF16, encoding});
}

template <class TString, class TUTF16>
TString convertFromUTF16_(TUTF16 const& source, EEncoding encoding) {
    if (source.empty())
        return TString();
    CFStringRef const ref = createString(source, {kCFStringEncodingUnicode, eencUTF16, encoding});
    return takeString<TString>(ref, {findEncoding(encoding), encoding, encoding});
}

template <class TTarget, class TSource>
TTarget convertThroughUTF16(TSource const& source, EEncoding from, EEncoding to) {
    return convertFromUTF16_<TTarget>(convertToUTF16_<CHub>(source, from), to);
}

} // namespace

Strings::stringUTF16
CConverter<Strings::stringUTF16, std::string>::convert(std::string const& source) {
    return convertToUTF16_<Strings::stringUTF16>(source, eencUTF8);
}

std::string
CConverter<std::string, Strings::stringUTF16>::convert(Strings::stringUTF16 const& source) {
    return convertFromUTF16_<std::string>(source, eencUTF8);
}

Strings::stringUTF16
CConverter<Strings::stringUTF16, Strings::string>::convert(Strings::string const& source) {
    return convertToUTF16_<Strings::stringUTF16>(source, eencUTF32);
}

Strings::string
CConverter<Strings::string, Strings::stringUTF16>::convert(Strings::stringUTF16 const& source) {
    return convertFromUTF16_<Strings::string>(source, eencUTF32);
}

Strings::stringUTF16 CConverter<Strings::stringUTF16, std::basic_string<unsigned char>>::convert(
    std::basic_string<unsigned char> const& source, ESysEncoding encoding) {
    return convertToUTF16_<Strings::stringUTF16>(source, static_cast<EEncoding>(encoding));
}

std::basic_string<unsigned char>
CConverter<std::basic_string<unsigned char>, Strings::stringUTF16>::convert(
    Strings::stringUTF16 const& source, ESysEncoding encoding) {
    return convertFromUTF16_<std::basic_string<unsigned char>>(source,
                                                               static_cast<EEncoding>(encoding));
}

std::string CConverter<std::string, Strings::string>::convert(Strings::string const& source) {
    return convertThroughUTF16<std::string>(source, eencUTF32, eencUTF8);
}

Strings::string CConverter<Strings::string, std::string>::convert(std::string const& source) {
    return convertThroughUTF16<Strings::string>(source, eencUTF8, eencUTF32);
}

std::basic_string<unsigned char>
CConverter<std::basic_string<unsigned char>, Strings::string>::convert(
    Strings::string const& source) {
    return convertThroughUTF16<std::basic_string<unsigned char>>(source, eencUTF32, eencISO8859_1);
}

} // namespace Encoding
