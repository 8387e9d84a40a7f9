/// What the file system says of a path at one moment.
///
///     FileSys::CFileInfo info = FileSys::CFileSpec(L"/etc/hosts").getFileInfo();
///     info.getFileSize();   // bytes
#ifndef QORN_2SYSTEM_FILESYSFILEINFO_H
#define QORN_2SYSTEM_FILESYSFILEINFO_H

#include "1Base/Strings/StringsKinds.h"
#include "2System/Time/TimeDateTime.h"

#include <memory>

namespace FileSys {

/// A snapshot, taken at construction and never refreshed. It owns its record alone; a copy has one
/// of its own.
class CFileInfo {
  public:
    /// Links are followed. A missing path is no error; what else the system refuses, the size of a
    /// FIFO for one, leaves as boost::filesystem::filesystem_error.
    explicit CFileInfo(Strings::string const& path);

    /// @{
    /// The same snapshot once more; nothing is asked of the disk.
    CFileInfo(CFileInfo const& other);
    CFileInfo& operator=(CFileInfo const& other);
    /// @}

    ~CFileInfo();

    /// @{
    /// Of the moment of the snapshot.
    bool exists() const;
    bool isFolder() const;
    /// @}

    /// Always false: neither a leading dot nor the hidden flag is looked at.
    bool isHidden() const;

    /// True where the process may not write, for whatever reason.
    bool isReadOnly() const;

    /// Bytes; 0 for a folder.
    unsigned long long getFileSize() const;

    /// @{
    /// Both are the last write time in UTC, to the second; where the path does not exist, the local
    /// time of the snapshot.
    Time::CDateTime getCreationDate() const;
    Time::CDateTime getModificationDate() const;
    /// @}

  private:
    struct Impl_;
    std::unique_ptr<Impl_> impl_;
};

} // namespace FileSys

#endif
