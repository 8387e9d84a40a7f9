/// What fuzz targets that work on two texts share.
#ifndef QORN_FUZZ_FUZZTEXTS_H
#define QORN_FUZZ_FUZZTEXTS_H

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <utility>

namespace FuzzTexts {

inline void require(bool condition) {
    if (!condition)
        std::abort();
}

/// The two texts of an input, with a byte FF between them, which stands in no UTF-8.
inline std::pair<std::string, std::string> twoTexts(std::uint8_t const* data, std::size_t size) {
    std::string const input(reinterpret_cast<char const*>(data), size);
    std::size_t const end = std::min(input.find('\xFF'), size);
    return {input.substr(0, end), input.substr(std::min(end + 1, size))};
}

/// Holds nothing to convert. The conversion refuses it and keeps its platform string, as with every
/// failed read, which would show as a leak here.
inline bool isMarkAlone(std::string const& text) {
    return text == "\xEF\xBB\xBF";
}

} // namespace FuzzTexts

#endif
