#include "2System/FileSys/FileSysFileSpec.h"

namespace FileSys {

// There is nothing here that draws the icon of a file.
// NOLINTNEXTLINE(readability-convert-member-functions-to-static): macOS needs the object
bool CFileSpec::getIcon(std::string& rgb, std::string& alpha, int&, int&) const {
    rgb.clear();
    alpha.clear();
    return false;
}

} // namespace FileSys
