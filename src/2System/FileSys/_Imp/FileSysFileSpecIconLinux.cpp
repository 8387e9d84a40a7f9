#include "2System/FileSys/FileSysFileSpec.h"

namespace FileSys {

// There is nothing here that draws the icon of a file.
bool CFileSpec::getIcon(std::string& rgb, std::string& alpha, int&, int&) const {
    rgb.clear();
    alpha.clear();
    return false;
}

} // namespace FileSys
