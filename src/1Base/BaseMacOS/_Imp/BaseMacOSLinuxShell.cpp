#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxShell.h"

#include <algorithm>
#include <cstddef>

namespace MacOS {
namespace Native {
namespace {

constexpr std::string_view blanks = " \t\r";

std::string_view trimmed(std::string_view text) {
    std::size_t const begin = text.find_first_not_of(blanks);
    if (begin == std::string_view::npos)
        return {};
    return text.substr(begin, text.find_last_not_of(blanks) - begin + 1);
}

// What a backslash takes its meaning from. Elsewhere in double quotes it is a character.
bool isEscapable(char c) {
    return c == '"' || c == '$' || c == '`' || c == '\\';
}

bool isCommentOrNothing(std::string_view text) {
    std::string_view const rest = trimmed(text);
    return rest.empty() || rest.front() == '#';
}

std::optional<std::string> inDoubleQuotes(std::string_view text) {
    std::string value;
    for (std::size_t i = 1; i < text.size(); ++i) {
        if (text[i] == '"') {
            if (isCommentOrNothing(text.substr(i + 1)))
                return value;
            return std::nullopt;
        }
        if (text[i] == '\\' && i + 1 < text.size() && isEscapable(text[i + 1]))
            ++i;
        value += text[i];
    }
    return std::nullopt;
}

std::optional<std::string> inSingleQuotes(std::string_view text) {
    std::size_t const end = text.find('\'', 1);
    if (end == std::string_view::npos || !isCommentOrNothing(text.substr(end + 1)))
        return std::nullopt;
    return std::string(text.substr(1, end - 1));
}

} // namespace

std::vector<std::string> assignedTexts(std::string_view file, std::string_view key) {
    std::vector<std::string> texts;
    while (!file.empty()) {
        std::size_t const end = std::min(file.find('\n'), file.size());
        std::string_view const line = file.substr(0, end);
        std::size_t const sign = line.find('=');
        if (sign != std::string_view::npos && trimmed(line.substr(0, sign)) == key)
            texts.emplace_back(trimmed(line.substr(sign + 1)));
        file.remove_prefix(std::min(end + 1, file.size()));
    }
    return texts;
}

std::optional<std::string> unquoted(std::string_view text) {
    if (text.empty())
        return std::string();
    if (text.front() == '"')
        return inDoubleQuotes(text);
    if (text.front() == '\'')
        return inSingleQuotes(text);
    return std::string(text);
}

std::string assignedValue(std::string_view file, std::string_view key) {
    std::string last;
    for (std::string const& text : assignedTexts(file, key))
        last = unquoted(text).value_or(last);
    return last;
}

} // namespace Native
} // namespace MacOS
