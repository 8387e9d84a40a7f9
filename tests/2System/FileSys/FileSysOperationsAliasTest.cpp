// Bookmark files as aliases.

#include "2System/FileSys/FileSysOperations.h"

#include "support/FileFailures.h"
#include "support/FileRoot.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>
#include <vector>

namespace {

using FileSys::CFileSpec;
using TestSupport::CFileFailure;
using TestSupport::expectFailure;
using TestSupport::failureOf;
using TestSupport::listTree;
using TestSupport::readFile;
using TestSupport::wide;
using TestSupport::writeFile;
using TestSupport::wrongFile;

using TNames = std::vector<std::string>;

class CAliasTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        writeFile(path("source \u00E9"), "text");
    }

    void create(std::string const& alias, std::string const& source) const {
        FileSys::createAliasFile(path(alias), path(source));
    }

    std::string resolved(std::string const& alias) const {
        CFileSpec result(L"before");
        bool const found = FileSys::resolveAlias(path(alias), result);
        EXPECT_EQ(found, !result.empty());
        return result.getFullName<std::string>(false);
    }
};

TEST_F(CAliasTest, AnAliasLeadsToItsSource) {
    create("alias", "source \u00E9");
    EXPECT_EQ(resolved("alias"), path("source \u00E9"));
    EXPECT_EQ(readFile(path("source \u00E9")), "text");
}

TEST_F(CAliasTest, AnAliasFollowsARename) {
    create("alias", "source \u00E9");
    ASSERT_EQ(std::rename(path("source \u00E9").c_str(), path("renamed").c_str()), 0);
    EXPECT_EQ(resolved("alias"), path("renamed"));
}

TEST_F(CAliasTest, AnAliasOfAFolderLeadsThere) {
    TestSupport::makeFolders(path("folder/inner"));
    create("alias", "folder/inner");
    EXPECT_EQ(resolved("alias"), path("folder/inner"));
}

TEST_F(CAliasTest, WhatIsThereIsNeverOverwritten) {
    writeFile(path("alias"), "old");
    expectFailure(failureOf([&] { create("alias", "source \u00E9"); }), "FileSpec",
                  Error::msgWrongArgument, wrongFile(wide(path("alias")), L"already exists"),
                  {"createAliasFile"});
    EXPECT_EQ(readFile(path("alias")), "old");
}

TEST_F(CAliasTest, AMissingSourceIsAFailureOfTheCall) {
    CFileFailure const failure = failureOf([&] { create("alias", "missing"); });
    // No parameter fills the third place of the text.
    expectFailure(failure, "OSFile", Error::msgOSCallArgs,
                  {{"function", L"MacOS::createBookmarkFile"}, {"error", L"0"}},
                  {"doCreateAliasFile", "createAliasFile"});
    EXPECT_EQ(failure.message, L"Error in OS call MacOS::createBookmarkFile(@(args)): 0");
    EXPECT_EQ(listTree(path()), TNames{"source \u00E9"});
}

TEST_F(CAliasTest, AMissingFolderIsAFailureOfTheCall) {
    EXPECT_EQ(failureOf([&] { create("missing/alias", "source \u00E9"); }).name, "OSFile");
    EXPECT_EQ(listTree(path()), TNames{"source \u00E9"});
}

TEST_F(CAliasTest, WhatIsNoAliasLeadsNowhere) {
    EXPECT_EQ(resolved("source \u00E9"), "");
    EXPECT_EQ(resolved("missing"), "");
    EXPECT_EQ(resolved(""), "");
    CFileSpec result(L"before");
    EXPECT_FALSE(FileSys::resolveAlias(CFileSpec(), result));
    EXPECT_TRUE(result.empty());
}

TEST_F(CAliasTest, WhatHasNoTextLeadsNowhere) {
    create("alias", "source \u00E9");
    ASSERT_EQ(std::rename(path("source \u00E9").c_str(), path("source \xE9").c_str()), 0);
    EXPECT_EQ(resolved("alias"), "");
    CFileSpec result(L"before");
    CFileSpec const nameless(std::wstring(1, static_cast<wchar_t>(0xD800)));
    EXPECT_FALSE(FileSys::resolveAlias(nameless, result));
    EXPECT_TRUE(result.empty());
}

TEST_F(CAliasTest, AnAliasCanTakeItsOwnResult) {
    create("alias", "source \u00E9");
    CFileSpec spec(path("alias"));
    EXPECT_TRUE(FileSys::resolveAlias(spec, spec));
    EXPECT_EQ(spec, CFileSpec(path("source \u00E9")));
}

} // namespace
