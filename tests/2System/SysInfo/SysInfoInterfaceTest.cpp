// Names, values and signatures of the module: this unit has only to compile.

#include "2System/SysInfo/SysInfo.h"

#include <string>
#include <type_traits>
#include <utility>
#include <vector>

namespace {

using MacOS::CAuthorizationBase;
using Strings::string;
using SysInfo::CPreferenceFolder;
using SysInfo::CSystemPrefs;
using SysInfo::CSystemPrefsPath;
using SysInfo::PressedKeyState;
using SysInfo::SystemInfo;
using SysInfo::TByteVector;

// System facts.

static_assert(std::is_same_v<decltype(SystemInfo::majorVersion), Config::Int32>);
static_assert(std::is_same_v<decltype(SystemInfo::minorVersion), Config::Int32>);
static_assert(std::is_same_v<decltype(SystemInfo::patchVersion), Config::Int32>);
static_assert(sizeof(SystemInfo) == 3 * sizeof(Config::Int32));
static_assert(SystemInfo().majorVersion == 0 && SystemInfo().minorVersion == 0);
static_assert(SystemInfo{1, 2, 3}.majorVersion == 1 && SystemInfo{1, 2, 3}.minorVersion == 2);
static_assert(SystemInfo().patchVersion == 0 && SystemInfo{1, 2, 3}.patchVersion == 3);

static_assert(SysInfo::pksCommand == 0);
static_assert(std::is_same_v<std::underlying_type_t<PressedKeyState>, Config::Int32>);
static_assert(std::is_convertible_v<PressedKeyState, Config::Int32>);

static_assert(std::is_same_v<decltype(SysInfo::GetCurrentUserName), string()>);
static_assert(std::is_same_v<decltype(SysInfo::GetMachineName_), string()>);
static_assert(std::is_same_v<decltype(SysInfo::GetMachineName), string()>);
static_assert(std::is_same_v<decltype(SysInfo::GetEmailAddress), string()>);
static_assert(std::is_same_v<decltype(SysInfo::GetModuleName), string(Modules::ModuleID_t const&)>);
static_assert(
    std::is_same_v<decltype(SysInfo::GetModuleVersion), string(Modules::ModuleID_t const&)>);
static_assert(std::is_same_v<decltype(SysInfo::UseMetricMeasurementSystem), bool()>);
static_assert(
    std::is_same_v<decltype(SysInfo::GetOperatingSystemInformation_), string(SystemInfo const&)>);
static_assert(std::is_same_v<decltype(SysInfo::GetPressedKeyState), bool(PressedKeyState const&)>);
static_assert(std::is_same_v<decltype(SysInfo::isContainerized), bool()>);
static_assert(std::is_same_v<decltype(SysInfo::isVirtualized), bool()>);

template <auto function>
constexpr bool exists = true;

static_assert(exists<static_cast<SystemInfo (*)()>(SysInfo::GetOperatingSystemInformation)>);
static_assert(
    exists<static_cast<string (*)(SystemInfo const&)>(SysInfo::GetOperatingSystemInformation)>);
static_assert(exists<static_cast<string (*)()>(SysInfo::GetPlatformInformation)>);
static_assert(exists<static_cast<string (*)(int&, int&)>(SysInfo::GetPlatformInformation)>);

// Preferences.

static_assert(CSystemPrefs::ekMachine == 0 && CSystemPrefs::ekUser == 1);
static_assert(std::is_same_v<std::underlying_type_t<CSystemPrefs::EKind>, Config::Int32>);
static_assert(std::is_convertible_v<CSystemPrefs::EKind, Config::Int32>);
static_assert(CSystemPrefs::erRead != CSystemPrefs::erWrite);
static_assert(std::is_same_v<CPreferenceFolder::TKind, CSystemPrefs::EKind>);
static_assert(std::is_same_v<CPreferenceFolder::TRight, CSystemPrefs::ERight>);

static_assert(
    std::is_same_v<decltype(&CSystemPrefsPath::get), std::string (CSystemPrefsPath::*)() const>);
static_assert(std::is_constructible_v<CSystemPrefsPath, std::string const&>);
static_assert(sizeof(CSystemPrefsPath) == sizeof(std::string));
// A path and a key are not to be mixed up.
static_assert(!std::is_convertible_v<std::string, CSystemPrefsPath>);

static_assert(std::is_same_v<TByteVector, std::vector<unsigned char>>);
static_assert(std::is_same_v<SysInfo::TAuthorization, CAuthorizationBase*>);

static_assert(std::is_abstract_v<CAuthorizationBase>);
static_assert(std::has_virtual_destructor_v<CAuthorizationBase>);
static_assert(
    std::is_same_v<decltype(&CAuthorizationBase::isAuthorized), bool (CAuthorizationBase::*)()>);
static_assert(
    std::is_same_v<decltype(&CAuthorizationBase::authorize), bool (CAuthorizationBase::*)()>);
static_assert(std::is_same_v<decltype(&CAuthorizationBase::execute),
                             bool (CAuthorizationBase::*)(Strings::stringUTF8,
                                                          std::vector<Strings::stringUTF8>)>);

static_assert(std::is_constructible_v<CPreferenceFolder, CSystemPrefs::EKind, CSystemPrefs::ERight,
                                      CSystemPrefsPath const&, bool, SysInfo::TAuthorization>);
static_assert(!std::is_polymorphic_v<CPreferenceFolder>);
static_assert(
    std::is_same_v<decltype(&CPreferenceFolder::getValue),
                   TByteVector& (CPreferenceFolder::*)(CSystemPrefsPath const&, std::string const&,
                                                       TByteVector&) const>);
static_assert(std::is_same_v<decltype(&CPreferenceFolder::setValue),
                             void (CPreferenceFolder::*)(CSystemPrefsPath const&,
                                                         std::string const&, TByteVector const&)>);
static_assert(std::is_same_v<decltype(&CPreferenceFolder::deleteKey),
                             void (CPreferenceFolder::*)(CSystemPrefsPath const&)>);
static_assert(
    std::is_same_v<decltype(&CPreferenceFolder::deleteValue),
                   void (CPreferenceFolder::*)(CSystemPrefsPath const&, std::string const&)>);
static_assert(std::is_same_v<decltype(&CPreferenceFolder::getValues),
                             std::vector<Strings::stringUTF8> (CPreferenceFolder::*)() const>);
static_assert(std::is_same_v<decltype(&CPreferenceFolder::getPaths),
                             std::vector<string> (CPreferenceFolder::*)() const>);

} // namespace
