#include "2System/FileSys/FileSysDirIterator.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include <boost/filesystem/operations.hpp>

namespace FileSys {
namespace {

// The path library empties a file that it overwrites before it looks whether that is the source
// under another name.
bool isSameFile(boost::filesystem::path const& from, boost::filesystem::path const& to) {
    boost::system::error_code error;
    return boost::filesystem::equivalent(from, to, error) && !error;
}

boost::system::error_code copyContent(CFileSpec const& from, CFileSpec const& to, bool overwrite) {
    using boost::filesystem::copy_options;
    boost::filesystem::path const source = Detail::toSystemPath(from);
    boost::filesystem::path const target = Detail::toSystemPath(to);
    if (overwrite && isSameFile(source, target))
        return make_error_code(boost::system::errc::file_exists);
    boost::system::error_code error;
    boost::filesystem::copy_file(
        source, target, overwrite ? copy_options::overwrite_existing : copy_options::none, error);
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

void Detail::doCopyFile(CFileSpec const& from, CFileSpec const& to, bool overwrite) {
    ERROR_BLOCK_BEGIN
    if (!overwrite && to.exists()) {
        ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
                  "Copied file \"@(to)\" already exists.", ERROR_PARAM(to));
        return;
    }
    if (boost::system::error_code const error = copyContent(from, to, overwrite))
        ERROR_THROW(TExcFileSpec, Error::msgCouldNot,
                    couldNot("copy", "file", keyOf(from, to), reasonOf(error)));
    ERROR_BLOCK_END
}

void copyFile(CFileSpec const& from, CFileSpec const& to, bool overwrite) {
    ERROR_BLOCK_BEGIN
    if (from == to)
        return;
    if (from.isFolder()) {
        createFolder(to);
        doCopyFolder(from, to, overwrite);
        return;
    }
    CFileSpec const folder = to.getParentFolder();
    if (!folder.empty())
        createFolder(folder);
    Detail::doCopyFile(from, to, overwrite);
    ERROR_BLOCK_END
}

void copyFileToFolder(CFileSpec const& from, CFileSpec const& folder, bool overwrite) {
    ERROR_BLOCK_BEGIN
    copyFile(from, folder + from.getFile(), overwrite);
    ERROR_BLOCK_END
}

} // namespace FileSys
