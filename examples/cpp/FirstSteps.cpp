#include "2System/FileSys/FileSys.h"

#include <iostream>
#include <string>

int main() {
    FileSys::CFileSpec letter(L"/home/ada/Gr\u00FC\u00DFe.odt");
    letter.setFileExtension(L"pdf", true);
    std::cout << letter.getFile().length() << '\n';             // 9: one element a code point
    std::cout << letter.getFullName<std::string>(true) << '\n'; // the path in UTF-8
}
