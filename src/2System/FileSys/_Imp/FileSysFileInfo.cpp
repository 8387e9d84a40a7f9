#include "2System/FileSys/FileSysFileInfo.h"

#include "1Base/Encoding/EncodingConverter.h"

#include <boost/filesystem/operations.hpp>
#include <boost/filesystem/path.hpp>

#include <unistd.h>

#include <cstdint>
#include <ctime>
#include <string>

namespace FileSys {
namespace {

Time::CDateTime readWriteTime(boost::filesystem::path const& path) {
    std::time_t const seconds = boost::filesystem::last_write_time(path);
    std::tm time = {};
    gmtime_r(&seconds, &time);
    return Time::CDateTime(time);
}

} // namespace

struct CFileInfo::Impl_ {
    explicit Impl_(Strings::string const& path);

    bool exists = false;
    std::uint64_t size = 0;
    bool folder = false;
    bool hidden = false;
    bool readOnly = false;
    Time::CDateTime creationDate = Time::CDateTime::getCurrentTimeLocal();
    Time::CDateTime modificationDate = Time::CDateTime::getCurrentTimeLocal();
};

CFileInfo::Impl_::Impl_(Strings::string const& path) {
    if (path.empty())
        return;
    boost::filesystem::path const native = Encoding::convert<std::string>(path);
    boost::filesystem::file_status const status = boost::filesystem::status(native);
    exists = boost::filesystem::exists(status);
    if (!exists)
        return;
    folder = boost::filesystem::is_directory(status);
    readOnly = access(native.c_str(), W_OK) != 0;
    if (!folder)
        size = boost::filesystem::file_size(native);
    // The platform has no creation time to offer.
    creationDate = readWriteTime(native);
    modificationDate = readWriteTime(native);
}

CFileInfo::CFileInfo(Strings::string const& path) : impl_(new Impl_(path)) {}

CFileInfo::CFileInfo(CFileInfo const& other) : impl_(new Impl_(*other.impl_)) {}

CFileInfo& CFileInfo::operator=(CFileInfo const& other) {
    impl_.reset(new Impl_(*other.impl_));
    return *this;
}

CFileInfo::~CFileInfo() = default;

bool CFileInfo::exists() const {
    return impl_->exists;
}

bool CFileInfo::isFolder() const {
    return impl_->folder;
}

bool CFileInfo::isHidden() const {
    return impl_->hidden;
}

bool CFileInfo::isReadOnly() const {
    return impl_->readOnly;
}

unsigned long long CFileInfo::getFileSize() const {
    return impl_->size;
}

Time::CDateTime CFileInfo::getCreationDate() const {
    return impl_->creationDate;
}

Time::CDateTime CFileInfo::getModificationDate() const {
    return impl_->modificationDate;
}

} // namespace FileSys
