#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxBookmarkText.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxFile.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxIdentity.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include <syslog.h>

#include <system_error>

namespace MacOS {
namespace Native {
namespace {

// A search for nothing takes about a tenth of a second where the disk's cache has the folders.
constexpr std::size_t entryLimit = 50000;

bool exists(std::string const& path) {
    return identityOf(path).has_value();
}

// Measured between real folders, since ".." behind a link leads elsewhere than its text says.
std::string relativePathOf(std::string const& source, std::string const& bookmark) {
    return relativePath(realPath(folderOf(bookmark)),
                        joinPath(realPath(folderOf(source)), nameOf(source)));
}

// The path comes first: what was put in the place of the old file is meant, as when an editor saves
// by renaming. Empty where nothing is found.
std::string findTarget(CBookmark const& target, std::string const& bookmark) {
    if (exists(target.path))
        return target.path;
    if (!target.relativePath.empty()) {
        std::string path = followPath(folderOf(realPath(bookmark)), target.relativePath);
        if (exists(path))
            return path;
    }
    return target.identity ? findMovedFile(*target.identity, target.path, entryLimit)
                           : std::string();
}

} // namespace

bool createBookmarkFile(std::string const& source, std::string const& bookmark) {
    std::string const path = absolutePath(source);
    std::optional<CFileIdentity> const identity = identityOf(path);
    if (!identity)
        return false;
    int const failure =
        writeTextFile(bookmark, writeBookmark({path, relativePathOf(path, bookmark), identity}));
    if (failure != 0) {
        std::string const reason = std::generic_category().message(failure);
        ::syslog(LOG_USER | LOG_WARNING, "error is %s", reason.c_str());
    }
    return failure == 0;
}

bool resolveBookmarkFile(std::string const& bookmark, std::string& result) {
    std::optional<std::string> const text = readTextFile(bookmark);
    if (!text)
        return false;
    std::optional<CBookmark> const target = readBookmark(*text);
    if (!target)
        return false;
    std::string const path = findTarget(*target, bookmark);
    if (path.empty())
        return false;
    result = path;
    return true;
}

} // namespace Native
} // namespace MacOS
