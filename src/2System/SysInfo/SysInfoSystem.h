/// Who and where the system runs.
///
///     SysInfo::GetPlatformInformation();                            // "macOS 12.1.0"
///     SysInfo::GetModuleName(Modules::CModuleID(bundle));           // "Dictionary"
///     SysInfo::GetPressedKeyState(SysInfo::pksCommand);             // whether it is down now
///
/// All is asked of the system at each call but for three things that are kept for the life of the
/// process: the machine's name, the version of a module, and the text of the system's version. Safe
/// on several threads at once as long as no thread changes the environment; the exception is
/// GetModuleVersion().
#ifndef QORN_2SYSTEM_SYSINFOSYSTEM_H
#define QORN_2SYSTEM_SYSINFOSYSTEM_H

#include "1Base/Config/ConfigInt.h"
#include "1Base/Strings/StringsKinds.h"
#include "2System/Modules/ModulesModuleID.h"

namespace SysInfo {

/// The version of the operating system.
struct SystemInfo {
    Config::Int32 majorVersion = 0; ///< the 12 of 12.1.0
    Config::Int32 minorVersion = 0; ///< the 1
    Config::Int32 patchVersion = 0; ///< the 0; 0 too where the system tells none
};

/// A key that can be asked for. Any other value is a key that is never down.
enum PressedKeyState : Config::Int32 { pksCommand = 0 };

/// The full name of the user, or empty.
Strings::string GetCurrentUserName();

/// @{
/// The machine's name: asked for at each call, or once for the whole process.
Strings::string GetMachineName_();
Strings::string GetMachineName();
/// @}

/// The user's e-mail address, or empty.
Strings::string GetEmailAddress();

/// The name that the module's bundle gives itself, else the file name of its executable; empty
/// where there is neither, and for a module of another type than 0. Fails a check for a null
/// bundle.
Strings::string GetModuleName(Modules::ModuleID_t const& id);

/// The version that the module's bundle gives itself; empty for a module of another type than 0.
/// The first version found is the answer to every later call, whatever module that asks for. Raises
/// TExcSysInfoSystem where the bundle has none, and fails a check for a null bundle. The first
/// calls must not race with each other.
Strings::string GetModuleVersion(Modules::ModuleID_t const& id);

/// Whether the user's locale measures in metres.
bool UseMetricMeasurementSystem();

/// The version of the operating system. Asks the system each time and may start a process for it.
/// Fails a check where the system's answers make no version.
SystemInfo GetOperatingSystemInformation();

/// @{
/// The product's name and the version. The second is not cached.
///
///     GetOperatingSystemInformation_({10, 11, 6});   // "Mac OS X 10.11.6"
///
/// The first is: the text for the argument of the first call is the answer to all later ones,
/// whatever they ask for.
Strings::string GetOperatingSystemInformation(SystemInfo const& info);
Strings::string GetOperatingSystemInformation_(SystemInfo const& info);
/// @}

/// The text for the running system, from the same cache.
Strings::string GetPlatformInformation();

/// The same, and stores the first two numbers of the running system's version.
Strings::string GetPlatformInformation(int& majorVersion, int& minorVersion);

/// Whether the key is down at this moment.
bool GetPressedKeyState(PressedKeyState const& key);

/// @{
/// Always false: neither is looked for.
bool isContainerized();
bool isVirtualized();
/// @}

} // namespace SysInfo

#endif
