// Standard folders by the XDG Base Directory Specification and user-dirs.dirs(5).

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxFile.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxShell.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxUser.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include <algorithm>
#include <cstdlib>
#include <optional>
#include <string_view>

namespace MacOS {
namespace Native {
namespace {

// A folder; empty where the system knows none.
using TFolder = std::string;

TFolder within(TFolder const& folder, std::string const& tail) {
    return folder.empty() ? folder : joinPath(folder, tail);
}

// The first absolute path of a variable that holds one or several, parted by colons. Relative ones
// are to be ignored.
TFolder firstFolderOf(char const* variable) {
    char const* const value = std::getenv(variable);
    std::string_view rest = value != nullptr ? value : "";
    while (!rest.empty()) {
        std::string_view const folder = rest.substr(0, rest.find(':'));
        if (!folder.empty() && folder.front() == '/')
            return withoutEnd(std::string(folder));
        rest.remove_prefix(std::min(folder.size() + 1, rest.size()));
    }
    return {};
}

// One folder of the user's own: a colon is a character like any other.
TFolder homeFolderOf(char const* variable, char const* withinHome) {
    char const* const value = std::getenv(variable);
    if (value != nullptr && *value == '/')
        return withoutEnd(value);
    return within(getHomeFolder(), withinHome);
}

TFolder getUserConfigFolder() {
    return homeFolderOf("XDG_CONFIG_HOME", ".config");
}

TFolder getLocalConfigFolder() {
    TFolder const folder = firstFolderOf("XDG_CONFIG_DIRS");
    return folder.empty() ? "/etc/xdg" : folder;
}

// A folder as user-dirs.dirs gives it: "/..." or "$HOME/..." in double quotes. Anything else is
// ignored.
TFolder folderOfEntry(std::string const& entry) {
    constexpr std::string_view home = "\"$HOME";
    if (entry.empty() || entry.front() != '"')
        return {};
    bool const isInHome = entry.compare(0, home.size(), home) == 0;
    std::optional<std::string> const path =
        unquoted(isInHome ? '"' + entry.substr(home.size()) : entry);
    bool const isValid = path && (path->empty() ? isInHome : path->front() == '/');
    if (!isValid)
        return {};
    return withoutEnd(isInHome ? within(getHomeFolder(), path->substr(path->empty() ? 0 : 1))
                               : *path);
}

// The last valid entry counts, as for a shell that runs the file.
TFolder getUserFolder(char const* variable, char const* withinHome) {
    std::optional<std::string> const file =
        readTextFile(within(getUserConfigFolder(), "user-dirs.dirs"));
    TFolder folder;
    for (std::string const& entry : assignedTexts(file.value_or(std::string()), variable)) {
        TFolder const named = folderOfEntry(entry);
        if (!named.empty())
            folder = named;
    }
    return folder.empty() ? within(getHomeFolder(), withinHome) : folder;
}

TFolder getDataFolder(int domain) {
    switch (domain) {
    case sfdUser:
        return homeFolderOf("XDG_DATA_HOME", ".local/share");
    case sfdSystem:
        return "/usr/share";
    default:
        return "/usr/local/share";
    }
}

TFolder getConfigFolder(int domain) {
    switch (domain) {
    case sfdUser:
        return getUserConfigFolder();
    case sfdSystem:
        return getDataFolder(domain);
    default:
        return getLocalConfigFolder();
    }
}

TFolder getProgramFolder(int domain) {
    switch (domain) {
    case sfdUser:
        return within(getHomeFolder(), ".local/bin");
    case sfdSystem:
        return "/usr/bin";
    default:
        return "/usr/local/bin";
    }
}

TFolder getFolder(int folder, int domain) {
    switch (folder) {
    case sftPreferences:
        return within(getConfigFolder(domain), "Library/Preferences");
    case sftSharedUserData:
        return "/srv/Shared";
    case sftDesktop:
        return getUserFolder("XDG_DESKTOP_DIR", "Desktop");
    case sftLibrary:
    case sftApplicationSupport:
        return getDataFolder(domain);
    case sftPrograms:
        return getProgramFolder(domain);
    case sftFonts:
        return within(getDataFolder(domain), "fonts");
    case sftTemporaryItems:
        return "/tmp/";
    default:
        return getUserFolder("XDG_DOCUMENTS_DIR", "Documents");
    }
}

} // namespace

bool getSpecialFolder(int folder, int domain, std::string& path) {
    path = getFolder(folder, domain);
    return !path.empty();
}

} // namespace Native
} // namespace MacOS
