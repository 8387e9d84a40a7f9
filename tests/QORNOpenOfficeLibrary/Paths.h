/// Folders as a test hands them over, and as it reads them back.
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_PATHS_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_PATHS_H

#include "QORNOpenOfficeLibrary/QORNOoLibraryPaths.h"

#include <array>
#include <string>
#include <vector>

namespace BridgeTest {

/// The five arguments in UTF-16, as Java has them.
using TFolders = std::array<std::u16string, 5>;

using TTexts = std::vector<std::wstring>;

/// The texts of getPaths() from the index `first` on.
inline TTexts textsFrom(std::size_t first) {
    TTexts texts;
    for (std::size_t index = first; index < getPaths().size(); ++index)
        texts.push_back(getPaths()[index].getFullName(false));
    return texts;
}

} // namespace BridgeTest

#endif
