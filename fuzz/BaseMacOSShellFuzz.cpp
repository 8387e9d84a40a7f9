// Assignments as configuration files for shells have them: whatever the file holds, what is found
// stands in it, the last value that can be read is the one, and a quoted text comes back whole.
//
// An input is a key and a file with a newline between them.

#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxShell.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <optional>
#include <string>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

namespace {

void require(bool condition) {
    if (!condition)
        std::abort();
}

std::string quoted(std::string const& text) {
    std::string result = "\"";
    for (char const character : text) {
        if (character == '"' || character == '\\' || character == '$' || character == '`')
            result += '\\';
        result += character;
    }
    return result + '"';
}

void checkQuoting(std::string const& text) {
    std::optional<std::string> const value = MacOS::Native::unquoted(quoted(text));
    require(value && *value == text);
}

void checkFile(std::string const& file, std::string const& key) {
    std::string last;
    for (std::string const& text : MacOS::Native::assignedTexts(file, key)) {
        require(file.find(text) != std::string::npos);
        require(text.find('\n') == std::string::npos);
        if (std::optional<std::string> const value = MacOS::Native::unquoted(text))
            last = *value;
    }
    require(MacOS::Native::assignedValue(file, key) == last);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const input(reinterpret_cast<char const*>(data), size);
    std::size_t const end = std::min(input.find('\n'), size);
    std::string const key = input.substr(0, end);
    std::string const file = input.substr(std::min(end + 1, size));
    checkFile(file, key);
    checkQuoting(file);
    return 0;
}
