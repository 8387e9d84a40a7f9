#include "1Base/Error/ErrorMessage.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include <boost/filesystem/operations.hpp>

#include <cerrno>
#include <sstream>

namespace FileSys {
namespace {

void doMoveFile(CFileSpec const& from, CFileSpec const& to) {
    ERROR_BLOCK_BEGIN
    boost::system::error_code error;
    boost::filesystem::rename(Detail::toSystemPath(from), Detail::toSystemPath(to), error);
    if (error.value() == EXDEV) {
        // For one file: a folder is refused, and stays.
        Detail::doCopyFile(from, Detail::askType(from), to, true);
        deleteFile(from, true);
    } else if (error) {
        ERROR_THROW(
            TExcFileSpec, Error::msgCouldNot,
            Detail::couldNot("move", "file", Detail::keyOf(from, to), Detail::reasonOf(error)));
    }
    ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
              "Moved file \"@(from)\" to \"@(to)\".",
              ERROR_PARAMS(ERROR_PARAM(from), ERROR_PARAM(to)));
    ERROR_BLOCK_END
}

// A failure of the more special chain makes the move a copy. Those of the path library are not of
// it and go to the caller: for them doMoveFile() has a road of its own.
void moveOrCopy(CFileSpec const& from, CFileSpec const& to, bool overwrite) {
    try {
        CFileSpec const folder = to.getParentFolder();
        if (from.isFolder() || !folder.empty())
            createFolder(folder);
        doMoveFile(from, to);
    } catch (Detail::TExcOSFile const& exc) {
        std::ostringstream oss;
        exc.writeTo(oss, true);
        ERROR_LOG(
            TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
            "Cannot move \"@(from)\" to \"@(to)\": (@(oss.str())). Trying to copy and delete.",
            ERROR_PARAMS(ERROR_PARAM(from), ERROR_PARAM(to), ERROR_PARAM(oss.str())));
        copyFile(from, to, overwrite);
        deleteFile(from, true);
    }
}

void doRenameFile(CFileSpec const& fs, Strings::string const& newName) {
    ERROR_BLOCK_BEGIN
    if (fs.getFile() == newName)
        return;
    CFileSpec target = fs.getParentFolder();
    target += newName;
    moveFile(fs, target, false);
    Strings::string const oldName = fs.getFullName(false);
    ERROR_LOG(TLoggerFileSys, Error::TTgtDebugger, Error::TSevDebug,
              "Renamed file: \"@(oldName)\" to \"@(newName)\".",
              ERROR_PARAMS(ERROR_PARAM(oldName), ERROR_PARAM(newName)));
    ERROR_BLOCK_END
}

} // namespace

void moveFile(CFileSpec const& from, CFileSpec const& to, bool overwrite) {
    ERROR_BLOCK_BEGIN
    if (!from.exists())
        ERROR_THROW(Detail::TExcOSFile, Error::msgWrongArgument,
                    Detail::wrongArgument(from, "does not exist"));
    // Before the target goes, or a file moved onto itself would be lost.
    if (from == to)
        return;
    if (to.exists()) {
        if (!overwrite)
            ERROR_THROW(Detail::TExcOSFile, Error::msgWrongArgument,
                        Detail::wrongArgument(to, "already exists"));
        deleteFile(to, true);
    }
    moveOrCopy(from, to, overwrite);
    ERROR_BLOCK_END
}

void moveFileToFolder(CFileSpec const& from, CFileSpec const& folder, bool overwrite) {
    ERROR_BLOCK_BEGIN
    moveFile(from, folder + from.getFile(), overwrite);
    ERROR_BLOCK_END
}

CFileSpec setFileType(CFileSpec const& spec, Strings::string const& type) {
    ERROR_BLOCK_BEGIN
    if (!spec.exists())
        ERROR_THROW(TExcFileSpec, Error::msgCouldNot,
                    Detail::couldNot("set file type for", "file", spec,
                                     Error::COSErrMessage(static_cast<short>(errno))));
    if (spec.isFolder())
        ERROR_THROW(
            TExcFileSpec, Error::msgCouldNot,
            Detail::couldNot("set file type for", "file spec", spec, "file spec is a folder"));
    CFileSpec result = spec;
    if (!type.empty()) {
        result.setFileExtension(type, true);
        doRenameFile(spec, result.getFile());
    }
    return result;
    ERROR_BLOCK_END
}

} // namespace FileSys
