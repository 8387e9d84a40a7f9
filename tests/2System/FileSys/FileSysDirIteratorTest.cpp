#include "2System/FileSys/FileSys.h"

#include "1Base/Encoding/EncodingExc.h"
#include "support/FileRoot.h"
#include "support/FolderWalk.h"

#include <gtest/gtest.h>

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <iterator>
#include <memory>
#include <string>
#include <vector>

namespace {

using FileSys::CDirIterator;
using FileSys::CFileSpec;
using TestSupport::makeFolders;
using TestSupport::makeLink;
using TestSupport::TNames;
using TestSupport::writeFile;

constexpr unsigned int both = TestSupport::filesAndFolders;

class FileSysDirIteratorTest : public TestSupport::CFileRootTest {
  protected:
    CFileSpec spec() const { return CFileSpec(path()); }

    TNames rest(CDirIterator const& iterator) const {
        return TestSupport::namesBelow(path(), iterator);
    }

    TNames walk(CDirIterator::ERecursive recursive, unsigned int flags,
                std::wstring const& extension = L"") const {
        return rest(CDirIterator(spec(), extension, recursive, flags));
    }

    void makeFiles(TNames const& names) const {
        for (std::string const& name : names)
            writeFile(path(name));
    }

    void makeAllFolders(TNames const& names) const {
        for (std::string const& name : names)
            makeFolders(path(name));
    }
};

constexpr auto flat = CDirIterator::eNotRecursive;
constexpr auto deep = CDirIterator::eRecursive;

TEST_F(FileSysDirIteratorTest, AFoldersFilesComeBeforeItsFolders) {
    makeFiles({"b", "a"});
    makeAllFolders({"y", "x"});
    EXPECT_EQ(walk(flat, both), (TNames{"a", "b", "x", "y"}));
    EXPECT_EQ(walk(flat, CDirIterator::eFiles), (TNames{"a", "b"}));
    EXPECT_EQ(walk(flat, CDirIterator::eFolders), (TNames{"x", "y"}));
    EXPECT_EQ(walk(flat, 0), TNames());
}

TEST_F(FileSysDirIteratorTest, FilesGoInFrontOfWhatWaitsAndFoldersBehindIt) {
    makeAllFolders({"x/sub", "y"});
    makeFiles({"b", "a", "x/f", "x/sub/q", "y/g"});
    EXPECT_EQ(walk(deep, both), (TNames{"a", "b", "x", "x/f", "y", "y/g", "x/sub", "x/sub/q"}));
    EXPECT_EQ(walk(deep, CDirIterator::eFiles), (TNames{"a", "b", "x/f", "y/g", "x/sub/q"}));
    EXPECT_EQ(walk(deep, CDirIterator::eFolders), (TNames{"x", "y", "x/sub"}));
    EXPECT_EQ(walk(deep, 0), TNames());
}

TEST_F(FileSysDirIteratorTest, NamesAreSortedByTheirBytes) {
    makeFiles({"b", "B", "_", "a.b", "a b", "ab", "a", "10", "9", "\xC3\xA9", "z", "~"});
    EXPECT_EQ(walk(flat, both),
              (TNames{"10", "9", "B", "_", "a", "a b", "a.b", "ab", "b", "z", "~", "\xC3\xA9"}));
}

TEST_F(FileSysDirIteratorTest, FlagsAndDepthMayBePlainNumbersInEitherOrder) {
    makeAllFolders({"x.app"});
    makeFiles({"a.app", "b", "x.app/c.app"});
    TNames const all = {"a.app", "b", "x.app", "x.app/c.app"};
    EXPECT_EQ(rest(CDirIterator(spec(), deep, 3)), all);
    EXPECT_EQ(rest(CDirIterator(spec(), 3, deep)), all);
    TNames const filtered = {"a.app", "x.app", "x.app/c.app"};
    EXPECT_EQ(rest(CDirIterator(spec(), L"app", deep, 3)), filtered);
    EXPECT_EQ(rest(CDirIterator(spec(), L"app", 3, deep)), filtered);
    EXPECT_EQ(rest(CDirIterator(spec(), L"app", static_cast<CDirIterator::ERecursive>(0), 1)),
              (TNames{"a.app"}));
}

TEST_F(FileSysDirIteratorTest, UnknownFlagsDeliverNothing) {
    makeFiles({"a"});
    makeAllFolders({"x"});
    EXPECT_EQ(walk(deep, 4), TNames());
    EXPECT_EQ(walk(deep, 4 | CDirIterator::eFiles), (TNames{"a"}));
}

TEST_F(FileSysDirIteratorTest, WhereNothingPassesTheEndIsReachedAtOnce) {
    EXPECT_EQ(CDirIterator(spec(), deep, both), CDirIterator());
    makeAllFolders({"x"});
    EXPECT_EQ(CDirIterator(spec(), deep, CDirIterator::eFiles), CDirIterator());
    CDirIterator const iterator(spec(), L"pdf", flat, both);
    EXPECT_EQ(iterator, CDirIterator());
    EXPECT_TRUE((*iterator).empty());
}

TEST_F(FileSysDirIteratorTest, ARootThatIsNoFolderIsTheEnd) {
    makeFiles({"file"});
    for (std::string const& name : {path("file"), path("missing"), std::string()}) {
        CDirIterator iterator(CFileSpec(name), deep, both);
        EXPECT_EQ(iterator, CDirIterator()) << name;
        EXPECT_TRUE(iterator->empty()) << name;
    }
    CFileSpec const nameless(std::wstring(1, static_cast<wchar_t>(0xD800)));
    EXPECT_EQ(CDirIterator(nameless, deep, both), CDirIterator());
}

TEST_F(FileSysDirIteratorTest, TheRootIsJoinedAsItIsWritten) {
    makeFiles({"a"});
    ASSERT_EQ(chdir(path().c_str()), 0);
    EXPECT_EQ(*CDirIterator(CFileSpec(L"."), flat, both), CFileSpec(L"./a"));
    EXPECT_EQ(*CDirIterator(CFileSpec(path() + "/"), flat, both), CFileSpec(path("a")));
    EXPECT_EQ(*CDirIterator(CFileSpec(path() + "//"), flat, both), CFileSpec(path() + "//a"));
    ASSERT_EQ(chdir("/"), 0);
}

TEST_F(FileSysDirIteratorTest, AFilterComparesTheWholeExtensionWithItsCase) {
    makeFiles(
        {"a.pdf", "b.PDF", "c.pdfx", "d.xpdf", "pdf", ".pdf", "e.pdf.zip", "f.zip.pdf", "g.", "h"});
    EXPECT_EQ(walk(flat, CDirIterator::eFiles, L"pdf"), (TNames{".pdf", "a.pdf", "f.zip.pdf"}));
    EXPECT_EQ(walk(flat, CDirIterator::eFiles, L".pdf"), TNames());
    EXPECT_EQ(walk(flat, CDirIterator::eFiles, L"zip.pdf"), TNames());
}

TEST_F(FileSysDirIteratorTest, AFilterMayBeBeyondAscii) {
    makeFiles({"a.\xC3\xA9", "b.e\xCC\x81", "c.e"});
    EXPECT_EQ(walk(flat, CDirIterator::eFiles, L"\u00E9"), (TNames{"a.\xC3\xA9"}));
}

TEST_F(FileSysDirIteratorTest, AFilterDoesNotStopTheDescent) {
    makeAllFolders({"x.app/deep.app", "y/z.app"});
    makeFiles({"a.app", "b", "x.app/c.app", "y/d.app", "y/e"});
    EXPECT_EQ(walk(deep, CDirIterator::eFolders, L"app"),
              (TNames{"x.app", "x.app/deep.app", "y/z.app"}));
    EXPECT_EQ(walk(deep, CDirIterator::eFiles, L"app"),
              (TNames{"a.app", "x.app/c.app", "y/d.app"}));
    EXPECT_EQ(walk(flat, CDirIterator::eFolders, L"app"), (TNames{"x.app"}));
    EXPECT_EQ(walk(flat, CDirIterator::eFiles, L"app"), (TNames{"a.app"}));
}

TEST_F(FileSysDirIteratorTest, LinksAreFollowedAndDanglingOnesLeftOut) {
    makeAllFolders({"folder"});
    makeFiles({"file", "folder/inside"});
    makeLink("file", path("to file"));
    makeLink("folder", path("to folder"));
    makeLink("missing", path("to nothing"));
    makeLink("/dev/null", path("to a device"));
    ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
    EXPECT_EQ(walk(deep, both), (TNames{"file", "to file", "folder", "folder/inside", "to folder",
                                        "to folder/inside"}));
}

TEST_F(FileSysDirIteratorTest, ACycleOfLinksEndsWhereTheSystemRefusesIt) {
    makeFiles({"file"});
    makeLink(".", path("again"));
    TNames const names = walk(deep, both);
    ASSERT_GE(names.size(), 4U);
    EXPECT_EQ(TNames(names.begin(), names.begin() + 4),
              (TNames{"file", "again", "again/file", "again/again"}));
    EXPECT_LT(names.size(), 1000U);
}

// The names of a folder in the order in which the system lists them.
TNames listedOrder(std::string const& folder) {
    std::unique_ptr<DIR, int (*)(DIR*)> const stream(opendir(folder.c_str()), closedir);
    TNames names;
    while (dirent const* const entry = readdir(stream.get())) {
        std::string const name = entry->d_name;
        if (name != "." && name != "..")
            names.push_back(name);
    }
    return names;
}

TEST_F(FileSysDirIteratorTest, AnEntryWithoutAStatusEndsItsFoldersListing) {
    for (char name = 'a'; name <= 'z'; ++name)
        makeFiles({std::string(1, name)});
    makeLink("loop", path("loop"));
    TNames expected;
    for (std::string const& name : listedOrder(path())) {
        if (name == "loop")
            break;
        expected.push_back(name);
    }
    std::sort(expected.begin(), expected.end());
    EXPECT_EQ(walk(flat, both), expected);
}

TEST_F(FileSysDirIteratorTest, WhatWasFoundIsDeliveredThoughItIsGone) {
    makeAllFolders({"x", "y"});
    makeFiles({"a", "b", "x/inside", "y/inside"});
    CDirIterator iterator(spec(), deep, both);
    TestSupport::removeTree(path("b"));
    TestSupport::removeTree(path("x"));
    makeFiles({"c"});
    EXPECT_EQ(rest(iterator), (TNames{"a", "b", "x", "y", "y/inside"}));
}

TEST_F(FileSysDirIteratorTest, AClosedFolderIsDeliveredAndLeftOut) {
    runAsOrdinaryUser([this] {
        makeAllFolders({"closed", "open"});
        makeFiles({"closed/inside", "open/inside"});
        ASSERT_EQ(chmod(path("closed").c_str(), 0), 0);
        EXPECT_EQ(walk(deep, both), (TNames{"closed", "open", "open/inside"}));
        EXPECT_EQ(CDirIterator(CFileSpec(path("closed")), deep, both), CDirIterator());
        // Its names can be read, and so their kind; what they lead to can't be reached.
        ASSERT_EQ(chmod(path("closed").c_str(), 0400), 0);
        EXPECT_EQ(rest(CDirIterator(CFileSpec(path("closed")), deep, both)),
                  (TNames{"closed/inside"}));
    });
}

TEST_F(FileSysDirIteratorTest, ANameThatIsNotUtf8RaisesWhenItIsDelivered) {
    makeFiles({"a", "b\xFF", "c"});
    CDirIterator iterator(spec(), deep, both);
    EXPECT_EQ(*iterator, CFileSpec(path("a")));
    EXPECT_THROW(++iterator, Encoding::TExcEncoding);
    EXPECT_EQ(*iterator, CFileSpec(path("a"))) << "the entry before it still shows";
    ++iterator;
    EXPECT_EQ(*iterator, CFileSpec(path("c"))) << "the walk may go on";
    EXPECT_EQ(++iterator, CDirIterator());
}

// Names are decoded by the hundred.
TEST_F(FileSysDirIteratorTest, EachNameThatIsNotUtf8RaisesAndNoOther) {
    TNames names;
    for (int i = 0; i < 4000; ++i) {
        char const* const ends[] = {"", "\xC3\xA9", "\xF0\x9F\x98\x80", "\xEF\xBB\xBF"};
        bool const isBad = i == 1 || i == 700 || i == 701 || i == 3999;
        names.push_back(std::to_string(10000 + i) + (isBad ? "\xFF" : ends[i % 4]));
    }
    names.push_back("\xEF\xBB\xBFmark");
    makeFiles(names);
    CDirIterator iterator(spec(), deep, both);
    for (std::string const& name : names) {
        if (name.back() == '\xFF') {
            EXPECT_THROW(++iterator, Encoding::TExcEncoding) << name;
        } else {
            if (name != names.front())
                ++iterator;
            ASSERT_EQ(*iterator, CFileSpec(path(name)));
        }
    }
    EXPECT_EQ(++iterator, CDirIterator());
}

TEST_F(FileSysDirIteratorTest, ANameBelowOneThatIsNotUtf8Raises) {
    makeAllFolders({"a", "b\xFF"});
    makeFiles({"a/1", "a/2", "b\xFF/1", "b\xFF/2"});
    CDirIterator iterator(spec(), deep, CDirIterator::eFiles);
    EXPECT_EQ(*iterator, CFileSpec(path("a/1")));
    EXPECT_EQ(*++iterator, CFileSpec(path("a/2")));
    EXPECT_THROW(++iterator, Encoding::TExcEncoding);
    EXPECT_THROW(++iterator, Encoding::TExcEncoding);
    EXPECT_EQ(++iterator, CDirIterator());
}

TEST_F(FileSysDirIteratorTest, AFirstNameThatIsNotUtf8RaisesAtOnce) {
    makeFiles({"A\xFF", "a"});
    EXPECT_THROW(CDirIterator(spec(), deep, both), Encoding::TExcEncoding);
}

TEST_F(FileSysDirIteratorTest, AnExtensionThatIsNotUtf8RaisesUnderAFilter) {
    makeFiles({"a.pdf", "b.\xFF"});
    EXPECT_THROW(walk(flat, both, L"pdf"), Encoding::TExcEncoding);
    EXPECT_EQ(walk(flat, CDirIterator::eFolders, L"pdf"), TNames()) << "a file is not looked at";
}

TEST_F(FileSysDirIteratorTest, AnExhaustedIteratorMayMoveOn) {
    makeFiles({"a"});
    CDirIterator iterator(spec(), deep, both);
    EXPECT_EQ(&++iterator, &iterator);
    EXPECT_EQ(*iterator, CFileSpec(L"invalid"));
    ++iterator;
    EXPECT_EQ(*iterator, CFileSpec(L"invalid"));
    EXPECT_EQ(iterator, CDirIterator());

    CDirIterator end;
    EXPECT_TRUE(end->empty());
    ++end;
    EXPECT_EQ(*end, CFileSpec(L"invalid"));
    EXPECT_EQ(end, CDirIterator());
}

TEST_F(FileSysDirIteratorTest, ACopyGoesOnByItself) {
    makeAllFolders({"x"});
    makeFiles({"a", "b", "x/c"});
    CDirIterator iterator(spec(), deep, both);
    ++iterator;
    CDirIterator const copy = iterator;
    CDirIterator assigned;
    assigned = iterator;
    TNames const remainder = {"b", "x", "x/c"};
    EXPECT_EQ(rest(iterator), remainder);
    while (iterator != CDirIterator())
        ++iterator;
    EXPECT_EQ(*copy, CFileSpec(path("b")));
    EXPECT_EQ(rest(copy), remainder);
    EXPECT_EQ(rest(assigned), remainder);
}

TEST_F(FileSysDirIteratorTest, AssignmentTakesOverTheEndAndItsText) {
    makeFiles({"a"});
    CDirIterator iterator(spec(), deep, both);
    CDirIterator exhausted = iterator;
    ++exhausted;
    iterator = exhausted;
    EXPECT_EQ(iterator, CDirIterator());
    EXPECT_EQ(*iterator, CFileSpec(L"invalid"));
}

TEST_F(FileSysDirIteratorTest, AssignmentToItselfDoesNothing) {
    makeFiles({"a", "b"});
    CDirIterator iterator(spec(), deep, both);
    CDirIterator const& same = iterator;
    iterator = same;
    EXPECT_EQ(rest(iterator), (TNames{"a", "b"}));
}

TEST_F(FileSysDirIteratorTest, IteratorsAreEqualOnTheSamePath) {
    makeFiles({"a", "b"});
    CDirIterator const first(spec(), deep, both);
    CDirIterator second(spec(), flat, CDirIterator::eFiles);
    EXPECT_TRUE(first == second);
    EXPECT_FALSE(first != second);
    ++second;
    EXPECT_FALSE(first == second);
    EXPECT_TRUE(first != second);
    EXPECT_FALSE(second == CDirIterator());
    EXPECT_TRUE(first == first);
}

TEST_F(FileSysDirIteratorTest, AllEndsAreEqual) {
    makeFiles({"a"});
    CDirIterator exhausted(spec(), deep, both);
    ++exhausted;
    CDirIterator const missing(CFileSpec(path("missing")), deep, both);
    EXPECT_TRUE(exhausted == missing);
    EXPECT_TRUE(missing == CDirIterator());
    EXPECT_TRUE(CDirIterator() == exhausted);
    EXPECT_FALSE(CDirIterator() != exhausted);
}

TEST_F(FileSysDirIteratorTest, ItIsAnInputIterator) {
    makeFiles({"a", "b"});
    std::vector<CFileSpec> const specs(CDirIterator(spec(), deep, both), CDirIterator{});
    EXPECT_EQ(specs, (std::vector<CFileSpec>{path("a"), path("b")}));
}

} // namespace
