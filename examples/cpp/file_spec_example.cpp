// Names a file by its path in UTF-8, takes the name apart, and makes other names of it.
//
// Prints:
//     folder:     /home/ada/Résumés
//     file:       letter 😀.odt
//     name:       letter 😀
//     extension:  odt
//     as PDF:     /home/ada/Résumés/letter 😀.pdf
//     backup:     /home/ada/Résumés/backup/letter 😀.odt
//     below home: yes

#include "1Base/Encoding/Encoding.h"
#include "2System/FileSys/FileSys.h"

#include <iostream>
#include <string>

namespace {

// Text inside the library is wide, one element a code point; it leaves as UTF-8.
std::string narrow(Strings::string const& text) {
    return Encoding::convert<std::string>(text);
}

} // namespace

int main() {
    std::string const argument = "/home/ada/R\xC3\xA9sum\xC3\xA9s/letter \xF0\x9F\x98\x80.odt";
    FileSys::CFileSpec const letter = FileSys::CFileSpec::parseUnixPath(argument);
    FileSys::CFileSpec const folder = letter.getParentFolder();

    std::cout << "folder:     " << folder.getFullName<std::string>(false) << '\n';
    std::cout << "file:       " << narrow(letter.getFile()) << '\n';
    std::cout << "name:       " << narrow(letter.getFileName()) << '\n';
    std::cout << "extension:  " << narrow(letter.getFileExtension()) << '\n';

    FileSys::CFileSpec printed = letter;
    printed.setFileExtension(L"pdf", true);
    std::cout << "as PDF:     " << printed.getFullName<std::string>(false) << '\n';

    FileSys::CFileSpec const backup = folder + L"backup/" + letter.getFile();
    std::cout << "backup:     " << backup.getFullName<std::string>(false) << '\n';

    bool const isBelowHome = backup.isSubFolderOf(L"/home/ada/");
    std::cout << "below home: " << (isBelowHome ? "yes" : "no") << '\n';
}
