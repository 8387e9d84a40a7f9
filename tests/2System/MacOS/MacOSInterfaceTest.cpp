// Names and signatures of the module: this unit has only to compile.

#include "2System/MacOS/MacOS.h"

#include <string>
#include <type_traits>
#include <utility>

namespace {

using MacOS::CTempCFString;

static_assert(
    std::is_same_v<decltype(MacOS::GetStringUTF16FromCFString), Strings::stringUTF16(CFStringRef)>);
static_assert(std::is_same_v<decltype(MacOS::GetStringFromCFString), Strings::string(CFStringRef)>);

template <class TArgument>
constexpr bool makesAPlatformString =
    std::is_same_v<decltype(MacOS::GetCFString(std::declval<TArgument>())), CFStringRef>;

static_assert(makesAPlatformString<std::string const&>);
static_assert(makesAPlatformString<Strings::stringUTF16 const&>);
static_assert(makesAPlatformString<unsigned char const*>);
static_assert(makesAPlatformString<Strings::string const&>);
static_assert(makesAPlatformString<std::basic_string<unsigned char> const&>);

template <auto function>
constexpr bool exists = true;

static_assert(exists<static_cast<CFStringRef (*)(std::string const&)>(MacOS::GetCFString)>);
static_assert(
    exists<static_cast<CFStringRef (*)(Strings::stringUTF16 const&)>(MacOS::GetCFString)>);
static_assert(exists<static_cast<CFStringRef (*)(unsigned char const*)>(MacOS::GetCFString)>);

static_assert(std::is_same_v<decltype(MacOS::getTime), Time::CDateTime(DateTimeRec const&)>);
static_assert(
    std::is_same_v<decltype(MacOS::convertToPosixPath), std::string(FileSys::CFileSpec const&)>);

static_assert(std::is_constructible_v<CTempCFString, CFStringRef>);
static_assert(std::is_constructible_v<CTempCFString, CFMutableStringRef>);
static_assert(std::is_constructible_v<CTempCFString, std::string const&>);
static_assert(std::is_constructible_v<CTempCFString, Strings::stringUTF16 const&>);
static_assert(std::is_constructible_v<CTempCFString, Strings::string const&>);
static_assert(!std::is_default_constructible_v<CTempCFString>);
static_assert(!std::is_copy_constructible_v<CTempCFString>);
static_assert(!std::is_move_constructible_v<CTempCFString>);
static_assert(!std::is_constructible_v<CTempCFString, CTempCFString&>);
static_assert(!std::is_copy_assignable_v<CTempCFString>);
static_assert(!std::is_move_assignable_v<CTempCFString>);
// Nothing becomes a platform string unasked.
static_assert(!std::is_convertible_v<CFStringRef, CTempCFString>);
static_assert(!std::is_convertible_v<Strings::string, CTempCFString>);
static_assert(
    std::is_same_v<decltype(&CTempCFString::get), CFStringRef (CTempCFString::*)() const>);

} // namespace
