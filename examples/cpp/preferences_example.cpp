// Keeps settings of a window below the user's preference folder, and reads them back as the next
// run of a program would.
//
// Prints:
//     first run:  80 x 25
//     second run: 132 x 43
//     settings:   size, title
//     title:      Résumé

#include "2System/SysInfo/SysInfo.h"

#include <iostream>
#include <string>

namespace {

using SysInfo::CPreferenceFolder;
using SysInfo::CSystemPrefs;
using SysInfo::CSystemPrefsPath;
using SysInfo::TByteVector;

CPreferenceFolder openSettings() {
    return CPreferenceFolder(CSystemPrefs::ekUser, CSystemPrefs::erWrite,
                             CSystemPrefsPath("Preferences Example/Window"), true, nullptr);
}

// A value that was never written leaves the default.
void printSize(std::string const& run) {
    TByteVector size = {80, 25};
    openSettings().getValue(CSystemPrefsPath(), "size", size);
    std::cout << run << int{size.at(0)} << " x " << int{size.at(1)} << '\n';
}

} // namespace

int main() {
    printSize("first run:  ");

    CPreferenceFolder settings = openSettings();
    std::string const title = "R\xC3\xA9sum\xC3\xA9";
    settings.setValue(CSystemPrefsPath(), "size", {132, 43});
    settings.setValue(CSystemPrefsPath(), "title", TByteVector(title.begin(), title.end()));
    printSize("second run: ");

    std::cout << "settings:   ";
    std::string separator;
    for (std::string const& key : settings.getValues()) {
        std::cout << separator << key;
        separator = ", ";
    }
    TByteVector value;
    settings.getValue(CSystemPrefsPath(), "title", value);
    std::cout << "\ntitle:      " << std::string(value.begin(), value.end()) << '\n';

    // A value is a file and a path is a folder: the example leaves neither.
    CPreferenceFolder(CSystemPrefs::ekUser, CSystemPrefs::erWrite,
                      CSystemPrefsPath("Preferences Example"), false, nullptr)
        .deleteKey(CSystemPrefsPath());
}
