#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxIdentity.h"

#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>

#include <cstring>
#include <deque>
#include <memory>

namespace MacOS {
namespace Native {
namespace {

struct CFileStatus {
    CFileIdentity identity;
    bool isFolder;
};

// Asks for no automatic mount: a search must not wake up servers.
std::optional<CFileStatus> statusOf(int folder, char const* path) {
    struct statx status;
    if (::statx(folder, path, AT_SYMLINK_NOFOLLOW | AT_NO_AUTOMOUNT,
                STATX_TYPE | STATX_INO | STATX_BTIME, &status) != 0)
        return std::nullopt;
    CFileStatus result;
    result.identity.device = makedev(status.stx_dev_major, status.stx_dev_minor);
    result.identity.inode = status.stx_ino;
    if ((status.stx_mask & STATX_BTIME) != 0)
        result.identity.birth = static_cast<std::uint64_t>(status.stx_btime.tv_sec) * 1000000000U +
                                status.stx_btime.tv_nsec;
    result.isFolder = S_ISDIR(status.stx_mode);
    return result;
}

// Inode numbers are given anew after a file's end, which the birth time tells. Device numbers may
// change with a restart, so they count only where there is no birth time.
bool isSameFile(CFileIdentity const& left, CFileIdentity const& right) {
    if (left.inode != right.inode)
        return false;
    if (left.birth && right.birth)
        return *left.birth == *right.birth;
    return left.device == right.device;
}

class CFileSearch {
  public:
    CFileSearch(CFileIdentity const& wanted, std::size_t entryLimit)
        : wanted_(wanted), left_(entryLimit) {}

    // Level by level through `top`, but not into `skipped`. True where nothing is left to do.
    bool searchTree(std::string const& top, std::uint64_t device, std::string const& skipped) {
        std::deque<std::string> folders(1, top);
        while (!folders.empty() && found_.empty() && left_ > 0) {
            std::string const folder = folders.front();
            folders.pop_front();
            searchFolder(folder, device, skipped, folders);
        }
        return !found_.empty() || left_ == 0;
    }

    std::string const& found() const { return found_; }

  private:
    // A folder that can't be read holds nothing for us.
    void searchFolder(std::string const& path, std::uint64_t device, std::string const& skipped,
                      std::deque<std::string>& folders) {
        std::unique_ptr<DIR, int (*)(DIR*)> const folder(::opendir(path.c_str()), ::closedir);
        dirent const* entry = nullptr;
        while (folder && found_.empty() && (entry = ::readdir(folder.get())) != nullptr) {
            if (std::strcmp(entry->d_name, ".") == 0 || std::strcmp(entry->d_name, "..") == 0)
                continue;
            if (left_ == 0)
                return;
            --left_;
            std::string entryPath = joinPath(path, entry->d_name);
            std::optional<CFileStatus> const status =
                statusOf(::dirfd(folder.get()), entry->d_name);
            if (!status)
                continue;
            if (isSameFile(wanted_, status->identity))
                found_ = entryPath;
            else if (status->isFolder && status->identity.device == device && entryPath != skipped)
                folders.push_back(std::move(entryPath));
        }
    }

    CFileIdentity wanted_;
    std::size_t left_;
    std::string found_;
};

// Where the path's folder is gone, the one above it, and so on.
std::string nearestFolder(std::string const& path) {
    std::string folder = folderOf(path);
    while (realPath(folder).empty() && folder != "/")
        folder = folderOf(folder);
    return realPath(folder);
}

bool isOnDevice(std::string const& path, std::uint64_t device) {
    std::optional<CFileIdentity> const identity = identityOf(path);
    return identity && identity->device == device;
}

} // namespace

std::optional<CFileIdentity> identityOf(std::string const& path) {
    std::optional<CFileStatus> const status = statusOf(AT_FDCWD, path.c_str());
    if (!status)
        return std::nullopt;
    return status->identity;
}

std::string findMovedFile(CFileIdentity const& wanted, std::string const& path,
                          std::size_t entryLimit) {
    CFileSearch search(wanted, entryLimit);
    std::string folder = nearestFolder(path);
    std::optional<CFileIdentity> const start = identityOf(folder);
    std::string searched;
    while (start && isOnDevice(folder, start->device) &&
           !search.searchTree(folder, start->device, searched) && folder != "/") {
        searched = folder;
        folder = folderOf(folder);
    }
    return search.found();
}

} // namespace Native
} // namespace MacOS
