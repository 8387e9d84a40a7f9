#include "2System/FileSys/FileSysOperations.h"

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/Streams/StreamsFile.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include <boost/filesystem/operations.hpp>

#include <unistd.h>

namespace FileSys {
namespace {

using Detail::couldNot;
using Detail::reasonOf;
using Detail::toSystemPath;

void doCreateFolder(CFileSpec const& folder) {
    ERROR_BLOCK_BEGIN
    // One question where the path library asks twice: a copy of a tree comes here for each file.
    if (folder.isFolder())
        return;
    boost::filesystem::path const path = toSystemPath(folder);
    boost::system::error_code error;
    boost::filesystem::create_directories(path, error);
    // Asked whatever the code says: a path that can't even be asked about fails by that.
    if (!boost::filesystem::exists(path) || error)
        ERROR_THROW(TExcFileSpec, Error::msgCouldNot,
                    couldNot("create", "folder", folder, reasonOf(error)));
    ERROR_BLOCK_END
}

void doDeleteFile(CFileSpec const& spec, bool recursive) {
    ERROR_BLOCK_BEGIN
    boost::filesystem::path const path = toSystemPath(spec);
    boost::system::error_code error;
    if (recursive)
        boost::filesystem::remove_all(path, error);
    else
        boost::filesystem::remove(path, error);
    if (boost::filesystem::exists(path) || error)
        ERROR_THROW(TExcFileSpec, Error::msgCouldNot,
                    couldNot("delete", "file or folder", spec, reasonOf(error)));
    ERROR_BLOCK_END
}

void doSetFileAttributes(CFileSpec const& spec, bool hidden, bool readOnly) {
    ERROR_BLOCK_BEGIN
    // Not every file system can hide a file, and none is worse for it.
    MacOS::setHiddenAttribute(spec.getFullName(true), hidden);
    boost::filesystem::permissions(
        toSystemPath(spec),
        boost::filesystem::owner_write |
            (readOnly ? boost::filesystem::remove_perms : boost::filesystem::add_perms));
    ERROR_BLOCK_END
}

// Not the opposite of exists(): a file that could not be asked about must not pass for missing.
bool isMissing(CFileSpec const& spec) {
    boost::system::error_code error;
    return boost::filesystem::status(toSystemPath(spec), error).type() ==
           boost::filesystem::file_not_found;
}

bool doCanOpen(CFileSpec const& spec, unsigned int mode) {
    ERROR_BLOCK_BEGIN
    Streams::Detail::basic_fstreamW<char> const stream(spec.getFullName(true).c_str(), mode);
    return stream.is_open();
    ERROR_BLOCK_END
}

bool doCanRead(CFileSpec const& spec) {
    ERROR_BLOCK_BEGIN
    return access(Detail::toSystemText(spec).c_str(), R_OK) == 0;
    ERROR_BLOCK_END
}

} // namespace

void createFolder(CFileSpec const& folder) {
    ERROR_BLOCK_BEGIN
    doCreateFolder(folder);
    ERROR_BLOCK_END
}

void deleteFile(CFileSpec const& spec, bool recursive) {
    ERROR_BLOCK_BEGIN
    if (spec.exists())
        doDeleteFile(spec, recursive);
    ERROR_BLOCK_END
}

void setFileAttributes(CFileSpec const& spec, bool hidden, bool readOnly) {
    ERROR_BLOCK_BEGIN
    doSetFileAttributes(spec, hidden, readOnly);
    ERROR_BLOCK_END
}

bool canOpen(CFileSpec const& spec, unsigned int mode) {
    ERROR_BLOCK_BEGIN
    bool const wasMissing = isMissing(spec);
    bool const opened = doCanOpen(spec, mode);
    // Then the attempt has made it.
    if (opened && wasMissing)
        deleteFile(spec, true);
    return opened;
    ERROR_BLOCK_END
}

bool canRead(CFileSpec const& spec) {
    ERROR_BLOCK_BEGIN
    return spec.exists() && doCanRead(spec);
    ERROR_BLOCK_END
}

} // namespace FileSys
