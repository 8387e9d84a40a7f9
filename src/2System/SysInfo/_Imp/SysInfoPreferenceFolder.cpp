#include "2System/SysInfo/SysInfoPreferenceFolder.h"

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Error/ErrorExcLog.h"
#include "1Base/Error/ErrorMacros.h"
#include "1Base/Streams/StreamsFile.h"
#include "2System/FileSys/FileSysDirIterator.h"
#include "2System/FileSys/FileSysExc.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/FileSysTempFile.h"
#include "2System/MacOS/MacOSGlue.h"
#include "2System/SysInfo/SysInfoExc.h"
#include "2System/SysInfo/SysInfoFolders.h"

#include <boost/filesystem/operations.hpp>
#include <boost/filesystem/path.hpp>

#include <cstddef>
#include <ios>
#include <istream>

namespace {

TEMPLMETA_TAG_NAME(SysInfoPrefsFolder);

using TLoggerPrefsFolder =
    Error::CLogger<TemplMeta::CTag<CTag_Name_SysInfoPrefsFolder<char const*>>,
                   Error::TStdSeverities, Error::TStdTargets, SysInfo::TLoggerSysInfo,
                   TemplMeta::CAnd>;

} // namespace

namespace SysInfo {
namespace {

// The names of the two kinds, for whoever shows them.
[[maybe_unused]] constexpr wchar_t kKindMachine[] = L"Machine";
[[maybe_unused]] constexpr wchar_t kKindUser[] = L"User";

FileSys::CFileSpec preferenceFolder(CSystemPrefs::EKind kind) {
    switch (kind) {
    case CSystemPrefs::ekMachine:
        return getSystemPreferenceFolder();
    case CSystemPrefs::ekUser:
        return getUserPreferenceFolder();
    }
    ERROR_ASSERT_TEXT(false, "!\"invalid SysInfo::CSystemPrefs::EKind\"");
    return FileSys::CFileSpec();
}

FileSys::CFileSpec join(FileSys::CFileSpec const& folder, CSystemPrefsPath const& path) {
    return folder + Encoding::convert<Strings::string>(path.get());
}

FileSys::CFileSpec join(FileSys::CFileSpec const& folder, CSystemPrefsPath const& path,
                        std::string const& key) {
    return join(folder, path) + Encoding::convert<Strings::string>(key);
}

// A failed tool says nothing: what is written into the folder next tells.
void createFolder_(FileSys::CFileSpec const& spec, TAuthorization auth) {
    ERROR_BLOCK_BEGIN
    if (auth != nullptr && auth->isAuthorized() && !spec.exists())
        auth->execute("/bin/mkdir", {"-p", MacOS::convertToPosixPath(spec)});
    else
        FileSys::createFolder(spec);
    ERROR_BLOCK_END
}

void setFileInvisible(FileSys::CFileSpec const& spec) {
    ERROR_BLOCK_BEGIN
    bool const done = MacOS::setHiddenAttribute(spec.getFullName(true), true);
    if (!done)
        ERROR_THROW(
            TExcPreferenceFolder, Error::msgOSCall,
            ERROR_PARAMS(Error::buildNamedParameter("function", "MacOS::setHiddenAttribute"),
                         Error::buildNamedParameter("error", done)));
    ERROR_BLOCK_END
}

void makeReadableAndWritable(FileSys::CFileSpec const& spec) {
    namespace fs = boost::filesystem;
    fs::permissions(fs::path(spec.getFullName<std::string>(true)),
                    fs::add_perms | fs::owner_read | fs::group_read | fs::others_read |
                        fs::owner_write | fs::group_write | fs::others_write);
}

// The outcome of the write is not looked at: readers of the store expect what fits.
void doWriteFile_(FileSys::CFileSpec const& spec, TByteVector const& bytes) {
    ERROR_BLOCK_BEGIN
    Streams::Detail::basic_ofstreamW<char> stream(spec.getFullName(true).c_str(),
                                                  std::ios_base::out | std::ios_base::trunc |
                                                      std::ios_base::binary);
    if (!stream)
        ERROR_THROW(TExcPreferenceFolder, Error::msgCouldNot,
                    ERROR_PARAMS(Error::buildNamedParameter("process", "open"),
                                 Error::buildNamedParameter("type", "file"),
                                 Error::buildNamedParameter("key", spec),
                                 Error::buildNamedParameter("reason", "bad stream")));
    stream.write(reinterpret_cast<char const*>(bytes.data()),
                 static_cast<std::streamsize>(bytes.size()));
    setFileInvisible(spec);
    makeReadableAndWritable(spec);
    ERROR_BLOCK_END
}

// The flag and the permissions travel with the file.
void writeFileWithRights(FileSys::CFileSpec const& spec, TByteVector const& bytes,
                         MacOS::CAuthorizationBase& auth) {
    FileSys::CFileSpec tmp = FileSys::getTempPathName() + L"ZLT_CPreferenceFolder_tmp.dat";
    FileSys::indexFile(tmp, 4);
    doWriteFile_(tmp, bytes);
    ERROR_ASSERT_TEXT(
        auth.execute("/bin/mv",
                     {"-f", MacOS::convertToPosixPath(tmp), MacOS::convertToPosixPath(spec)}),
        "auth->execute( Encoding::convert<Strings::stringUTF8,std::string>(\"/bin/mv\"), args)");
}

void writeFile_(FileSys::CFileSpec const& spec, TByteVector const& bytes, TAuthorization auth) {
    ERROR_BLOCK_BEGIN
    if (auth != nullptr && auth->isAuthorized())
        writeFileWithRights(spec, bytes, *auth);
    else
        doWriteFile_(spec, bytes);
    ERROR_BLOCK_END
}

TByteVector readToEnd(std::istream& stream) {
    TByteVector bytes;
    unsigned char chunk[1024];
    do {
        stream.read(reinterpret_cast<char*>(chunk), sizeof(chunk));
        bytes.insert(bytes.end(), chunk, chunk + stream.gcount());
    } while (stream.gcount() == sizeof(chunk));
    return bytes;
}

// Appends the names out of a text in which a separator, which no name can hold, stands behind each.
template <class TString>
void takeApart(TString const& joined, std::vector<TString>& names) {
    for (std::size_t begin = 0; begin < joined.size();) {
        std::size_t const end = joined.find('/', begin);
        names.push_back(joined.substr(begin, end - begin));
        begin = end + 1;
    }
}

// Converted by the hundred: a conversion of each costs as much as to list and to sort it.
template <class TString>
std::vector<TString> fileNames(FileSys::CFileSpec const& folder) {
    using Iterator = FileSys::CDirIterator;
    constexpr std::size_t enough = 4096;
    Iterator const end;
    std::vector<TString> names;
    Strings::string joined;
    for (Iterator i(folder, Iterator::eNotRecursive, Iterator::eFiles); i != end;) {
        joined += i->getFile();
        joined += FileSys::CFileSpec::getPathSeparator();
        ++i;
        if (joined.size() < enough && i != end)
            continue;
        takeApart<TString>(Encoding::convert<TString>(joined), names);
        joined.clear();
    }
    return names;
}

} // namespace

CPreferenceFolder::CPreferenceFolder(TKind kind, TRight, CSystemPrefsPath const& path, bool create,
                                     TAuthorization authorization)
    : authorization_(authorization) {
    ERROR_BLOCK_BEGIN
    folder_ = join(preferenceFolder(kind), path);
    if (create && !folder_.exists())
        createFolder_(folder_, authorization_);
    ERROR_BLOCK_END
}

TByteVector& CPreferenceFolder::getValue(CSystemPrefsPath const& path, std::string const& key,
                                         TByteVector& value) const {
    ERROR_BLOCK_BEGIN
    Streams::Detail::basic_ifstreamW<char> stream(
        join(folder_, path, key).getFullName(true).c_str(),
        std::ios_base::in | std::ios_base::binary);
    if (stream)
        readToEnd(stream).swap(value);
    return value;
    ERROR_BLOCK_END
}

void CPreferenceFolder::setValue(CSystemPrefsPath const& path, std::string const& key,
                                 TByteVector const& value) {
    ERROR_BLOCK_BEGIN
    FileSys::CFileSpec target = join(folder_, path);
    createFolder_(target, authorization_);
    target += Encoding::convert<Strings::string>(key);
    writeFile_(target, value, authorization_);
    ERROR_BLOCK_END
}

void CPreferenceFolder::deleteKey(CSystemPrefsPath const& path) {
    ERROR_BLOCK_BEGIN
    try {
        FileSys::deleteFile(join(folder_, path), true);
    } catch (FileSys::TExcFileSys const& exc) {
        Error::log<TLoggerPrefsFolder, Error::TTgtLogger>(exc);
    }
    ERROR_BLOCK_END
}

void CPreferenceFolder::deleteValue(CSystemPrefsPath const& path, std::string const& key) {
    ERROR_BLOCK_BEGIN
    try {
        FileSys::deleteFile(join(folder_, path, key), true);
    } catch (FileSys::TExcFileSys const& exc) {
        ERROR_THROW(TExcPreferenceFolder, exc);
    }
    ERROR_BLOCK_END
}

std::vector<Strings::stringUTF8> CPreferenceFolder::getValues() const {
    ERROR_BLOCK_BEGIN
    return fileNames<Strings::stringUTF8>(folder_);
    ERROR_BLOCK_END
}

std::vector<Strings::string> CPreferenceFolder::getPaths() const {
    ERROR_BLOCK_BEGIN
    return fileNames<Strings::string>(folder_);
    ERROR_BLOCK_END
}

} // namespace SysInfo
