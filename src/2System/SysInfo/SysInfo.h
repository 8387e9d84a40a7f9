/// Who and where the system runs, its well-known folders, and settings kept in folders.
#ifndef QORN_2SYSTEM_SYSINFO_H
#define QORN_2SYSTEM_SYSINFO_H

#include "2System/SysInfo/SysInfoExc.h"
#include "2System/SysInfo/SysInfoFolders.h"
#include "2System/SysInfo/SysInfoPreferenceFolder.h"
#include "2System/SysInfo/SysInfoSystem.h"
#include "2System/SysInfo/SysInfoSystemPrefs.h"

#endif
