#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/Encoding/EncodingExc.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

namespace FileSys {
namespace {

void doCreateAliasFile(CFileSpec const& alias, CFileSpec const& source) {
    ERROR_BLOCK_BEGIN
    bool const error =
        MacOS::createBookmarkFile(source.getFullName(false), alias.getFullName(false));
    if (!error) {
        char const* const function = "MacOS::createBookmarkFile";
        // Without the text's third parameter, whose placeholder stays: readers know the line so.
        ERROR_THROW(Detail::TExcOSFile, Error::msgOSCallArgs,
                    ERROR_PARAMS(ERROR_PARAM(function), ERROR_PARAM(error)));
    }
    ERROR_BLOCK_END
}

// What has no text leads nowhere, as what is no alias: who follows one wants no failure.
bool doResolveAlias(Strings::string const& alias, CFileSpec& result) {
    ERROR_BLOCK_BEGIN
    Strings::string path;
    try {
        if (!MacOS::resolveBookmarkFile(alias, path))
            return false;
    } catch (Encoding::TExcEncoding const&) {
        return false;
    }
    result = path;
    return true;
    ERROR_BLOCK_END
}

} // namespace

void createAliasFile(CFileSpec const& alias, CFileSpec const& source) {
    ERROR_BLOCK_BEGIN
    if (alias.exists())
        ERROR_THROW(TExcFileSpec, Error::msgWrongArgument,
                    Detail::wrongArgument(alias, "already exists"));
    doCreateAliasFile(alias, source);
    ERROR_BLOCK_END
}

bool resolveAlias(CFileSpec const& alias, CFileSpec& result) {
    ERROR_BLOCK_BEGIN
    // Both may be one object.
    Strings::string const path = alias.getFullName(false);
    result = CFileSpec();
    return doResolveAlias(path, result);
    ERROR_BLOCK_END
}

} // namespace FileSys
