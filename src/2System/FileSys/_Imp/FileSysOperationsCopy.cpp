#include "2System/FileSys/FileSysDirIterator.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include <boost/filesystem/operations.hpp>

#include <sys/stat.h>

#include <cerrno>
#include <string>

namespace FileSys {
namespace {

boost::system::error_code systemError(int error) {
    return boost::system::error_code(error, boost::system::system_category());
}

// Opening a FIFO or a device can wait for its other end.
bool canWaitOnOpening(boost::filesystem::file_type type) {
    return type == boost::filesystem::fifo_file || type == boost::filesystem::character_file;
}

bool canWaitOnOpening(struct stat const& status) {
    return S_ISFIFO(status.st_mode) || S_ISCHR(status.st_mode);
}

bool isSameFile(struct stat const& left, struct stat const& right) {
    return S_ISREG(left.st_mode) && left.st_dev == right.st_dev && left.st_ino == right.st_ino;
}

// What the path library finds out too late: it waits for the other end of a FIFO before it refuses
// it, and empties a file that it overwrites before it sees that this is the source under another
// name. The errors are the library's own, and all else is left to it.
boost::system::error_code checkOverwriting(std::string const& from, std::string const& to) {
    struct stat source;
    struct stat target;
    if (stat(from.c_str(), &source) != 0)
        return systemError(errno);
    if (stat(to.c_str(), &target) != 0)
        return systemError(errno == ENOENT ? 0 : errno);
    if (canWaitOnOpening(target))
        return systemError(ENOSYS);
    return systemError(isSameFile(source, target) ? EEXIST : 0);
}

boost::system::error_code copyContent(CFileSpec const& from, boost::filesystem::file_type type,
                                      CFileSpec const& to, bool overwrite) {
    using boost::filesystem::copy_options;
    boost::filesystem::path const source = Detail::toSystemPath(from);
    boost::filesystem::path const target = Detail::toSystemPath(to);
    boost::system::error_code error;
    if (canWaitOnOpening(type))
        error = systemError(ENOSYS);
    else if (overwrite)
        error = checkOverwriting(source.native(), target.native());
    if (!error)
        boost::filesystem::copy_file(
            source, target, overwrite ? copy_options::overwrite_existing : copy_options::none,
            error);
    return error;
}

// One level: copyFile() comes back here for the folders in it.
void doCopyFolder(CFileSpec const& from, CFileSpec const& to, bool overwrite) {
    ERROR_BLOCK_BEGIN
    CDirIterator const end;
    for (CDirIterator entry(from, CDirIterator::eNotRecursive,
                            CDirIterator::eFiles | CDirIterator::eFolders);
         entry != end; ++entry)
        copyFile(*entry, to + entry->getFile(), overwrite);
    ERROR_BLOCK_END
}

} // namespace

void Detail::doCopyFile(CFileSpec const& from, boost::filesystem::file_type type,
                        CFileSpec const& to, bool overwrite) {
    ERROR_BLOCK_BEGIN
    if (!overwrite && to.exists()) {
        ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
                  "Copied file \"@(to)\" already exists.", ERROR_PARAM(to));
        return;
    }
    if (boost::system::error_code const error = copyContent(from, type, to, overwrite))
        ERROR_THROW(TExcFileSpec, Error::msgCouldNot,
                    couldNot("copy", "file", keyOf(from, to), reasonOf(error)));
    ERROR_BLOCK_END
}

void copyFile(CFileSpec const& from, CFileSpec const& to, bool overwrite) {
    ERROR_BLOCK_BEGIN
    if (from == to)
        return;
    boost::filesystem::file_type const type = Detail::askType(from);
    if (type == boost::filesystem::directory_file) {
        createFolder(to);
        doCopyFolder(from, to, overwrite);
        return;
    }
    CFileSpec const folder = to.getParentFolder();
    if (!folder.empty())
        createFolder(folder);
    Detail::doCopyFile(from, type, to, overwrite);
    ERROR_BLOCK_END
}

void copyFileToFolder(CFileSpec const& from, CFileSpec const& folder, bool overwrite) {
    ERROR_BLOCK_BEGIN
    copyFile(from, folder + from.getFile(), overwrite);
    ERROR_BLOCK_END
}

} // namespace FileSys
