#include "2System/FileSys/FileSysFileSpec.h"

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Error/ErrorMacros.h"
#include "2System/FileSys/FileSysFileInfo.h"
#include "2System/FileSys/_Imp/FileSysFileSpecExc.h"
#include "2System/FileSys/_Imp/FileSysSystemPath.h"

#include <boost/filesystem/operations.hpp>
#include <boost/filesystem/path.hpp>
#include <boost/system/error_code.hpp>

#include <unistd.h>

#include <cerrno>
#include <set>

namespace FileSys {
namespace {

using Detail::askType;

// Empty, which names nothing, where the text has no UTF-8 form: who asks wants no failure.
boost::filesystem::path nativePath(CFileSpec const& spec) {
    try {
        return Detail::toSystemPath(spec);
    } catch (Encoding::TExcEncoding const&) {
        return boost::filesystem::path();
    }
}

} // namespace

bool CFileSpec::exists() const {
    return boost::filesystem::exists(boost::filesystem::file_status(askType(*this)));
}

bool CFileSpec::isFolder() const {
    return askType(*this) == boost::filesystem::directory_file;
}

unsigned long long CFileSpec::getFileSize() const {
    boost::system::error_code error;
    // A folder is an error as well.
    auto const size = boost::filesystem::file_size(nativePath(*this), error);
    return error ? 0 : size;
}

CFileInfo CFileSpec::getFileInfo() const {
    ERROR_BLOCK_BEGIN
    CFileInfo const info(getFullName(false));
    if (!info.exists())
        ERROR_THROW(TExcSpecFileInfo, Error::msgWrongArgument,
                    ERROR_PARAMS(Error::buildNamedParameter("type", "file name"),
                                 Error::buildNamedParameter("key", *this),
                                 Error::buildNamedParameter(
                                     "reason", Error::COSErrMessage(static_cast<short>(errno)))));
    return info;
    ERROR_BLOCK_END
}

CFileSpec CFileSpec::getCurrentWorkingDir() {
    ERROR_BLOCK_BEGIN
    char buffer[1024];
    if (getcwd(buffer, sizeof buffer) == nullptr)
        return CFileSpec();
    return CFileSpec(std::string(buffer));
    ERROR_BLOCK_END
}

void cleanFileSpecList(std::list<CFileSpec>& specs, bool removeMissing) {
    ERROR_BLOCK_BEGIN
    std::set<CFileSpec> kept;
    for (auto spec = specs.begin(); spec != specs.end();) {
        if ((removeMissing && !spec->exists()) || !kept.insert(*spec).second)
            spec = specs.erase(spec);
        else
            ++spec;
    }
    ERROR_BLOCK_END
}

} // namespace FileSys
