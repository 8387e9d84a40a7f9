#include "2System/FileSys/_Imp/FileSysDirReach.h"

#include <fcntl.h>
#include <limits.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>

namespace FileSys {
namespace {

// For the folders on the way, which need not be readable.
#ifdef O_PATH
constexpr int openToPass = O_PATH | O_DIRECTORY | O_CLOEXEC;
#else
constexpr int openToPass = O_RDONLY | O_DIRECTORY | O_CLOEXEC;
#endif

constexpr int openToList = O_RDONLY | O_DIRECTORY | O_CLOEXEC;

} // namespace

class CDirReach::CFolder_ {
  public:
    explicit CFolder_(int descriptor) : descriptor_(descriptor) {}
    CFolder_(CFolder_ const&) = delete;
    CFolder_& operator=(CFolder_ const&) = delete;
    ~CFolder_() {
        if (descriptor_ >= 0)
            close(descriptor_);
    }

    int get() const { return descriptor_; }

  private:
    int descriptor_;
};

bool CDirReach::isTooLong(std::string const& path) {
    return path.size() >= PATH_MAX;
}

DIR* CDirReach::open(std::string const& path) {
    return isTooLong(path) ? openBelow_(path) : opendir(path.c_str());
}

DIR* CDirReach::openBelow_(std::string const& path) {
    if (path.compare(0, path_.size(), path_) != 0) {
        path_.clear();
        folder_.reset();
    }
    while (path.size() - path_.size() >= PATH_MAX) {
        std::size_t const begin = path_.size();
        std::size_t const end = path.rfind('/', begin + PATH_MAX - 1);
        if (end == std::string::npos || end <= begin) {
            errno = ENAMETOOLONG;
            return nullptr;
        }
        int const above = folder_ ? folder_->get() : AT_FDCWD;
        std::string const piece = path.substr(begin, end - begin);
        auto const folder = std::make_shared<CFolder_>(openat(above, piece.c_str(), openToPass));
        if (folder->get() < 0)
            return nullptr;
        path_.assign(path, 0, path.find_first_not_of('/', end));
        folder_ = folder;
    }
    int const found = openat(folder_->get(), path.c_str() + path_.size(), openToList);
    DIR* const stream = found < 0 ? nullptr : fdopendir(found);
    if (found >= 0 && stream == nullptr)
        close(found);
    return stream;
}

} // namespace FileSys
