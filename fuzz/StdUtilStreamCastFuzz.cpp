// A number read from wide text by hand gives what a stream gives, value and failure alike.
//
// The input is the text in UTF-8; what is none is taken byte by byte.

#include "1Base/Error/Error.h"
#include "1Base/StdUtil/StdUtilLocales.h"
#include "1Base/StdUtil/StdUtilStreamCast.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <locale>
#include <optional>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

namespace {

template <class TNumber>
std::optional<TNumber> read(Strings::string const& text) {
    try {
        return StdUtil::CStreamCaster<TNumber, Strings::string>::cast(text);
    } catch (Error::CException const&) {
        return std::nullopt;
    }
}

template <class TNumber>
std::optional<TNumber> readByStream(Strings::string const& text) {
    // Does what the classic facet does, but keeps the text from being read by hand.
    StdUtilTest::CGlobalLocale const global(new std::numpunct<char>);
    return read<TNumber>(text);
}

template <class... TNumbers>
void compareRoads(Strings::string const& text) {
    if (!(... && (read<TNumbers>(text) == readByStream<TNumbers>(text))))
        std::abort();
}

Strings::string textOf(std::string const& bytes) {
    try {
        return Encoding::convert<Strings::string>(bytes);
    } catch (Error::CException const&) {
        return Strings::string(reinterpret_cast<unsigned char const*>(bytes.data()),
                               reinterpret_cast<unsigned char const*>(bytes.data()) + bytes.size());
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const bytes(reinterpret_cast<char const*>(data), size);
    // To convert this one fails and keeps a platform string, as it is bound to.
    if (bytes == "\xEF\xBB\xBF")
        return 0;
    compareRoads<short, unsigned short, int, unsigned int, long, unsigned long, long long,
                 unsigned long long>(textOf(bytes));
    return 0;
}
