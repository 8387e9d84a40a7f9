/// Small text files, read and written whole.
#ifndef QORN_1BASE_BASEMACOSLINUXFILE_H
#define QORN_1BASE_BASEMACOSLINUXFILE_H

#include <cstddef>
#include <optional>
#include <string>

namespace MacOS {
namespace Native {

/// What no file that is read here comes near.
constexpr std::size_t textFileLimit = 65536;

/// The bytes of a regular file; nothing where it can't be read or is longer than textFileLimit.
/// Never waits, as opening a pipe would.
std::optional<std::string> readTextFile(std::string const& path);

/// Puts a file with this text at `path`, in place of the file there, if any. No reader ever sees a
/// part of it, and after a failure all is as before. Returns 0, or the error number.
int writeTextFile(std::string const& path, std::string const& text);

} // namespace Native
} // namespace MacOS

#endif
