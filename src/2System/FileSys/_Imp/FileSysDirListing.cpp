#include "2System/FileSys/_Imp/FileSysDirListing.h"

#include <cerrno>
#include <system_error>

namespace FileSys {
namespace {

bool isOfTheSystem(char const* name) {
    return name[0] == '.' && (name[1] == '\0' || (name[1] == '.' && name[2] == '\0'));
}

[[noreturn]] void raise(int error) {
    throw std::system_error(error, std::generic_category());
}

} // namespace

CDirListing::CDirListing(std::string const& folder) : stream_(opendir(folder.c_str())) {
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

boost::filesystem::file_type CDirListing::type() const {
    switch (entry_->d_type) {
    case DT_REG:
        return boost::filesystem::regular_file;
    case DT_DIR:
        return boost::filesystem::directory_file;
    case DT_LNK:
    case DT_UNKNOWN:
        return boost::filesystem::status_error;
    default:
        return boost::filesystem::type_unknown;
    }
}

} // namespace FileSys
