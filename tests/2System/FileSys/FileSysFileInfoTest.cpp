#include "2System/FileSys/FileSysFileInfo.h"

#include "1Base/Encoding/EncodingExc.h"
#include "support/FileRoot.h"
#include "support/Zone.h"

#include <boost/filesystem/exception.hpp>

#include <gtest/gtest.h>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <ctime>
#include <memory>
#include <string>

namespace {

using FileSys::CFileInfo;
using TestSupport::CZone;
using TestSupport::makeFolders;
using TestSupport::makeLink;
using TestSupport::writeFile;
using Time::CDateTime;

class FileSysFileInfoTest : public TestSupport::CFileRootTest {
  protected:
    CFileInfo info(std::string const& name) const {
        return CFileInfo(Encoding::convert<Strings::string>(path(name)));
    }

    void setWriteTime(std::string const& name, std::time_t seconds) const {
        timespec times[2] = {};
        times[0].tv_sec = seconds;
        times[1].tv_sec = seconds;
        times[1].tv_nsec = 999999999;
        ASSERT_EQ(utimensat(AT_FDCWD, path(name).c_str(), times, 0), 0);
    }
};

void expectNothingThere(Strings::string const& path) {
    // Seven hours beside UTC: the one can't be taken for the other.
    CZone const zone("XXX-7");
    CDateTime const before = CDateTime::getCurrentTimeLocal();
    CFileInfo const info(path);
    CDateTime const after = CDateTime::getCurrentTimeLocal();
    EXPECT_FALSE(info.exists());
    EXPECT_FALSE(info.isFolder());
    EXPECT_FALSE(info.isHidden());
    EXPECT_FALSE(info.isReadOnly());
    EXPECT_EQ(info.getFileSize(), 0U);
    EXPECT_LE(before, info.getCreationDate());
    EXPECT_LE(info.getCreationDate(), info.getModificationDate());
    EXPECT_LE(info.getModificationDate(), after);
}

TEST_F(FileSysFileInfoTest, AnEmptyPathIsNotThere) {
    expectNothingThere(L"");
}

TEST_F(FileSysFileInfoTest, AMissingPathIsNotThere) {
    writeFile(path("file"));
    makeLink("missing", path("link"));
    for (std::string const name : {"missing", "missing/file", "file/inside", "link"})
        expectNothingThere(Encoding::convert<Strings::string>(path(name)));
}

TEST_F(FileSysFileInfoTest, AFileHasASize) {
    writeFile(path("file"), "hello");
    CFileInfo const file = info("file");
    EXPECT_TRUE(file.exists());
    EXPECT_FALSE(file.isFolder());
    EXPECT_FALSE(file.isReadOnly());
    EXPECT_EQ(file.getFileSize(), 5U);
}

TEST_F(FileSysFileInfoTest, AFolderHasNone) {
    makeFolders(path("folder"));
    writeFile(path("folder/file"), "hello");
    CFileInfo const folder = info("folder");
    EXPECT_TRUE(folder.exists());
    EXPECT_TRUE(folder.isFolder());
    EXPECT_EQ(folder.getFileSize(), 0U);
}

TEST_F(FileSysFileInfoTest, ASizeMayExceed32Bits) {
    writeFile(path("large"));
    ASSERT_EQ(truncate(path("large").c_str(), (off_t{1} << 32) + 1), 0);
    EXPECT_EQ(info("large").getFileSize(), (1ULL << 32) + 1);
}

TEST_F(FileSysFileInfoTest, ALinkShowsWhatItLeadsTo) {
    writeFile(path("file"), "hello");
    makeFolders(path("folder"));
    makeLink("file", path("to file"));
    makeLink("folder", path("to folder"));
    EXPECT_EQ(info("to file").getFileSize(), 5U);
    EXPECT_TRUE(info("to folder").isFolder());
}

TEST_F(FileSysFileInfoTest, ADotFileIsNotHidden) {
    writeFile(path(".profile"));
    EXPECT_FALSE(info(".profile").isHidden());
}

TEST_F(FileSysFileInfoTest, WhatCannotBeWrittenIsReadOnly) {
    runAsOrdinaryUser([this] {
        writeFile(path("file"));
        makeFolders(path("folder"));
        EXPECT_FALSE(info("file").isReadOnly());
        EXPECT_FALSE(info("folder").isReadOnly());
        ASSERT_EQ(chmod(path("file").c_str(), 0444), 0);
        ASSERT_EQ(chmod(path("folder").c_str(), 0555), 0);
        EXPECT_TRUE(info("file").isReadOnly());
        EXPECT_TRUE(info("folder").isReadOnly());
        // It is the process that counts, not the bits: others could write here.
        ASSERT_EQ(chmod(path("file").c_str(), 0066), 0);
        EXPECT_TRUE(info("file").isReadOnly());
    });
}

TEST_F(FileSysFileInfoTest, DatesAreInUtcToTheSecond) {
    writeFile(path("file"));
    setWriteTime("file", 1614931509);
    CDateTime const expected(5, Time::CDate::emMar, 2021, 8, 5, 9, 0);
    for (char const* const name : TestSupport::zonesToTry) {
        CZone const zone(name);
        CFileInfo const file = info("file");
        EXPECT_EQ(file.getModificationDate(), expected) << name;
        EXPECT_EQ(file.getModificationDate().getMilliSecond(), 0) << name;
        EXPECT_EQ(file.getCreationDate(), expected) << name;
    }
}

TEST_F(FileSysFileInfoTest, AFolderHasDatesAsWell) {
    makeFolders(path("folder"));
    setWriteTime("folder", 951782400);
    EXPECT_EQ(info("folder").getModificationDate(),
              CDateTime(29, Time::CDate::emFeb, 2000, 0, 0, 0, 0));
}

TEST_F(FileSysFileInfoTest, DatesBefore1970AreKept) {
    writeFile(path("file"));
    setWriteTime("file", -1);
    EXPECT_EQ(info("file").getCreationDate(),
              CDateTime(31, Time::CDate::emDec, 1969, 23, 59, 59, 0));
}

TEST_F(FileSysFileInfoTest, TheSnapshotIsNotRefreshed) {
    writeFile(path("file"), "hello");
    CFileInfo const before = info("file");
    writeFile(path("file"), "hello, world");
    EXPECT_EQ(before.getFileSize(), 5U);
    ASSERT_EQ(unlink(path("file").c_str()), 0);
    EXPECT_TRUE(before.exists());
    EXPECT_FALSE(info("file").exists());
}

TEST_F(FileSysFileInfoTest, ACopyHasARecordOfItsOwn) {
    writeFile(path("file"), "hello");
    auto original = std::make_unique<CFileInfo>(info("file"));
    CFileInfo const copy = *original;
    CFileInfo assigned = CFileInfo(L"");
    assigned = *original;
    original.reset();
    EXPECT_EQ(copy.getFileSize(), 5U);
    EXPECT_TRUE(copy.exists());
    EXPECT_EQ(assigned.getFileSize(), 5U);

    CFileInfo const& same = assigned;
    assigned = same;
    EXPECT_EQ(assigned.getFileSize(), 5U);
}

TEST_F(FileSysFileInfoTest, TheSizeOfASpecialFileIsRefused) {
    ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
    EXPECT_THROW(info("pipe"), boost::filesystem::filesystem_error);
    EXPECT_THROW(CFileInfo(L"/dev/null"), boost::filesystem::filesystem_error);
}

TEST_F(FileSysFileInfoTest, WhatCannotBeLookedUpIsRefused) {
    makeLink("loop", path("loop"));
    EXPECT_THROW(info("loop"), boost::filesystem::filesystem_error);
    EXPECT_THROW(info(std::string(256, 'x')), boost::filesystem::filesystem_error);
    runAsOrdinaryUser([this] {
        makeFolders(path("closed"));
        writeFile(path("closed/file"));
        ASSERT_EQ(chmod(path("closed").c_str(), 0), 0);
        EXPECT_THROW(info("closed/file"), boost::filesystem::filesystem_error);
    });
}

TEST_F(FileSysFileInfoTest, ATextThatIsNoPathIsRefused) {
    EXPECT_THROW(CFileInfo(std::wstring(1, static_cast<wchar_t>(0xD800))), Encoding::TExcEncoding);
}

} // namespace
