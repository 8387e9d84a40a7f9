/// Temporary files and folders with unique names.
///
///     FileSys::CTempFile file(FileSys::createTempFile(FileSys::CFileSpec()));
///     // ... removed at the end of the scope
#ifndef QORN_2SYSTEM_FILESYSTEMPFILE_H
#define QORN_2SYSTEM_FILESYSTEMPFILE_H

#include "2System/FileSys/FileSysFileSpec.h"

#include <utility>

namespace FileSys {

/// The folder for temporary things, asked of the system at each call.
CFileSpec getTempPathName();

/// Makes an empty file with permissions 644 and returns its path. The hint gives the folder, by
/// itself or by its folder part; where that is no folder the file goes to the temporary folder.
/// The name is six random characters, whatever the hint is called. Safe beside other threads and
/// processes. Raises the chain of file operations where the system refuses.
CFileSpec createTempFile(CFileSpec const& hint);

/// Makes a folder named after the hint, a hyphen and six random characters, in the hint's folder
/// part or else in the temporary folder. With an empty hint it becomes a sibling of the temporary
/// folder.
CFileSpec createTempFolder(CFileSpec const& hint);

/// Owns a file and deletes it at the end of its life.
class CTempFile {
  public:
    /// Takes over the file, which need not exist; an empty specification is no file.
    explicit CTempFile(CFileSpec file) : file_(std::move(file)) {}
    CTempFile(CTempFile const&) = delete;
    CTempFile& operator=(CTempFile const&) = delete;

    /// A failure to delete is logged, and the file stays.
    ~CTempFile();

    /// Deletes the file and forgets it; still its owner where that raises.
    void deleteFile();

    /// Forgets the file, which stays on the disk.
    void releaseFile();

    /// The file; empty once it was deleted or released.
    CFileSpec const& getFileSpec() const { return file_; }

  private:
    CFileSpec file_;
};

} // namespace FileSys

#endif
