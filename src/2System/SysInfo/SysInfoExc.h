/// The exceptions and the logger of system facts and preferences.
#ifndef QORN_2SYSTEM_SYSINFOEXC_H
#define QORN_2SYSTEM_SYSINFOEXC_H

#include "1Base/Error/ErrorSystem.h"

namespace SysInfo {

TEMPLMETA_TAG_NAME(SysInfo);
TEMPLMETA_TAG_NAME(SysInfoSystem);
TEMPLMETA_TAG_NAME(SystemPrefs);
TEMPLMETA_TAG_NAME(PreferenceFolder);

/// Everything that the system is asked for. Never raised itself.
using TExcSysInfo = Error::TExc<TemplMeta::CTag<CTag_Name_SysInfo<char const*>>, TExcSystem>;

/// A fact about the system or a module that cannot be had.
using TExcSysInfoSystem =
    Error::TExc<TemplMeta::CTag<CTag_Name_SysInfoSystem<char const*>>, TExcSysInfo>;

/// Everything that deals with preferences. Never raised itself.
using TExcSystemPrefs =
    Error::TExc<TemplMeta::CTag<CTag_Name_SystemPrefs<char const*>>, TExcSysInfo>;

/// A value of a store that can't be written or removed.
using TExcPreferenceFolder =
    Error::TExc<TemplMeta::CTag<CTag_Name_PreferenceFolder<char const*>>, TExcSystemPrefs>;

/// The logger of system facts and preferences.
using TLoggerSysInfo =
    Error::CLogger<TemplMeta::CTag<CTag_Name_SysInfo<char const*>>, Error::TStdSeverities,
                   Error::TStdTargets, TLoggerSystem, TemplMeta::CAnd>;

} // namespace SysInfo

#endif
