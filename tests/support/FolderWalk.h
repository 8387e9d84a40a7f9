/// What an iterator over folders delivers, as names to compare.
///
///     TestSupport::namesBelow(path(), CDirIterator(root, CDirIterator::eRecursive, 3));
///     // {"a", "x", "x/f"}
#ifndef QORN_TESTS_FOLDERWALK_H
#define QORN_TESTS_FOLDERWALK_H

#include "2System/FileSys/FileSysDirIterator.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace TestSupport {

using TNames = std::vector<std::string>;

inline constexpr unsigned int filesAndFolders =
    FileSys::CDirIterator::eFiles | FileSys::CDirIterator::eFolders;

/// The entries from where the iterator stands, by their paths from `folder`, below which all must
/// lie.
inline TNames namesBelow(std::string const& folder, FileSys::CDirIterator iterator) {
    TNames names;
    std::string const prefix = folder + "/";
    for (; iterator != FileSys::CDirIterator(); ++iterator) {
        std::string const path = iterator->getFullName<std::string>(false);
        EXPECT_EQ(path.compare(0, prefix.size(), prefix), 0) << path;
        names.push_back(path.substr(prefix.size()));
    }
    return names;
}

} // namespace TestSupport

#endif
