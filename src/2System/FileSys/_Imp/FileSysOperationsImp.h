/// What the source files of the file operations share.
#ifndef QORN_2SYSTEM_FILESYSOPERATIONSIMP_H
#define QORN_2SYSTEM_FILESYSOPERATIONSIMP_H

#include "1Base/Error/ErrorMacros.h"
#include "1Base/Strings/StringsParameterList.h"
#include "2System/FileSys/FileSysExc.h"
#include "2System/FileSys/FileSysFileSpec.h"
#include "2System/FileSys/_Imp/FileSysSystemPath.h"

#include <boost/system/error_code.hpp>

#include <string>

namespace FileSys {
namespace Detail {

TEMPLMETA_TAG_NAME(OSFile);

/// An act that makes no sense on the files as they are, or that a call of the operating system
/// other than those of the path library refused. A handler for TExcFileSpec takes it too. Its tag
/// is in no anonymous namespace: it is raised in several source files, and the handler in
/// moveFile() has to know them all.
using TExcOSFile =
    Error::TExc<TemplMeta::CTag<CTag_Name_OSFile<char const*>>, TExcFileSysOp, TExcFileSpec>;

/// The system's text of a failure; empty where there was none, which the library calls "Success".
inline std::string reasonOf(boost::system::error_code const& error) {
    return error ? error.message() : std::string();
}

/// Both paths of a failed copy or move.
inline Strings::string keyOf(CFileSpec const& from, CFileSpec const& to) {
    return from.getFullName(false) + L", " + to.getFullName(false);
}

/// The parameters of Error::msgCouldNot.
template <class TKey, class TReason>
Strings::CParameterList<wchar_t> couldNot(char const* process, char const* type, TKey const& key,
                                          TReason const& reason) {
    return ERROR_PARAMS(ERROR_PARAM(process), ERROR_PARAM(type), ERROR_PARAM(key),
                        ERROR_PARAM(reason));
}

/// The parameters of Error::msgWrongArgument.
inline Strings::CParameterList<wchar_t> wrongArgument(CFileSpec const& key, char const* reason) {
    char const* const type = "file";
    return ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key), ERROR_PARAM(reason));
}

/// Copies one file, which is of `type`. Where `to` exists and `overwrite` is false nothing happens.
void doCopyFile(CFileSpec const& from, boost::filesystem::file_type type, CFileSpec const& to,
                bool overwrite);

} // namespace Detail
} // namespace FileSys

#endif
