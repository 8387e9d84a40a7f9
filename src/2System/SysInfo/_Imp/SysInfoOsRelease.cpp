#include "2System/SysInfo/_Imp/SysInfoOsRelease.h"

#include <cstddef>
#include <fstream>

namespace SysInfo {
namespace {

// Values follow the rules of the shell: within quotes or without, with backslashes in front of what
// would be special.
std::string unquoted(std::string const& value) {
    std::string text;
    char quote = '\0';
    for (std::size_t i = 0; i < value.size(); ++i) {
        char const c = value[i];
        if (c == '\\' && quote != '\'' && i + 1 < value.size())
            text += value[++i];
        else if (quote == '\0' && (c == '"' || c == '\''))
            quote = c;
        else if (quote != '\0' && c == quote)
            quote = '\0';
        else
            text += c;
    }
    return text;
}

} // namespace

std::string readVersionID(std::string const& path) {
    std::string const name = "VERSION_ID=";
    std::string version;
    std::ifstream file(path);
    // An assignment further down overrides the ones before it.
    for (std::string line; std::getline(file, line);)
        if (line.compare(0, name.size(), name) == 0)
            version = unquoted(line.substr(name.size()));
    return version;
}

} // namespace SysInfo
