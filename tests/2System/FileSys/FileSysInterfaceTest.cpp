// Names and signatures of the module: this unit has only to compile.

#include "2System/FileSys/FileSys.h"

#include <functional>
#include <iterator>
#include <list>
#include <ostream>
#include <set>
#include <string>
#include <type_traits>
#include <utility>

namespace {

using FileSys::CDirIterator;
using FileSys::CFileInfo;
using FileSys::CFileSpec;
using Strings::string;

static_assert(std::is_nothrow_move_constructible_v<CFileSpec>);
static_assert(std::is_nothrow_move_assignable_v<CFileSpec>);
static_assert(std::is_copy_constructible_v<CFileSpec> && std::is_copy_assignable_v<CFileSpec>);
static_assert(std::is_default_constructible_v<CFileSpec> && !std::is_polymorphic_v<CFileSpec>);
static_assert(sizeof(CFileSpec) == sizeof(string));
static_assert(std::is_convertible_v<wchar_t const*, CFileSpec>);
static_assert(std::is_convertible_v<string const&, CFileSpec>);
static_assert(std::is_convertible_v<std::string const&, CFileSpec>);
static_assert(std::is_convertible_v<Strings::stringUTF16 const&, CFileSpec>);
// A narrow literal does not say that it is UTF-8: a std::string does.
static_assert(!std::is_constructible_v<CFileSpec, char const*>);
static_assert(std::is_same_v<decltype(std::declval<CFileSpec&>() = std::declval<string const&>()),
                             CFileSpec&>);
static_assert(std::is_same_v<decltype(std::declval<CFileSpec&>() = std::declval<wchar_t const*>()),
                             CFileSpec&>);

template <auto function>
constexpr bool exists = true;

static_assert(exists<static_cast<CFileSpec (*)(string const&)>(CFileSpec::parseUnixPath)>);
static_assert(exists<static_cast<CFileSpec (*)(std::string const&)>(CFileSpec::parseUnixPath)>);
static_assert(exists<static_cast<string (CFileSpec::*)(bool) const>(&CFileSpec::getFullName)>);
static_assert(exists<static_cast<std::string (CFileSpec::*)(bool) const>(
                  &CFileSpec::getFullName<std::string>)>);

using TText = string (CFileSpec::*)() const;
static_assert(std::is_same_v<decltype(&CFileSpec::getPath), TText>);
static_assert(std::is_same_v<decltype(&CFileSpec::getFile), TText>);
static_assert(std::is_same_v<decltype(&CFileSpec::getFileName), TText>);
static_assert(std::is_same_v<decltype(&CFileSpec::getFileExtension), TText>);
static_assert(std::is_same_v<decltype(&CFileSpec::empty), bool (CFileSpec::*)() const>);
static_assert(
    std::is_same_v<decltype(&CFileSpec::getParentFolder), CFileSpec (CFileSpec::*)() const>);
static_assert(std::is_same_v<decltype(&CFileSpec::isSubFolderOf),
                             bool (CFileSpec::*)(CFileSpec const&) const>);
static_assert(std::is_same_v<decltype(&CFileSpec::setFileExtension),
                             void (CFileSpec::*)(string const&, bool)>);
static_assert(
    std::is_same_v<decltype(&CFileSpec::operator+=), CFileSpec& (CFileSpec::*)(string const&)>);
static_assert(std::is_same_v<decltype(CFileSpec::getPathSeparator), wchar_t()>);
static_assert(std::is_same_v<decltype(CFileSpec::getExtensionSeparator), wchar_t()>);
static_assert(std::is_same_v<decltype(CFileSpec::getForbiddenChars), string()>);

using TCompare = bool (*)(CFileSpec const&, CFileSpec const&);
static_assert(exists<static_cast<TCompare>(FileSys::operator==)>);
static_assert(exists<static_cast<TCompare>(FileSys::operator<)>);
static_assert(exists<static_cast<CFileSpec (*)(CFileSpec, string const&)>(FileSys::operator+)>);
static_assert(
    exists<static_cast<std::basic_ostream<wchar_t>& (*)(std::basic_ostream<wchar_t>&,
                                                        CFileSpec const&)>(FileSys::operator<<)>);
static_assert(std::is_same_v<std::set<CFileSpec>::key_compare, std::less<CFileSpec>>);

using TQuestion = bool (CFileSpec::*)() const;
using TRelation = CFileSpec (CFileSpec::*)(CFileSpec const&) const;
static_assert(std::is_same_v<decltype(CFileSpec::convertRelativeToAbsolutePath),
                             CFileSpec(CFileSpec const&, CFileSpec const&)>);
static_assert(std::is_same_v<decltype(&CFileSpec::getBasePath), TRelation>);
static_assert(std::is_same_v<decltype(&CFileSpec::getRelativePath), TRelation>);
static_assert(std::is_same_v<decltype(CFileSpec::makeFileName), string(string const&)>);
static_assert(std::is_same_v<decltype(CFileSpec::getCurrentWorkingDir), CFileSpec()>);
static_assert(std::is_same_v<decltype(&CFileSpec::exists), TQuestion>);
static_assert(std::is_same_v<decltype(&CFileSpec::isFolder), TQuestion>);
static_assert(std::is_same_v<decltype(&CFileSpec::isTemporary), TQuestion>);
static_assert(
    std::is_same_v<decltype(&CFileSpec::getFileSize), unsigned long long (CFileSpec::*)() const>);
static_assert(std::is_same_v<decltype(&CFileSpec::getFileInfo), CFileInfo (CFileSpec::*)() const>);
static_assert(std::is_same_v<decltype(&CFileSpec::getIcon),
                             bool (CFileSpec::*)(std::string&, std::string&, int&, int&) const>);
static_assert(std::is_same_v<decltype(FileSys::createFileSpecFromAcrobatFileSpec),
                             CFileSpec(std::string const&, int, int)>);
static_assert(
    std::is_same_v<decltype(FileSys::cleanFileSpecList), void(std::list<CFileSpec>&, bool)>);

static_assert(std::is_constructible_v<CFileInfo, string const&>);
static_assert(std::is_copy_constructible_v<CFileInfo> && std::is_copy_assignable_v<CFileInfo>);
static_assert(!std::is_default_constructible_v<CFileInfo> && !std::is_polymorphic_v<CFileInfo>);
static_assert(sizeof(CFileInfo) == sizeof(void*));
using TFact = bool (CFileInfo::*)() const;
static_assert(std::is_same_v<decltype(&CFileInfo::exists), TFact>);
static_assert(std::is_same_v<decltype(&CFileInfo::isFolder), TFact>);
static_assert(std::is_same_v<decltype(&CFileInfo::isHidden), TFact>);
static_assert(std::is_same_v<decltype(&CFileInfo::isReadOnly), TFact>);
static_assert(
    std::is_same_v<decltype(&CFileInfo::getFileSize), unsigned long long (CFileInfo::*)() const>);
using TMoment = Time::CDateTime (CFileInfo::*)() const;
static_assert(std::is_same_v<decltype(&CFileInfo::getCreationDate), TMoment>);
static_assert(std::is_same_v<decltype(&CFileInfo::getModificationDate), TMoment>);

using TRecursive = CDirIterator::ERecursive;
static_assert(CDirIterator::eNotRecursive == 0 && CDirIterator::eRecursive == 1);
static_assert(CDirIterator::eFiles == 1 && CDirIterator::eFolders == 2);
static_assert(std::is_default_constructible_v<CDirIterator>);
static_assert(std::is_constructible_v<CDirIterator, CFileSpec const&, TRecursive, unsigned int>);
static_assert(std::is_constructible_v<CDirIterator, CFileSpec const&, unsigned int, TRecursive>);
static_assert(std::is_constructible_v<CDirIterator, CFileSpec const&, string const&, TRecursive,
                                      unsigned int>);
static_assert(std::is_constructible_v<CDirIterator, CFileSpec const&, string const&, unsigned int,
                                      TRecursive>);
static_assert(std::is_copy_constructible_v<CDirIterator> &&
              std::is_copy_assignable_v<CDirIterator> && !std::is_polymorphic_v<CDirIterator>);
static_assert(
    std::is_same_v<std::iterator_traits<CDirIterator>::iterator_category, std::input_iterator_tag>);
static_assert(
    std::is_same_v<decltype(&CDirIterator::operator*), CFileSpec const& (CDirIterator::*)() const>);
static_assert(std::is_same_v<decltype(&CDirIterator::operator->),
                             CFileSpec const* (CDirIterator::*)() const>);
static_assert(std::is_same_v<decltype(++std::declval<CDirIterator&>()), CDirIterator&>);
static_assert(std::is_same_v<decltype(std::declval<CDirIterator const&>() ==
                                      std::declval<CDirIterator const&>()),
                             bool>);
static_assert(std::is_same_v<decltype(std::declval<CDirIterator const&>() !=
                                      std::declval<CDirIterator const&>()),
                             bool>);

} // namespace
