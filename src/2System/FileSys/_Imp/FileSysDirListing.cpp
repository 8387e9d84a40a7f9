#include "2System/FileSys/_Imp/FileSysDirListing.h"

#include <boost/filesystem/operations.hpp>
#include <boost/filesystem/path.hpp>

#include <fcntl.h>
#include <sys/stat.h>

#include <cerrno>
#include <system_error>

namespace FileSys {
namespace {

// The most links that the system follows within one path. Where a path is taken in pieces it begins
// to count anew with each, and would not end a cycle of links.
constexpr unsigned int maxLinks = 40;

bool isOfTheSystem(char const* name) {
    return name[0] == '.' && (name[1] == '\0' || (name[1] == '.' && name[2] == '\0'));
}

[[noreturn]] void raise(int error) {
    throw std::system_error(error, std::generic_category());
}

boost::filesystem::file_type typeOf(struct stat const& status) {
    if (S_ISREG(status.st_mode))
        return boost::filesystem::regular_file;
    return S_ISDIR(status.st_mode) ? boost::filesystem::directory_file
                                   : boost::filesystem::type_unknown;
}

} // namespace

CDirListing::CDirListing(std::string const& folder, unsigned int links, CDirReach& reach)
    : stream_(reach.open(folder)), links_(links) {
    if (!stream_)
        raise(errno);
}

bool CDirListing::next() {
    do {
        errno = 0;
        entry_ = readdir(stream_.get());
        if (entry_ == nullptr && errno != 0)
            raise(errno);
    } while (entry_ != nullptr && isOfTheSystem(entry_->d_name));
    return entry_ != nullptr;
}

CDirListing::SKind CDirListing::kind() const {
    switch (entry_->d_type) {
    case DT_REG:
        return {boost::filesystem::regular_file, false};
    case DT_DIR:
        return {boost::filesystem::directory_file, false};
    case DT_LNK:
        return {boost::filesystem::status_error, true};
    case DT_UNKNOWN:
        return {boost::filesystem::status_error, false};
    default:
        return {boost::filesystem::type_unknown, false};
    }
}

CDirListing::SKind CDirListing::askKind(std::string const& path, SKind const& listed) const {
    if (CDirReach::isTooLong(path))
        return askKindByName_(path.c_str() + path.rfind('/') + 1);
    return {boost::filesystem::status(path).type(), listed.isLink};
}

CDirListing::SKind CDirListing::askKindByName_(char const* name) const {
    int const folder = dirfd(stream_.get());
    struct stat status;
    if (fstatat(folder, name, &status, AT_SYMLINK_NOFOLLOW) != 0)
        raise(errno);
    if (!S_ISLNK(status.st_mode))
        return {typeOf(status), false};
    if (links_ >= maxLinks)
        raise(ELOOP);
    if (fstatat(folder, name, &status, 0) == 0)
        return {typeOf(status), true};
    if (errno != ENOENT && errno != ENOTDIR)
        raise(errno);
    return {boost::filesystem::file_not_found, true};
}

} // namespace FileSys
