#include "2System/FileSys/FileSysTempFile.h"

#include "1Base/Error/ErrorExcLog.h"
#include "1Base/Error/ErrorMessage.h"
#include "1Base/StdUtil/StdUtilStreamCast.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"
#include "2System/SysInfo/SysInfoFolders.h"

#include <boost/thread/thread.hpp>

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <string>

namespace FileSys {
namespace {

// A path that ends in six "X", in whose place the system puts a unique name. Of an overlong one
// the system gets the first 1024 bytes.
class CUniquePath {
  public:
    explicit CUniquePath(std::string const& pattern)
        : path_(pattern.c_str(), strnlen(pattern.c_str(), limit_)), readable_(path_.size()) {
        while (isContinuation(pattern[readable_]))
            --readable_;
    }

    char* data() { return path_.data(); }
    CFileSpec getFileSpec() const { return CFileSpec(path_); }

    // Without what the limit has left of a last character.
    std::string getReadableText() const { return path_.substr(0, readable_); }

  private:
    static constexpr std::size_t limit_ = 1024;

    // Of UTF-8.
    static bool isContinuation(char byte) {
        return (static_cast<unsigned char>(byte) & 0xC0U) == 0x80U;
    }

    std::string path_;
    std::size_t readable_;
};

Strings::CParameterList<wchar_t> refusedCall(char const* function, CUniquePath const& path) {
    Error::COSErrMessage const error(static_cast<short>(errno));
    std::string const args = path.getReadableText();
    return ERROR_PARAMS(ERROR_PARAM(function), ERROR_PARAM(error), ERROR_PARAM(args));
}

CFileSpec doGetTempPathName() {
    ERROR_BLOCK_BEGIN
    CFileSpec tmpdir = SysInfo::getSystemTemporaryItemsFolder();
    ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
              "doGetTempPathName: \"@(tmpdir)\".", ERROR_PARAM(tmpdir));
    return tmpdir;
    ERROR_BLOCK_END
}

// A missing folder is passed over without a word.
CFileSpec findFolderOrTemporary(CFileSpec const& folder) {
    return folder.isFolder() ? folder : doGetTempPathName();
}

// Formed for each file and part of no name: that is six random characters and nothing else, and
// those who look for left-over files count on it.
Strings::string formPrefix(Strings::string const& name) {
    return name + StdUtil::stream_cast<Strings::string>(boost::this_thread::get_id());
}

CFileSpec doCreateTempFile(CFileSpec const& fs) {
    ERROR_BLOCK_BEGIN
    ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
              "creating tmp file \"@(fs.getFullName())\".",
              Error::buildNamedParameter("fs.getFullName()", fs.getFullName(false)));
    bool const isFolder = fs.isFolder();
    bool const useHint = !isFolder && !fs.empty();
    CFileSpec const folder = isFolder ? fs : findFolderOrTemporary(fs.getParentFolder());
    [[maybe_unused]] Strings::string const prefix =
        formPrefix(useHint ? fs.getFile() : Strings::string(L"ZLT"));
    CUniquePath path(Detail::toSystemText(folder) + "/XXXXXX");
    errno = 0;
    int const descriptor = mkstemp(path.data());
    // mkstemp leaves the owner alone with the file, and the mask has no say here.
    static_cast<void>(fchmod(descriptor, 0644));
    if (descriptor < 0)
        ERROR_THROW(Detail::TExcOSFile, Error::msgOSCallArgs, refusedCall("mkstemp", path));
    close(descriptor);
    CFileSpec strtmpfile = path.getFileSpec();
    ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
              "doCreateTempFile: \"@(strtmpfile)\" ", ERROR_PARAM(strtmpfile));
    return strtmpfile;
    ERROR_BLOCK_END
}

CFileSpec doCreateTempFolder(CFileSpec const& fs) {
    ERROR_BLOCK_BEGIN
    CFileSpec const named = findFolderOrTemporary(fs.getParentFolder()) + fs.getFile();
    CUniquePath path(Detail::toSystemText(named) + "-XXXXXX");
    errno = 0;
    if (mkdtemp(path.data()) == nullptr)
        ERROR_THROW(Detail::TExcOSFile, Error::msgOSCallArgs, refusedCall("mkdtemp", path));
    CFileSpec strtmpfolder = path.getFileSpec();
    // The placeholder finds no parameter of its name and stays in the line, which is known so.
    ERROR_LOG(TLoggerFileSys, Error::TTgtLogger, Error::TSevDebug,
              "doCreateTempFolder: \"@(strtmpfile)\" ", ERROR_PARAM(strtmpfolder));
    return strtmpfolder;
    ERROR_BLOCK_END
}

} // namespace

CFileSpec getTempPathName() {
    ERROR_BLOCK_BEGIN
    return doGetTempPathName();
    ERROR_BLOCK_END
}

CFileSpec createTempFile(CFileSpec const& hint) {
    ERROR_BLOCK_BEGIN
    return doCreateTempFile(hint);
    ERROR_BLOCK_END
}

CFileSpec createTempFolder(CFileSpec const& hint) {
    ERROR_BLOCK_BEGIN
    return doCreateTempFolder(hint);
    ERROR_BLOCK_END
}

CTempFile::~CTempFile() {
    try {
        if (file_.exists())
            deleteFile();
    } catch (Error::CException const& exc) {
        Error::log<TLoggerFileSys, Error::TTgtLogger>(exc);
    }
}

void CTempFile::deleteFile() {
    ERROR_BLOCK_BEGIN
    if (file_.empty())
        return;
    FileSys::deleteFile(file_, true);
    releaseFile();
    ERROR_BLOCK_END
}

void CTempFile::releaseFile() {
    file_ = CFileSpec();
}

bool CFileSpec::isTemporary() const {
    ERROR_BLOCK_BEGIN
    if (empty())
        return false;
    Strings::string const userFolder = SysInfo::getUserTemporaryItemsFolder();
    // The temporary folder is reached through "/private" too.
    return isSubFolderOf(userFolder) || isSubFolderOf(SysInfo::getSystemTemporaryItemsFolder()) ||
           isSubFolderOf(L"/private" + userFolder) || isSubFolderOf(getTempPathName());
    ERROR_BLOCK_END
}

} // namespace FileSys
