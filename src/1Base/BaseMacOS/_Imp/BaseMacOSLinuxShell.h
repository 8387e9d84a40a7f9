/// Assignments as configuration files for shells have them (os-release(5), machine-info(5),
/// user-dirs.dirs(5)).
///
///     MacOS::Native::assignedTexts("A=\"x y\" # no\nB=z\n", "B");   // {"z"}
///     MacOS::Native::unquoted("\"x\\\"y\"");                         // "x\"y"
#ifndef QORN_1BASE_BASEMACOSLINUXSHELL_H
#define QORN_1BASE_BASEMACOSLINUXSHELL_H

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace MacOS {
namespace Native {

/// What stands behind the sign in each line that assigns to `key`, quotes included, in the file's
/// order. Blanks around it and around the key don't count.
std::vector<std::string> assignedTexts(std::string_view file, std::string_view key);

/// The value behind a text of assignedTexts(); nothing where a quote stays open, or something else
/// than a comment follows the closing one. No variable is expanded.
std::optional<std::string> unquoted(std::string_view text);

/// The value of the last line that assigns one to `key`; empty without any.
std::string assignedValue(std::string_view file, std::string_view key);

} // namespace Native
} // namespace MacOS

#endif
