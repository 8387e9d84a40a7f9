#include "2System/SysInfo/SysInfoSystem.h"

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/Error/ErrorMacros.h"
#include "2System/MacOS/MacOSCFStringConverter.h"
#include "2System/MacOS/MacOSTempCFString.h"
#include "2System/SysInfo/SysInfoExc.h"

#include <CoreFoundation/CoreFoundation.h>

namespace SysInfo {
namespace {

bool isGivenByBundle(Modules::ModuleID_t const& id) {
    return id.getType() == 0;
}

CFBundleRef bundleOf(Modules::ModuleID_t const& id) {
    CFBundleRef const bundle = id.getBundle();
    return ERROR_ASSERT(bundle);
}

// The text belongs to the bundle.
CFStringRef infoOf(CFBundleRef bundle, CFStringRef key) {
    return static_cast<CFStringRef>(CFBundleGetValueForInfoDictionaryKey(bundle, key));
}

Strings::string executableName(CFBundleRef bundle) {
    CFURLRef const url = CFBundleCopyExecutableURL(bundle);
    if (url == nullptr)
        return Strings::string();
    CFStringRef const name = CFURLCopyLastPathComponent(url);
    CFRelease(url);
    return MacOS::GetStringFromCFString(MacOS::CTempCFString(name).get());
}

} // namespace

Strings::string GetCurrentUserName() {
    return MacOS::getUserName(false);
}

Strings::string GetMachineName_() {
    return MacOS::getMachineName();
}

Strings::string GetMachineName() {
    static Strings::string const machineName = GetMachineName_();
    return machineName;
}

Strings::string GetEmailAddress() {
    return MacOS::getUserEmailAddress();
}

Strings::string GetModuleName(Modules::ModuleID_t const& id) {
    if (!isGivenByBundle(id))
        return Strings::string();
    CFBundleRef const bundle = bundleOf(id);
    CFStringRef const name = infoOf(bundle, kCFBundleNameKey);
    if (name == nullptr)
        return executableName(bundle);
    CFRetain(name);
    return MacOS::GetStringFromCFString(MacOS::CTempCFString(name).get());
}

Strings::string GetModuleVersion(Modules::ModuleID_t const& id) {
    static Strings::string sModuleVersion;
    if (!sModuleVersion.empty() || !isGivenByBundle(id))
        return sModuleVersion;
    CFStringRef const version = infoOf(bundleOf(id), kCFBundleVersionKey);
    if (version == nullptr)
        ERROR_THROW(
            TExcSysInfoSystem, Error::msgCouldNot,
            ERROR_PARAMS(Error::buildNamedParameter("process", "get"),
                         Error::buildNamedParameter("type", "OS"),
                         Error::buildNamedParameter("key", "version info"),
                         Error::buildNamedParameter("reason", "no version info available")));
    sModuleVersion = MacOS::GetStringFromCFString(version);
    return sModuleVersion;
}

bool UseMetricMeasurementSystem() {
    return MacOS::usesMetricSystem();
}

bool GetPressedKeyState(PressedKeyState const& key) {
    return key == pksCommand && MacOS::isCmdPressed();
}

bool isContainerized() {
    return false;
}

bool isVirtualized() {
    return false;
}

} // namespace SysInfo
