// Both readers of UTF-8 on any bytes: neither crashes, and what the strict one accepts the lax one
// reads as the same text. A byte order mark apart, which only the strict one takes off.

#include "1Base/Encoding/Encoding.h"
#include "1Base/Error/ErrorException.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <optional>
#include <string>

namespace {

template <class TRead>
std::optional<Strings::string> accepted(TRead const& read) {
    try {
        return read();
    } catch (Error::CException const&) {
        return std::nullopt;
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const bytes(reinterpret_cast<char const*>(data), size);
    // A mark alone makes an empty platform string; that reading it fails, and leaves it unreleased,
    // is known and tested elsewhere.
    if (bytes == "\xEF\xBB\xBF")
        return 0;
    auto const strict = accepted([&] { return Encoding::convert<Strings::string>(bytes); });
    auto const lax = accepted([&] { return Encoding::convertUTF8ToUTF32(bytes); });

    bool const hasMark = bytes.compare(0, 3, "\xEF\xBB\xBF") == 0;
    if (strict && !hasMark && (!lax || *lax != *strict))
        std::abort();
    // What was read strictly also comes back byte by byte.
    if (strict && !hasMark && Encoding::convert<std::string>(*strict) != bytes)
        std::abort();
    return 0;
}
