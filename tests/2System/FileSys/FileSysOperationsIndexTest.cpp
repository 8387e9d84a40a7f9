// The next free numbered name.

#include "2System/FileSys/FileSysOperations.h"

#include "support/FileRoot.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <cerrno>
#include <string>

namespace {

using FileSys::CFileSpec;
using TestSupport::writeFile;

class CIndexFileTest : public TestSupport::CFileRootTest {
  protected:
    // The name that a file gets, which is there.
    std::string indexed(std::string const& name, unsigned int digits) const {
        writeFile(path(name));
        CFileSpec spec(path(name));
        EXPECT_TRUE(FileSys::indexFile(spec, digits));
        EXPECT_FALSE(spec.exists());
        std::string const full = spec.getFullName<std::string>(false);
        EXPECT_EQ(full.substr(0, path().size() + 1), path() + "/");
        return full.substr(path().size() + 1);
    }
};

TEST_F(CIndexFileTest, CountingBeginsWithOne) {
    EXPECT_EQ(indexed("a.txt", 3), "a_001.txt");
    EXPECT_EQ(indexed("a.txt", 1), "a_1.txt");
    EXPECT_EQ(indexed("a.txt", 8), "a_00000001.txt");
}

TEST_F(CIndexFileTest, NamesThatAreTakenArePassedOver) {
    writeFile(path("a_001.txt"));
    writeFile(path("a_002.txt"));
    writeFile(path("a_004.txt"));
    EXPECT_EQ(indexed("a.txt", 3), "a_003.txt");
}

TEST_F(CIndexFileTest, CountingGoesOnFromThePresentNumber) {
    writeFile(path("a_0008.txt"));
    EXPECT_EQ(indexed("a_0007.txt", 4), "a_0009.txt");
    EXPECT_EQ(indexed("b_99.txt", 2), "b_100.txt");
    EXPECT_EQ(indexed("b_00.txt", 2), "b_01.txt");
}

TEST_F(CIndexFileTest, ANumberOfFewerOrMoreDigitsIsPartOfTheName) {
    EXPECT_EQ(indexed("a_12.txt", 3), "a_12_001.txt");
    EXPECT_EQ(indexed("a_1234.txt", 3), "a_1234_001.txt");
}

TEST_F(CIndexFileTest, OnlyDigitsOfAsciiAreANumber) {
    EXPECT_EQ(indexed("b_x7.txt", 2), "b_x7_01.txt");
    EXPECT_EQ(indexed("b_7-.txt", 2), "b_7-_01.txt");
    EXPECT_EQ(indexed("b_+7.txt", 2), "b_+7_01.txt");
    EXPECT_EQ(indexed("b_ 7.txt", 2), "b_ 7_01.txt");
    EXPECT_EQ(indexed("c_\u0661\u0662.txt", 2), "c_\u0661\u0662_01.txt");
    EXPECT_EQ(indexed("c_\uFF11\uFF12.txt", 2), "c_\uFF11\uFF12_01.txt");
    EXPECT_EQ(indexed("d-09.txt", 2), "d-09_01.txt");
}

TEST_F(CIndexFileTest, AStemThatIsANumberAloneKeepsNothing) {
    EXPECT_EQ(indexed("_12.txt", 2), "_13.txt");
    EXPECT_EQ(indexed("12.txt", 2), "12_01.txt");
}

TEST_F(CIndexFileTest, NoExtensionGivesNoDot) {
    EXPECT_EQ(indexed("a", 2), "a_01");
    EXPECT_EQ(indexed("a.", 2), "a_01");
    EXPECT_EQ(indexed("a_05", 2), "a_06");
}

// The name of a dot file is all extension.
TEST_F(CIndexFileTest, ADotFilesNameIsItsExtension) {
    EXPECT_EQ(indexed(".profile", 2), "_01.profile");
}

TEST_F(CIndexFileTest, WithoutDigitsTheNumberIsAsLongAsItIs) {
    EXPECT_EQ(indexed("a.txt", 0), "a_1.txt");
    EXPECT_EQ(indexed("b_.txt", 0), "b_0.txt");
    EXPECT_EQ(indexed("c_5.txt", 0), "c_5_1.txt");
}

TEST_F(CIndexFileTest, FoldersAreNumberedToo) {
    TestSupport::makeFolders(path("a.d/b.d"));
    CFileSpec spec(path("a.d/b.d"));
    EXPECT_TRUE(FileSys::indexFile(spec, 2));
    EXPECT_EQ(spec, CFileSpec(path("a.d/b_01.d")));
}

TEST_F(CIndexFileTest, ABareNameStaysOne) {
    writeFile(path("a.txt"));
    ASSERT_EQ(chdir(path().c_str()), 0);
    CFileSpec spec(L"a.txt");
    EXPECT_TRUE(FileSys::indexFile(spec, 2));
    EXPECT_EQ(spec, CFileSpec(L"a_01.txt"));
}

TEST_F(CIndexFileTest, AMissingFileStaysAsItIs) {
    CFileSpec spec(path("missing_07.txt"));
    EXPECT_FALSE(FileSys::indexFile(spec, 2));
    EXPECT_EQ(spec, CFileSpec(path("missing_07.txt")));
    CFileSpec empty;
    EXPECT_FALSE(FileSys::indexFile(empty, 2));
    EXPECT_TRUE(empty.empty());
}

// Long names. No disk has files of more than 255 bytes, so the first question is answered for it.

class CIndexLongNameTest : public CIndexFileTest {
  protected:
    // Only the first question, whether the file is there, finds one.
    std::string indexedWherePresent(std::string const& name, unsigned int digits) const {
        CFileSpec spec(name);
        TestSupport::CSystemCalls calls;
        calls.replacePath("statx", path(), 1);
        EXPECT_TRUE(FileSys::indexFile(spec, digits));
        return spec.getFullName<std::string>(false);
    }
};

TEST_F(CIndexLongNameTest, ALongStemIsCutSoThatTheRestFits) {
    std::string const stem(2000, 's');
    // The "_" is not counted.
    EXPECT_EQ(indexedWherePresent(stem + ".txt", 3), stem.substr(0, 1017) + "_001.txt");
    EXPECT_EQ(indexedWherePresent(stem, 3), stem.substr(0, 1021) + "_001");
    EXPECT_EQ(indexedWherePresent(stem.substr(0, 1017) + ".txt", 3),
              stem.substr(0, 1017) + "_001.txt");
    EXPECT_EQ(indexedWherePresent(stem.substr(0, 1018) + ".txt", 3),
              stem.substr(0, 1017) + "_001.txt");
}

TEST_F(CIndexLongNameTest, TheNumberIsLookedForInWhatTheCutLeaves) {
    std::string const stem(1014, 's');
    EXPECT_EQ(indexedWherePresent(stem + "_07tail.txt", 2), stem + "_07t_01.txt");
    EXPECT_EQ(indexedWherePresent(stem + "s_07tail.txt", 2), stem + "s_07.txt");
}

TEST_F(CIndexLongNameTest, WhereTheRestIsLongerThanANameTheStemGoes) {
    EXPECT_EQ(indexedWherePresent("stem." + std::string(1100, 'e'), 3),
              "_001." + std::string(1100, 'e'));
    EXPECT_EQ(indexedWherePresent("stem.e", 1030), "_" + std::string(1029, '0') + "1.e");
}

TEST_F(CIndexLongNameTest, ANumberBeyondTheRangeWraps) {
    EXPECT_EQ(indexedWherePresent("a_4294967296", 10), "a_0000000000");
    EXPECT_EQ(indexedWherePresent("a_9999999999", 10), "a_1410065407");
    EXPECT_EQ(indexedWherePresent("a_4294967295", 10), "a_4294967295");
}

TEST_F(CIndexLongNameTest, CountingWrapsToo) {
    writeFile(path("a_4294967295"));
    EXPECT_EQ(indexed("a_4294967295", 10), "a_0000000000");
}

} // namespace
