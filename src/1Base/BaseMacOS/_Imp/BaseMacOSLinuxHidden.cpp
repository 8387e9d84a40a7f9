// The hidden flag is the extended attribute "user.hidden".

#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include <sys/stat.h>
#include <sys/xattr.h>

#include <cerrno>

namespace MacOS {
namespace Native {
namespace {

constexpr char attributeName[] = "user.hidden";

// The kernel refuses attributes of the user's to links, pipes and devices (xattr(7)).
bool canHoldAttribute(mode_t mode) {
    return S_ISREG(mode) || S_ISDIR(mode);
}

int changeAttribute(char const* path, bool hidden) {
    return hidden ? ::lsetxattr(path, attributeName, "1", 1, 0)
                  : ::lremovexattr(path, attributeName);
}

} // namespace

bool setHiddenAttribute(std::string const& path, bool hidden) {
    struct stat status;
    if (::lstat(path.c_str(), &status) != 0)
        return false;
    if (!canHoldAttribute(status.st_mode))
        return true;
    // ENODATA: the flag to clear was not set.
    return changeAttribute(path.c_str(), hidden) == 0 || errno == ENOTSUP || errno == ENODATA;
}

} // namespace Native
} // namespace MacOS
