#include "2System/FileSys/FileSys.h"

#include "1Base/Error/ErrorExcChains.h"
#include "support/FileRoot.h"
#include "support/RaisedException.h"

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <cstddef>
#include <list>
#include <string>
#include <vector>

namespace {

using FileSys::CFileInfo;
using FileSys::CFileSpec;
using TestSupport::CRaised;
using TestSupport::makeFolders;
using TestSupport::makeLink;
using TestSupport::TParameters;
using TestSupport::writeFile;

class FileSysFileSpecDiskTest : public TestSupport::CFileRootTest {
  protected:
    void TearDown() override {
        EXPECT_EQ(chdir("/"), 0);
        CFileRootTest::TearDown();
    }

    CFileSpec spec(std::string const& name) const { return CFileSpec(path(name)); }
};

// No text of the system's encoding names it.
CFileSpec const nameless(std::wstring(1, static_cast<wchar_t>(0xD800)));

TEST_F(FileSysFileSpecDiskTest, FilesAndFoldersExist) {
    writeFile(path("file"));
    makeFolders(path("folder"));
    EXPECT_TRUE(spec("file").exists());
    EXPECT_TRUE(spec("folder").exists());
    EXPECT_TRUE(spec("folder/").exists());
    EXPECT_TRUE(spec("folder/../file").exists());
    EXPECT_TRUE(CFileSpec(L"/").exists());
    EXPECT_TRUE(CFileSpec(L"/dev/null").exists());
}

TEST_F(FileSysFileSpecDiskTest, WhatCannotBeLookedUpDoesNotExist) {
    writeFile(path("file"));
    EXPECT_FALSE(spec("missing").exists());
    EXPECT_FALSE(spec("missing/file").exists());
    EXPECT_FALSE(spec("file/inside").exists());
    EXPECT_FALSE(CFileSpec().exists());
    EXPECT_FALSE(spec(std::string(256, 'x')).exists()) << "a name that is too long";
    EXPECT_FALSE(spec(std::string(5000, '/') + "file").exists()) << "a path that is too long";
    EXPECT_FALSE(nameless.exists());
}

TEST_F(FileSysFileSpecDiskTest, LinksAreFollowed) {
    writeFile(path("file"), "12345");
    makeFolders(path("folder"));
    makeLink("file", path("to file"));
    makeLink("folder", path("to folder"));
    makeLink("missing", path("to nothing"));
    makeLink("loop", path("loop"));
    EXPECT_TRUE(spec("to file").exists());
    EXPECT_FALSE(spec("to file").isFolder());
    EXPECT_EQ(spec("to file").getFileSize(), 5U);
    EXPECT_TRUE(spec("to folder").exists());
    EXPECT_TRUE(spec("to folder").isFolder());
    for (char const* const name : {"to nothing", "loop"}) {
        EXPECT_FALSE(spec(name).exists()) << name;
        EXPECT_FALSE(spec(name).isFolder()) << name;
        EXPECT_EQ(spec(name).getFileSize(), 0U) << name;
    }
}

TEST_F(FileSysFileSpecDiskTest, OnlyFoldersAreFolders) {
    writeFile(path("file"));
    makeFolders(path("folder"));
    EXPECT_TRUE(spec("folder").isFolder());
    EXPECT_TRUE(spec("folder/").isFolder());
    EXPECT_TRUE(CFileSpec(L"/").isFolder());
    EXPECT_FALSE(spec("file").isFolder());
    EXPECT_FALSE(spec("file/").isFolder());
    EXPECT_FALSE(spec("missing").isFolder());
    EXPECT_FALSE(CFileSpec(L"/dev/null").isFolder());
    EXPECT_FALSE(CFileSpec().isFolder());
    EXPECT_FALSE(nameless.isFolder());
}

TEST_F(FileSysFileSpecDiskTest, ASizeIsInBytes) {
    writeFile(path("empty"));
    writeFile(path("text"), "caf\xC3\xA9");
    writeFile(path("large"));
    ASSERT_EQ(truncate(path("large").c_str(), off_t{5} << 30), 0);
    EXPECT_EQ(spec("empty").getFileSize(), 0U);
    EXPECT_EQ(spec("text").getFileSize(), 5U);
    EXPECT_EQ(spec("large").getFileSize(), 5ULL << 30);
}

TEST_F(FileSysFileSpecDiskTest, WhatHasNoSizeHasNone) {
    makeFolders(path("folder"));
    writeFile(path("folder/file"), "text");
    ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
    EXPECT_EQ(spec("folder").getFileSize(), 0U);
    EXPECT_EQ(spec("pipe").getFileSize(), 0U);
    EXPECT_EQ(spec("missing").getFileSize(), 0U);
    EXPECT_EQ(CFileSpec(L"/dev/null").getFileSize(), 0U);
    EXPECT_EQ(CFileSpec().getFileSize(), 0U);
    EXPECT_EQ(nameless.getFileSize(), 0U);
}

TEST_F(FileSysFileSpecDiskTest, NamesBeyondAsciiAreFoundInAnyLocale) {
    root().environment().set("LC_ALL", "C");
    std::string const name = "\xC3\xA9\xE6\xBC\xA2\xF0\x9F\x98\x80";
    writeFile(path(name), "abc");
    CFileSpec const wide(CFileSpec(path()) + L"\u00E9\u6F22\U0001F600");
    EXPECT_TRUE(wide.exists());
    EXPECT_EQ(wide.getFileSize(), 3U);
    EXPECT_EQ(wide.getFileInfo().getFileSize(), 3U);
    // Composition matters: the system's names are bytes.
    EXPECT_FALSE((CFileSpec(path()) + L"e\u0301\u6F22\U0001F600").exists());
}

TEST_F(FileSysFileSpecDiskTest, WhatLiesBehindAClosedFolderDoesNotExist) {
    runAsOrdinaryUser([this] {
        makeFolders(path("closed/inside"));
        writeFile(path("closed/file"), "text");
        ASSERT_EQ(chmod(path("closed").c_str(), 0), 0);
        EXPECT_TRUE(spec("closed").exists());
        EXPECT_FALSE(spec("closed/file").exists());
        EXPECT_FALSE(spec("closed/inside").isFolder());
        EXPECT_EQ(spec("closed/file").getFileSize(), 0U);
        EXPECT_THROW(spec("closed/file").getFileInfo(), Error::TExcStdLibException);
    });
}

TEST_F(FileSysFileSpecDiskTest, InformationIsThatOfThePath) {
    writeFile(path("file"), "text");
    EXPECT_EQ(spec("file").getFileInfo().getFileSize(), 4U);
    EXPECT_TRUE(CFileSpec(path()).getFileInfo().isFolder());
}

TEST_F(FileSysFileSpecDiskTest, InformationOnAMissingPathRaises) {
    CRaised const raised =
        TestSupport::raisedBy<Error::CException>([this] { spec("m\xC3\xA9").getFileInfo(); });
    EXPECT_EQ(raised.name, "FileInfo");
    EXPECT_EQ(raised.severity, Error::SevError);
    EXPECT_EQ(raised.text, Error::loadDefaultMessage(Error::msgWrongArgument));
    EXPECT_EQ(raised.parameters, (TParameters{{"type", L"file name"},
                                              {"key", spec("m\xC3\xA9").getFullName(false)},
                                              {"reason", L"unknown error"}}));
    EXPECT_NE(raised.file.find("2System/FileSys/_Imp/FileSysFileSpec"), std::string::npos)
        << raised.file;
    EXPECT_NE(raised.func.find("CFileSpec::getFileInfo("), std::string::npos) << raised.func;
    EXPECT_EQ(raised.trace, std::vector<std::string>{raised.func});
}

TEST_F(FileSysFileSpecDiskTest, TheFailureIsCaughtAtEachLevel) {
    CFileSpec const missing = spec("missing");
    EXPECT_THROW(missing.getFileInfo(), FileSys::TExcFileInfo);
    EXPECT_THROW(missing.getFileInfo(), FileSys::TExcFileSpec);
    EXPECT_THROW(missing.getFileInfo(), FileSys::TExcFileSys);
    EXPECT_THROW(missing.getFileInfo(), TExcSystem);
    EXPECT_THROW(missing.getFileInfo(), Error::CException);
    EXPECT_THROW(CFileSpec().getFileInfo(), FileSys::TExcFileInfo);
}

TEST_F(FileSysFileSpecDiskTest, AFailureOfTheSystemBecomesOneOfTheFamily) {
    ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
    CRaised const raised =
        TestSupport::raisedBy<Error::TExcStdLibException>([this] { spec("pipe").getFileInfo(); });
    EXPECT_NE(raised.func.find("CFileSpec::getFileInfo("), std::string::npos) << raised.func;
}

TEST_F(FileSysFileSpecDiskTest, TheWorkingDirectoryIsThatOfTheProcess) {
    std::string const folder = path("f\xC3\xB6lder");
    makeFolders(folder);
    ASSERT_EQ(chdir(folder.c_str()), 0);
    EXPECT_EQ(CFileSpec::getCurrentWorkingDir(), CFileSpec(folder));
    ASSERT_EQ(chdir("/"), 0);
    EXPECT_EQ(CFileSpec::getCurrentWorkingDir(), CFileSpec(L"/"));
}

TEST_F(FileSysFileSpecDiskTest, AWorkingDirectoryOf1023BytesIsTheLongest) {
    std::string folder = path();
    while (folder.size() + 102 < 1023)
        folder += "/" + std::string(100, 'x');
    ASSERT_LT(folder.size() + 1, 1023U);
    folder += "/" + std::string(1023 - folder.size() - 1, 'y');
    makeFolders(folder);
    ASSERT_EQ(chdir(folder.c_str()), 0);
    EXPECT_EQ(CFileSpec::getCurrentWorkingDir(), CFileSpec(folder));

    folder += "y";
    makeFolders(folder);
    ASSERT_EQ(chdir(folder.c_str()), 0);
    EXPECT_TRUE(CFileSpec::getCurrentWorkingDir().empty());

    folder += "/" + std::string(200, 'z');
    makeFolders(folder);
    ASSERT_EQ(chdir(folder.c_str()), 0);
    EXPECT_TRUE(CFileSpec::getCurrentWorkingDir().empty());
}

TEST_F(FileSysFileSpecDiskTest, ARemovedWorkingDirectoryIsEmpty) {
    makeFolders(path("gone"));
    ASSERT_EQ(chdir(path("gone").c_str()), 0);
    ASSERT_EQ(rmdir(path("gone").c_str()), 0);
    EXPECT_TRUE(CFileSpec::getCurrentWorkingDir().empty());
}

TEST_F(FileSysFileSpecDiskTest, TheFirstOfEqualPathsStays) {
    std::list<CFileSpec> specs = {L"/b", L"/a", L"/b", L"/a/", L"/A", L"", L"/a", L""};
    FileSys::cleanFileSpecList(specs, false);
    EXPECT_EQ(specs, (std::list<CFileSpec>{L"/b", L"/a", L"/a/", L"/A", L""}));
}

TEST_F(FileSysFileSpecDiskTest, MissingPathsGoWhereAskedFor) {
    writeFile(path("file"));
    std::list<CFileSpec> const all = {spec("missing"), spec("file"), spec("missing"), spec("file"),
                                      CFileSpec(path())};
    std::list<CFileSpec> specs = all;
    FileSys::cleanFileSpecList(specs, true);
    EXPECT_EQ(specs, (std::list<CFileSpec>{spec("file"), CFileSpec(path())}));

    specs = all;
    FileSys::cleanFileSpecList(specs, false);
    EXPECT_EQ(specs, (std::list<CFileSpec>{spec("missing"), spec("file"), CFileSpec(path())}));
}

TEST_F(FileSysFileSpecDiskTest, AnEmptyListStaysEmpty) {
    std::list<CFileSpec> specs;
    FileSys::cleanFileSpecList(specs, true);
    FileSys::cleanFileSpecList(specs, false);
    EXPECT_TRUE(specs.empty());
}

#ifndef __APPLE__
TEST_F(FileSysFileSpecDiskTest, WhereNothingDrawsThereIsNoIcon) {
    std::string rgb = "left over";
    std::string alpha = "left over";
    int width = 0;
    int height = 7;
    EXPECT_FALSE(CFileSpec(path()).getIcon(rgb, alpha, width, height));
    EXPECT_EQ(rgb, "");
    EXPECT_EQ(alpha, "");
}
#endif

} // namespace
