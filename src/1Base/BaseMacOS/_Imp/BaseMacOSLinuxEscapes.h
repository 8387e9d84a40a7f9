/// Percent escapes (RFC 3986, 2.1).
///
///     MacOS::Native::percentEscaped("/a b", "/");   // "/a%20b"
#ifndef QORN_1BASE_BASEMACOSLINUXESCAPES_H
#define QORN_1BASE_BASEMACOSLINUXESCAPES_H

#include <string>
#include <string_view>

namespace MacOS {
namespace Native {

/// Escapes each byte but those of the unreserved characters (RFC 3986, 2.3) and of `kept`.
std::string percentEscaped(std::string_view text, std::string_view kept);

} // namespace Native
} // namespace MacOS

#endif
