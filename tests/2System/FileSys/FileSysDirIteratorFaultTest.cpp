// The system's own listing fails in the middle.

#include "2System/FileSys/FileSysDirIterator.h"

#include "support/FileRoot.h"
#include "support/FolderWalk.h"

#include <gtest/gtest.h>

#include <dirent.h>

#include <algorithm>
#include <cerrno>
#include <string>
#include <vector>

namespace {

// How many more entries are read before each call fails; none fails at -1.
int readsLeft = -1;
// What was read since the last setting, but for the system's own two names.
std::vector<std::string> namesRead;
bool hasFailed = false;
// The call of opendir that fails: 1 is the next one.
int openToFail = 0;
// Whether entries come without their type, as from some file systems.
bool hidesTypes = false;

} // namespace

extern "C" {
dirent* __real_readdir(DIR* stream);
dirent* __wrap_readdir(DIR* stream);
DIR* __real_opendir(char const* name);
DIR* __wrap_opendir(char const* name);

dirent* __wrap_readdir(DIR* stream) {
    if (readsLeft == 0) {
        hasFailed = true;
        errno = EIO;
        return nullptr;
    }
    if (readsLeft > 0)
        --readsLeft;
    dirent* const entry = __real_readdir(stream);
    if (entry == nullptr)
        return entry;
    if (hidesTypes)
        entry->d_type = DT_UNKNOWN;
    std::string const name = entry->d_name;
    if (name != "." && name != "..")
        namesRead.push_back(name);
    return entry;
}

DIR* __wrap_opendir(char const* name) {
    if (openToFail > 0 && --openToFail == 0) {
        errno = EMFILE;
        return nullptr;
    }
    return __real_opendir(name);
}
}

namespace {

using FileSys::CDirIterator;
using FileSys::CFileSpec;
using TestSupport::makeFolders;
using TestSupport::TNames;
using TestSupport::writeFile;

class FileSysDirIteratorFaultTest : public TestSupport::CFileRootTest {
  protected:
    void TearDown() override {
        readsLeft = -1;
        openToFail = 0;
        hidesTypes = false;
        CFileRootTest::TearDown();
    }

    TNames walk() const {
        return TestSupport::namesBelow(path(),
                                       CDirIterator(CFileSpec(path()), CDirIterator::eRecursive,
                                                    TestSupport::filesAndFolders));
    }
};

TEST_F(FileSysDirIteratorFaultTest, WhatWasFoundBeforeAFailureIsDeliveredButForTheLast) {
    constexpr int entries = 8;
    for (char name = 'a'; name < 'a' + entries; ++name)
        writeFile(path(std::string(1, name)));
    for (int reads = 0; reads <= entries + 3; ++reads) {
        readsLeft = reads;
        namesRead.clear();
        hasFailed = false;
        TNames const names = walk();
        TNames expected = namesRead;
        // The listing moves on before an entry is looked at.
        if (hasFailed && !expected.empty())
            expected.pop_back();
        std::sort(expected.begin(), expected.end());
        EXPECT_EQ(names, expected) << reads << " reads";
    }
    readsLeft = -1;
    EXPECT_EQ(walk().size(), static_cast<std::size_t>(entries));
}

TEST_F(FileSysDirIteratorFaultTest, AFolderThatCannotBeOpenedLosesOnlyItsOwn) {
    makeFolders(path("x"));
    makeFolders(path("y"));
    for (char const* const name : {"a", "x/f", "y/g"})
        writeFile(path(name));
    openToFail = 1;
    EXPECT_EQ(walk(), TNames());
    openToFail = 2;
    EXPECT_EQ(walk(), (TNames{"a", "x", "y", "y/g"}));
    openToFail = 3;
    EXPECT_EQ(walk(), (TNames{"a", "x", "x/f", "y"}));
    openToFail = 4;
    EXPECT_EQ(walk(), (TNames{"a", "x", "x/f", "y", "y/g"}));
}

TEST_F(FileSysDirIteratorFaultTest, WhereTheListingHasNoTypesTheDiskIsAsked) {
    makeFolders(path("x"));
    for (char const* const name : {"a", "x/f"})
        writeFile(path(name));
    TestSupport::makeLink("x", path("y"));
    TestSupport::makeLink("missing", path("z"));
    hidesTypes = true;
    EXPECT_EQ(walk(), (TNames{"a", "x", "x/f", "y", "y/f"}));
}

} // namespace
