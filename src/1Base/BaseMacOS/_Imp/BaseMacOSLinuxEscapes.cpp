#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxEscapes.h"

#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

namespace MacOS {
namespace Native {
namespace {

// Not isalnum, which asks the locale.
bool isUnreserved(char c) {
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9') || c == '-' ||
           c == '.' || c == '_' || c == '~';
}

} // namespace

std::string percentEscaped(std::string_view text, std::string_view kept) {
    constexpr char digits[] = "0123456789ABCDEF";
    std::string escaped;
    escaped.reserve(text.size());
    for (char const c : text) {
        if (isUnreserved(c) || kept.find(c) != std::string_view::npos) {
            escaped += c;
        } else {
            auto const byte = static_cast<unsigned char>(c);
            escaped += '%';
            escaped += digits[byte >> 4];
            escaped += digits[byte & 15];
        }
    }
    return escaped;
}

std::string addingPercentEscapes(std::string const& text) {
    return percentEscaped(text, "");
}

} // namespace Native
} // namespace MacOS
