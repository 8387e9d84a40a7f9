/// The well-known folders. All are looked up at each call; none need exist.
///
///     SysInfo::getUserDocumentFolder();   // "/home/ada/Documents"
#ifndef QORN_2SYSTEM_SYSINFOFOLDERS_H
#define QORN_2SYSTEM_SYSINFOFOLDERS_H

#include "1Base/Strings/StringsKinds.h"
#include "2System/FileSys/FileSysFileSpec.h"

namespace SysInfo {

/// @{
/// The path as the system tells it. Fails the check "[a count] > 0" where the system knows no such
/// folder.
Strings::string getUserDocumentFolder();
Strings::string getSharedUserDataFolder();
Strings::string getUserDesktopFolder();
Strings::string getUserLibraryFolder();
Strings::string getSystemLibraryFolder();
Strings::string getProgramsFolder();
Strings::string getSystemFontFolder();
Strings::string getAllUsersFontFolder();
Strings::string getUserFontFolder();
Strings::string getSystemApplicationSupportFolder();
Strings::string getUserApplicationSupportFolder();
/// @}

/// @{
/// The folder that holds the preferences of all programs.
FileSys::CFileSpec getUserPreferenceFolder();
FileSys::CFileSpec getSystemPreferenceFolder();
/// @}

/// @{
/// The environment's TMPDIR where it is set, an empty one included, otherwise the system's
/// temporary folder. All three give the same: there is no folder per user.
Strings::string getSystemTemporaryItemsFolder_();
Strings::string getSystemTemporaryItemsFolder();
Strings::string getUserTemporaryItemsFolder();
/// @}

/// Sets TMPDIR for the whole process and its child processes, then makes the folder's parent, whose
/// failure is swallowed, and the folder itself, whose failure passes to the caller. False where the
/// environment can't be changed. Not for use while another thread reads the environment.
bool setSystemTemporaryItemsFolder(Strings::string const& tmpPath);

} // namespace SysInfo

#endif
