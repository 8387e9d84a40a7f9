// Bytes in any of the named encodings to text and back, and any text into the encoding.
//
// The first byte chooses the encoding, the others are the bytes. What must hold: reading fails or
// gives a text that writes as bytes of the same text; writing gives bytes that can be read, and
// that the text read from them writes again.

#include "1Base/Encoding/Encoding.h"

#include "support/TextFailures.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

using Encoding::ESysEncoding;
using Strings::stringUTF16;
using TBytes = std::basic_string<unsigned char>;

// One number beyond the table stands for all of them.
constexpr unsigned int encodings = 58;

// The length below which no run of marks is composed in parts.
constexpr std::size_t composedAtOnce = 1024;

TBytes const bytesOfMark = {0xEF, 0xBB, 0xBF};

bool tryRead(TBytes const& bytes, ESysEncoding encoding, stringUTF16& text) {
    return TestSupport::conversionFailureOf(
               [&] { text = Encoding::CConverter<stringUTF16, TBytes>::convert(bytes, encoding); })
        .function.empty();
}

TBytes write(stringUTF16 const& text, ESysEncoding encoding) {
    return Encoding::CConverter<TBytes, stringUTF16>::convert(text, encoding);
}

void require(bool holds) {
    if (!holds)
        std::abort();
}

bool isServed(ESysEncoding encoding) {
    stringUTF16 text;
    return tryRead(TBytes(4, 0), encoding, text);
}

// A text that its encoding does not give back as it is.
bool isChangedOnTheWay(stringUTF16 const& text, ESysEncoding encoding) {
    switch (encoding) {
    case Encoding::eseUTF8:
        // A leading byte order mark is removed from what is read.
        return !text.empty() && static_cast<std::uint16_t>(text[0]) == 0xFEFF;
    case Encoding::eseUTF16CanonicalComposed:
        return text.size() >= composedAtOnce;
    default:
        return false;
    }
}

// A failure while a platform string is read leaves it behind, which would be reported as a leak.
// That are texts without a character (half a unit, a byte order mark alone), and for UTF-8 those
// with a surrogate alone.
bool readsAsNothing(TBytes const& bytes, ESysEncoding encoding) {
    return bytes.size() == 1 || (encoding == Encoding::eseUTF8 && bytes == bytesOfMark);
}

bool hasSurrogates(stringUTF16 const& text) {
    for (short const unit : text) {
        if ((static_cast<std::uint16_t>(unit) & 0xF800U) == 0xD800U)
            return true;
    }
    return false;
}

void checkReading(TBytes const& bytes, ESysEncoding encoding) {
    stringUTF16 text;
    if (readsAsNothing(bytes, encoding) || !tryRead(bytes, encoding, text) ||
        isChangedOnTheWay(text, encoding))
        return;
    stringUTF16 again;
    require(tryRead(write(text, encoding), encoding, again));
    require(again == text);
}

void checkWriting(TBytes const& bytes, ESysEncoding encoding) {
    stringUTF16 units(bytes.size() / 2, 0);
    if (!units.empty())
        std::memcpy(&units[0], bytes.data(), units.size() * 2);
    if (encoding == Encoding::eseUTF8 && hasSurrogates(units))
        return;
    TBytes const written = write(units, encoding);
    stringUTF16 text;
    if (readsAsNothing(written, encoding))
        return;
    require(tryRead(written, encoding, text));
    if (!isChangedOnTheWay(units, encoding))
        require(write(text, encoding) == written);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size == 0)
        return 0;
    auto const encoding = static_cast<ESysEncoding>(data[0] % encodings);
    TBytes const bytes(data + 1, size - 1);
    if (!isServed(encoding)) {
        stringUTF16 text;
        require(bytes.empty() || !tryRead(bytes, encoding, text));
        return 0;
    }
    checkReading(bytes, encoding);
    checkWriting(bytes, encoding);
    return 0;
}
