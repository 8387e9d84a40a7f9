#include "2System/SysInfo/SysInfoFolders.h"

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/Error/ErrorMacros.h"
#include "2System/FileSys/FileSysOperations.h"

#include <cstdlib>
#include <string>

namespace SysInfo {

Strings::string getUserDocumentFolder() {
    return MacOS::getSpecialFolder(MacOS::sftDocuments, MacOS::sfdUser);
}

Strings::string getSharedUserDataFolder() {
    return MacOS::getSpecialFolder(MacOS::sftSharedUserData, MacOS::sfdLocal);
}

Strings::string getUserDesktopFolder() {
    return MacOS::getSpecialFolder(MacOS::sftDesktop, MacOS::sfdUser);
}

Strings::string getUserLibraryFolder() {
    return MacOS::getSpecialFolder(MacOS::sftLibrary, MacOS::sfdUser);
}

Strings::string getSystemLibraryFolder() {
    return MacOS::getSpecialFolder(MacOS::sftLibrary, MacOS::sfdLocal);
}

Strings::string getProgramsFolder() {
    return MacOS::getSpecialFolder(MacOS::sftPrograms, MacOS::sfdLocal);
}

Strings::string getSystemFontFolder() {
    return MacOS::getSpecialFolder(MacOS::sftFonts, MacOS::sfdSystem);
}

Strings::string getAllUsersFontFolder() {
    return MacOS::getSpecialFolder(MacOS::sftFonts, MacOS::sfdLocal);
}

Strings::string getUserFontFolder() {
    return MacOS::getSpecialFolder(MacOS::sftFonts, MacOS::sfdUser);
}

Strings::string getSystemApplicationSupportFolder() {
    return MacOS::getSpecialFolder(MacOS::sftApplicationSupport, MacOS::sfdLocal);
}

Strings::string getUserApplicationSupportFolder() {
    return MacOS::getSpecialFolder(MacOS::sftApplicationSupport, MacOS::sfdUser);
}

FileSys::CFileSpec getUserPreferenceFolder() {
    return MacOS::getSpecialFolder(MacOS::sftPreferences, MacOS::sfdUser);
}

FileSys::CFileSpec getSystemPreferenceFolder() {
    return MacOS::getSpecialFolder(MacOS::sftPreferences, MacOS::sfdLocal);
}

Strings::string getSystemTemporaryItemsFolder_() {
    ERROR_BLOCK_BEGIN
    if (char const* const folder = std::getenv("TMPDIR"))
        return Encoding::convert<Strings::string>(folder);
    return MacOS::getSpecialFolder(MacOS::sftTemporaryItems, MacOS::sfdLocal);
    ERROR_BLOCK_END
}

Strings::string getSystemTemporaryItemsFolder() {
    return getSystemTemporaryItemsFolder_();
}

Strings::string getUserTemporaryItemsFolder() {
    return getSystemTemporaryItemsFolder_();
}

bool setSystemTemporaryItemsFolder(Strings::string const& tmpPath) {
    ERROR_BLOCK_BEGIN
    if (setenv("TMPDIR", Encoding::convert<std::string>(tmpPath).c_str(), 1) != 0)
        return false;
    FileSys::CFileSpec const folder(tmpPath);
    try {
        FileSys::createFolder(folder.getParentFolder());
    } catch (Error::CException const&) {
        // A bare name has no parent, and what else is wrong shows at the folder itself.
    }
    FileSys::createFolder(folder);
    return true;
    ERROR_BLOCK_END
}

} // namespace SysInfo
