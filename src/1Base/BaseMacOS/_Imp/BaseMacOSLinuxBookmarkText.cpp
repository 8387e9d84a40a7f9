#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxBookmarkText.h"

#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxEscapes.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"

#include <algorithm>
#include <charconv>
#include <cstddef>
#include <map>
#include <string_view>

namespace MacOS {
namespace Native {
namespace {

constexpr char groupHeader[] = "[Desktop Entry]";
constexpr char typeKey[] = "Type";
constexpr char linkType[] = "Link";
constexpr char pathKey[] = "X-QORN-Path";
constexpr char relativePathKey[] = "X-QORN-RelativePath";
constexpr char deviceKey[] = "X-QORN-Device";
constexpr char inodeKey[] = "X-QORN-Inode";
constexpr char birthTimeKey[] = "X-QORN-BirthTime";

// The escapes of a value: each character beside the letter that stands for it behind a backslash.
constexpr std::string_view escapedCharacters = "\\\n\t\r ";
constexpr std::string_view escapeLetters = "\\ntrs";

std::string escapedValue(std::string const& value) {
    std::string escaped;
    for (char const c : value) {
        std::size_t const i = escapedCharacters.find(c);
        // A blank would be lost at the value's beginning only.
        if (i == std::string_view::npos || (c == ' ' && !escaped.empty())) {
            escaped += c;
        } else {
            escaped += '\\';
            escaped += escapeLetters[i];
        }
    }
    return escaped;
}

// Nothing for an unknown escape.
std::optional<std::string> unescapedValue(std::string_view value) {
    std::string unescaped;
    for (std::size_t i = 0; i < value.size(); ++i) {
        if (value[i] != '\\') {
            unescaped += value[i];
            continue;
        }
        if (++i == value.size())
            return std::nullopt;
        std::size_t const letter = escapeLetters.find(value[i]);
        if (letter == std::string_view::npos)
            return std::nullopt;
        unescaped += escapedCharacters[letter];
    }
    return unescaped;
}

using TEntries = std::map<std::string_view, std::string_view>;

std::string_view withoutBlanksBefore(std::string_view text) {
    return text.substr(std::min(text.find_first_not_of(" \t"), text.size()));
}

std::string_view withoutBlanksBehind(std::string_view text) {
    return text.substr(0, text.find_last_not_of(" \t") + 1);
}

// The entries of the first group, which has to be a desktop entry's; the first of equal keys
// counts. Comments and blank lines count nowhere.
TEntries entriesOf(std::string_view text) {
    TEntries entries;
    bool inGroup = false;
    while (!text.empty()) {
        std::size_t const end = std::min(text.find('\n'), text.size());
        std::string_view const line = text.substr(0, end);
        text.remove_prefix(std::min(end + 1, text.size()));
        if (withoutBlanksBehind(line).empty() || line.front() == '#')
            continue;
        if (!inGroup && withoutBlanksBehind(line) != groupHeader)
            break;
        if (inGroup && line.front() == '[')
            break;
        std::size_t const sign = line.find('=');
        if (inGroup && sign != std::string_view::npos)
            entries.emplace(withoutBlanksBehind(line.substr(0, sign)),
                            withoutBlanksBefore(line.substr(sign + 1)));
        inGroup = true;
    }
    return entries;
}

std::string_view valueOf(TEntries const& entries, char const* key) {
    auto const entry = entries.find(key);
    return entry != entries.end() ? entry->second : std::string_view();
}

std::optional<std::uint64_t> numberOf(TEntries const& entries, char const* key) {
    std::string_view const text = valueOf(entries, key);
    std::uint64_t number = 0;
    auto const [end, failure] = std::from_chars(text.data(), text.data() + text.size(), number);
    if (failure != std::errc() || end != text.data() + text.size())
        return std::nullopt;
    return number;
}

std::optional<CFileIdentity> identityIn(TEntries const& entries) {
    std::optional<std::uint64_t> const device = numberOf(entries, deviceKey);
    std::optional<std::uint64_t> const inode = numberOf(entries, inodeKey);
    if (!device || !inode)
        return std::nullopt;
    return CFileIdentity{*device, *inode, numberOf(entries, birthTimeKey)};
}

std::string line(char const* key, std::string const& value) {
    return std::string(key) + '=' + value + '\n';
}

} // namespace

std::string writeBookmark(CBookmark const& bookmark) {
    std::string text = std::string(groupHeader) + '\n' + line(typeKey, linkType) +
                       line("Name", escapedValue(nameOf(bookmark.path))) +
                       line("URL", "file://" + percentEscaped(bookmark.path, "/")) +
                       line(pathKey, escapedValue(bookmark.path)) +
                       line(relativePathKey, escapedValue(bookmark.relativePath));
    if (bookmark.identity) {
        text += line(deviceKey, std::to_string(bookmark.identity->device)) +
                line(inodeKey, std::to_string(bookmark.identity->inode));
        if (bookmark.identity->birth)
            text += line(birthTimeKey, std::to_string(*bookmark.identity->birth));
    }
    return text;
}

std::optional<CBookmark> readBookmark(std::string const& text) {
    // No path holds a NUL.
    if (text.find('\0') != std::string::npos)
        return std::nullopt;
    TEntries const entries = entriesOf(text);
    std::optional<std::string> path = unescapedValue(valueOf(entries, pathKey));
    if (valueOf(entries, typeKey) != linkType || !path || path->empty() || path->front() != '/')
        return std::nullopt;
    std::optional<std::string> relative = unescapedValue(valueOf(entries, relativePathKey));
    return CBookmark{*std::move(path), std::move(relative).value_or(std::string()),
                     identityIn(entries)};
}

} // namespace Native
} // namespace MacOS
