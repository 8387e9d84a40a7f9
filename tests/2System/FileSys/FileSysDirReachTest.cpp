// Folders whose paths are too long for the system, where something is wrong with them. A path grows
// by "./", which leads nowhere else.

#include "2System/FileSys/_Imp/FileSysDirReach.h"

#include "1Base/Encoding/EncodingExc.h"
#include "2System/FileSys/_Imp/FileSysDirListing.h"
#include "2System/FileSys/_Imp/FileSysDirSiblings.h"

#include "support/FileRoot.h"

#include <gtest/gtest.h>

#include <dirent.h>
#include <limits.h>

#include <cerrno>
#include <string>
#include <system_error>
#include <vector>

namespace {

bool isStreamRefused = false;

} // namespace

extern "C" {
DIR* __real_fdopendir(int file);
DIR* __wrap_fdopendir(int file);

DIR* __wrap_fdopendir(int file) {
    if (!isStreamRefused)
        return __real_fdopendir(file);
    errno = ENOMEM;
    return nullptr;
}
}

namespace {

using FileSys::CDirListing;
using FileSys::CDirReach;
using TestSupport::makeFolders;
using TestSupport::writeFile;

class FileSysDirReachTest : public TestSupport::CFileRootTest {
  protected:
    // A path below the root with its last name far behind.
    std::string longPath(std::string const& name) const {
        std::string text = path();
        while (text.size() <= PATH_MAX)
            text += "/.";
        return text + "/" + name;
    }

    // The names in a folder, or the error.
    std::vector<std::string> listed(std::string const& folder) {
        std::vector<std::string> names;
        try {
            for (CDirListing listing(folder, 0, reach_); listing.next();)
                names.emplace_back(listing.name());
        } catch (std::system_error const& exc) {
            return {"error " + std::to_string(exc.code().value())};
        }
        return names;
    }

    static std::vector<std::string> failed(int error) { return {"error " + std::to_string(error)}; }

    static std::size_t openFiles() { return TestSupport::listTree("/proc/self/fd").size(); }

    CDirReach reach_;
};

TEST_F(FileSysDirReachTest, ALongPathIsListedFromWhereverTheLastOneWas) {
    makeFolders(path("a"));
    makeFolders(path("b"));
    writeFile(path("a/one"));
    writeFile(path("b/two"));
    EXPECT_EQ(listed(longPath("a")), std::vector<std::string>{"one"});
    EXPECT_EQ(listed(longPath("b")), std::vector<std::string>{"two"});
    // Another way, which does not begin as the last one.
    EXPECT_EQ(listed("/." + longPath("a")), std::vector<std::string>{"one"});
}

TEST_F(FileSysDirReachTest, ANameOfThatLengthIsTooLong) {
    EXPECT_EQ(listed(std::string(PATH_MAX, 'n')), failed(ENAMETOOLONG));
    EXPECT_EQ(listed("/" + std::string(PATH_MAX, 'n')), failed(ENAMETOOLONG));
}

TEST_F(FileSysDirReachTest, WhatIsMissingOnTheWayOrAtItsEndIsAFailure) {
    std::string const there = longPath("missing");
    EXPECT_EQ(listed(there), failed(ENOENT));
    EXPECT_EQ(listed(path("missing") + there.substr(path().size())), failed(ENOENT));
}

TEST_F(FileSysDirReachTest, AFolderThatCannotBeListedIsClosedAgain) {
    makeFolders(path("a"));
    std::string const folder = longPath("a");
    EXPECT_TRUE(listed(folder).empty());
    std::size_t const before = openFiles();
    isStreamRefused = true;
    EXPECT_EQ(listed(folder), failed(ENOMEM));
    isStreamRefused = false;
    EXPECT_EQ(openFiles(), before);
}

// Of a file system that lists no kinds.
TEST_F(FileSysDirReachTest, TheDiskIsAskedByTheNameAlone) {
    makeFolders(path("a/folder"));
    writeFile(path("a/file"));
    std::string const folder = longPath("a");
    CDirListing const listing(folder, 0, reach_);
    CDirListing::SKind const unknown = {boost::filesystem::status_error, false};
    EXPECT_EQ(listing.askKind(folder + "/folder", unknown).type, boost::filesystem::directory_file);
    EXPECT_EQ(listing.askKind(folder + "/file", unknown).type, boost::filesystem::regular_file);
    EXPECT_FALSE(listing.askKind(folder + "/file", unknown).isLink);
    EXPECT_THROW(listing.askKind(folder + "/missing", unknown), std::system_error);
}

TEST_F(FileSysDirReachTest, BelowAFolderThatIsNoTextNothingHasAPath) {
    FileSys::CDirSiblings files("/a\xFF/", 0);
    files.add("c", false);
    files.add("b", false);
    files.sort();
    FileSys::CFileSpec spec(L"before");
    for (char const* const name : {"b", "c"}) {
        EXPECT_EQ(files.path(), std::string("/a\xFF/") + name);
        EXPECT_THROW(files.getFileSpec(spec), Encoding::TExcEncoding);
        EXPECT_EQ(spec, FileSys::CFileSpec(L"before"));
        files.pop();
    }
    EXPECT_TRUE(files.empty());
}

} // namespace
