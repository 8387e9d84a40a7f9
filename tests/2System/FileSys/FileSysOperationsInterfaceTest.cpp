// Names, signatures and chains of the file operations: this unit has only to compile.

#include "2System/FileSys/FileSys.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include <type_traits>

namespace {

using FileSys::CFileSpec;
using FileSys::CTempFile;
using Strings::string;

using TOnOne = void(CFileSpec const&);
using TOnTwo = void(CFileSpec const&, CFileSpec const&, bool);

static_assert(std::is_same_v<decltype(FileSys::createFolder), TOnOne>);
static_assert(std::is_same_v<decltype(FileSys::deleteFile), void(CFileSpec const&, bool)>);
static_assert(
    std::is_same_v<decltype(FileSys::setFileAttributes), void(CFileSpec const&, bool, bool)>);
static_assert(std::is_same_v<decltype(FileSys::copyFile), TOnTwo>);
static_assert(std::is_same_v<decltype(FileSys::copyFileToFolder), TOnTwo>);
static_assert(std::is_same_v<decltype(FileSys::moveFile), TOnTwo>);
static_assert(std::is_same_v<decltype(FileSys::moveFileToFolder), TOnTwo>);
static_assert(std::is_same_v<decltype(FileSys::canOpen), bool(CFileSpec const&, unsigned int)>);
static_assert(std::is_same_v<decltype(FileSys::canRead), bool(CFileSpec const&)>);
static_assert(
    std::is_same_v<decltype(FileSys::createAliasFile), void(CFileSpec const&, CFileSpec const&)>);
static_assert(std::is_same_v<decltype(FileSys::resolveAlias), bool(CFileSpec const&, CFileSpec&)>);
static_assert(
    std::is_same_v<decltype(FileSys::setFileType), CFileSpec(CFileSpec const&, string const&)>);
static_assert(std::is_same_v<decltype(FileSys::indexFile), bool(CFileSpec&, unsigned int)>);

static_assert(std::is_same_v<decltype(FileSys::getTempPathName), CFileSpec()>);
static_assert(std::is_same_v<decltype(FileSys::createTempFile), CFileSpec(CFileSpec const&)>);
static_assert(std::is_same_v<decltype(FileSys::createTempFolder), CFileSpec(CFileSpec const&)>);
static_assert(std::is_same_v<decltype(&CFileSpec::isTemporary), bool (CFileSpec::*)() const>);
static_assert(std::is_same_v<decltype(&CTempFile::deleteFile), void (CTempFile::*)()>);
static_assert(std::is_same_v<decltype(&CTempFile::releaseFile), void (CTempFile::*)()>);

// A temporary file has one owner.
static_assert(!std::is_copy_constructible_v<CTempFile> && !std::is_copy_assignable_v<CTempFile>);
static_assert(!std::is_move_constructible_v<CTempFile> && !std::is_polymorphic_v<CTempFile>);
static_assert(std::is_constructible_v<CTempFile, CFileSpec> &&
              !std::is_convertible_v<CFileSpec, CTempFile>);
static_assert(sizeof(CTempFile) == sizeof(CFileSpec));

// The special chain has two parents, of which the second is the common one.
static_assert(
    std::is_same_v<FileSys::Detail::TExcOSFile,
                   Error::TExc<TemplMeta::CTag<FileSys::Detail::CTag_Name_OSFile<char const*>>,
                               FileSys::TExcFileSysOp, FileSys::TExcFileSpec>>);
static_assert(!std::is_base_of_v<FileSys::Detail::TExcOSFile, FileSys::TExcFileSpec>);

} // namespace
