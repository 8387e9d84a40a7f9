#include "2System/FileSys/FileSys.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <functional>
#include <set>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace {

using CFileSysFileSpecTest = TestSupport::CObjectCountTest;

using FileSys::CFileSpec;
using TestSupport::CPlatformCalls;

Strings::string textOf(CFileSpec const& spec) {
    return spec.getFullName(false);
}

// Longer than any text that a string keeps within itself.
Strings::string const longText = L"/home/ada/a folder with a long name/letter.odt";

// --- construction

TEST_F(CFileSysFileSpecTest, ANewSpecificationIsEmpty) {
    CFileSpec const spec;
    EXPECT_TRUE(spec.empty());
    EXPECT_EQ(textOf(spec), L"");
}

TEST_F(CFileSysFileSpecTest, ALiteralIsTakenUpToItsFirstZero) {
    EXPECT_EQ(textOf(CFileSpec(L"/a/b")), L"/a/b");
    EXPECT_EQ(textOf(CFileSpec(L"/a\0/b")), L"/a");
    EXPECT_TRUE(CFileSpec(L"").empty());
}

TEST_F(CFileSysFileSpecTest, AStringIsTakenWithItsZeros) {
    Strings::string const text(L"/a\0/b", 5);
    EXPECT_EQ(textOf(CFileSpec(text)), text);
    EXPECT_EQ(CFileSpec(text).getFile(), L"b");
    EXPECT_EQ(textOf(CFileSpec(std::string("/a\0/b", 5))), text);
}

TEST_F(CFileSysFileSpecTest, EveryStringKindIsTaken) {
    Strings::string const text = L"/caf\u00E9/\U0001F600";
    EXPECT_EQ(textOf(CFileSpec(text)), text);
    EXPECT_EQ(textOf(CFileSpec(std::string("/caf\xC3\xA9/\xF0\x9F\x98\x80"))), text);
    EXPECT_EQ(textOf(CFileSpec(TestSupport::utf16Of(U"/caf\u00E9/\U0001F600"))), text);
}

TEST_F(CFileSysFileSpecTest, AWideStringIsCopiedWithoutConversion) {
    // No code points, which a conversion would refuse.
    Strings::string const odd = {static_cast<wchar_t>(0xD800), static_cast<wchar_t>(-1)};
    CPlatformCalls const calls;
    EXPECT_EQ(textOf(CFileSpec(odd)), odd);
    EXPECT_EQ(textOf(CFileSpec(odd.c_str())), odd);
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CFileSysFileSpecTest, MalformedUTF8RaisesTheConversionFailure) {
    TestSupport::CConversionFailure const expected = {
        "CFStringCreateWithBytes", "Could not create string with encoding UTF8", 53};
    std::string const text = "/a\xFF";
    EXPECT_EQ(TestSupport::conversionFailureOf([&text] { CFileSpec const spec(text); }), expected);
    EXPECT_EQ(TestSupport::conversionFailureOf([&text] { CFileSpec::parseUnixPath(text); }),
              expected);
}

TEST_F(CFileSysFileSpecTest, NoTextIsChanged) {
    for (wchar_t const* const text :
         {L"//", L"/a//b", L"/a/", L"/a/./b", L"/a/../b", L"/private/tmp", L"~", L" a ", L"a\\b",
          L"/A/e\u0301", L"."}) {
        EXPECT_EQ(textOf(CFileSpec(text)), text);
        EXPECT_EQ(textOf(CFileSpec(Strings::string(text))), text);
        EXPECT_EQ(textOf(CFileSpec::parseUnixPath(Strings::string(text))), text);
    }
}

TEST_F(CFileSysFileSpecTest, APosixPathIsTheTextItself) {
    EXPECT_EQ(textOf(CFileSpec::parseUnixPath(Strings::string(L"/a//b/"))), L"/a//b/");
    EXPECT_EQ(textOf(CFileSpec::parseUnixPath(std::string("/caf\xC3\xA9"))), L"/caf\u00E9");
    EXPECT_TRUE(CFileSpec::parseUnixPath(std::string()).empty());
}

TEST_F(CFileSysFileSpecTest, ACopyIsIndependent) {
    CFileSpec const original(L"/a");
    CFileSpec copy(original);
    copy += L"b";
    EXPECT_EQ(textOf(original), L"/a");
    EXPECT_EQ(textOf(copy), L"/a/b");
    copy = original;
    EXPECT_EQ(textOf(copy), L"/a");
    copy = static_cast<CFileSpec const&>(copy);
    EXPECT_EQ(textOf(copy), L"/a");
}

TEST_F(CFileSysFileSpecTest, WhatIsMovedFromIsEmpty) {
    for (Strings::string const& text : {Strings::string(L"/a"), longText, Strings::string()}) {
        CFileSpec source(text);
        CFileSpec target(std::move(source));
        EXPECT_EQ(textOf(target), text);
        EXPECT_TRUE(source.empty()); // NOLINT: what the moved-from value is, is the point

        CFileSpec const longSource(longText);
        CFileSpec assigned(longSource);
        assigned = std::move(target);
        EXPECT_EQ(textOf(assigned), text);
        EXPECT_TRUE(target.empty()); // NOLINT
    }
}

TEST_F(CFileSysFileSpecTest, MovingToItselfKeepsTheText) {
    for (Strings::string const& text : {Strings::string(L"/a"), longText}) {
        CFileSpec spec(text);
        CFileSpec& same = spec;
        spec = std::move(same);
        EXPECT_EQ(textOf(spec), text);
    }
}

TEST_F(CFileSysFileSpecTest, AMovedFromSpecificationMayBeUsedAgain) {
    CFileSpec source(L"/a");
    CFileSpec const target(std::move(source));
    source += L"b"; // NOLINT
    EXPECT_EQ(textOf(source), L"b");
}

TEST_F(CFileSysFileSpecTest, ATextIsAssigned) {
    CFileSpec spec(L"/a");
    EXPECT_EQ(&(spec = Strings::string(L"/b//")), &spec);
    EXPECT_EQ(textOf(spec), L"/b//");
    EXPECT_EQ(&(spec = L"/c"), &spec);
    EXPECT_EQ(textOf(spec), L"/c");
    spec = Strings::string();
    EXPECT_TRUE(spec.empty());
}

// --- reading

TEST_F(CFileSysFileSpecTest, TheFullNameIsTheTextWhateverItIsFor) {
    CFileSpec const spec(L"/private/caf\u00E9/");
    EXPECT_EQ(spec.getFullName(true), L"/private/caf\u00E9/");
    EXPECT_EQ(spec.getFullName(false), L"/private/caf\u00E9/");
}

TEST_F(CFileSysFileSpecTest, TheFullNameComesInEveryStringKind) {
    std::u32string const text = U"/caf\u00E9/\U0001F600";
    CFileSpec const spec(TestSupport::wideOf(text));
    for (bool const forSystemCall : {false, true}) {
        EXPECT_EQ(spec.getFullName<std::string>(forSystemCall), TestSupport::utf8Of(text));
        EXPECT_EQ(spec.getFullName<Strings::stringUTF16>(forSystemCall),
                  TestSupport::utf16Of(text));
        EXPECT_EQ(spec.getFullName<Strings::string>(forSystemCall), TestSupport::wideOf(text));
    }
    EXPECT_EQ(CFileSpec().getFullName<std::string>(true), "");
}

TEST_F(CFileSysFileSpecTest, OnlyATextWithoutCharactersIsEmpty) {
    EXPECT_TRUE(CFileSpec(L"").empty());
    EXPECT_FALSE(CFileSpec(L"/").empty());
    EXPECT_FALSE(CFileSpec(Strings::string(1, L'\0')).empty());
}

struct CSplit {
    wchar_t const* text;
    wchar_t const* path;
    wchar_t const* file;
    wchar_t const* name;
    wchar_t const* extension;
};

TEST_F(CFileSysFileSpecTest, ATextIsSplitAtItsLastSeparators) {
    CSplit const splits[] = {
        {L"", L"", L"", L"", L""},
        {L"abc", L"", L"abc", L"abc", L""},
        {L"/", L"/", L"", L"", L""},
        {L"//", L"/", L"", L"", L""},
        {L"/x", L"/", L"x", L"x", L""},
        {L"/a/b/", L"/a/b", L"", L"", L""},
        {L"/a//b", L"/a/", L"b", L"b", L""},
        {L"/a/b.c/", L"/a/b.c", L"", L"", L""},
        {L"/a.b/c", L"/a.b", L"c", L"c", L""},
        {L"/a/.profile", L"/a", L".profile", L"", L"profile"},
        {L".profile", L"", L".profile", L"", L"profile"},
        {L"a.", L"", L"a.", L"a", L""},
        {L".", L"", L".", L"", L""},
        {L"..", L"", L"..", L".", L""},
        {L"/a/..", L"/a", L"..", L".", L""},
        {L"a.tar.gz", L"", L"a.tar.gz", L"a.tar", L"gz"},
        {L"a..b", L"", L"a..b", L"a.", L"b"},
        {L"/a/b.c", L"/a", L"b.c", L"b", L"c"},
        {L"a/b", L"a", L"b", L"b", L""},
        {L"/\U0001F600.\U0001F601", L"/", L"\U0001F600.\U0001F601", L"\U0001F600", L"\U0001F601"}};
    for (CSplit const& split : splits) {
        CFileSpec const spec(split.text);
        EXPECT_EQ(spec.getPath(), split.path) << testing::PrintToString(split.text);
        EXPECT_EQ(spec.getFile(), split.file) << testing::PrintToString(split.text);
        EXPECT_EQ(spec.getFileName(), split.name) << testing::PrintToString(split.text);
        EXPECT_EQ(spec.getFileExtension(), split.extension) << testing::PrintToString(split.text);
        EXPECT_EQ(textOf(spec.getParentFolder()), split.path) << testing::PrintToString(split.text);
    }
}

TEST_F(CFileSysFileSpecTest, TheRootIsItsOwnParent) {
    EXPECT_EQ(textOf(CFileSpec(L"/").getParentFolder()), L"/");
    EXPECT_EQ(textOf(CFileSpec(L"/x").getParentFolder().getParentFolder()), L"/");
    EXPECT_TRUE(CFileSpec().getParentFolder().empty());
}

TEST_F(CFileSysFileSpecTest, ASubFolderIsAPrefixOfTheText) {
    auto const below = [](wchar_t const* spec, wchar_t const* other) {
        return CFileSpec(spec).isSubFolderOf(CFileSpec(other));
    };
    EXPECT_TRUE(below(L"/tmp/a", L"/tmp"));
    EXPECT_TRUE(below(L"/tmpfoo", L"/tmp"));
    EXPECT_TRUE(below(L"/tmp", L"/tmp"));
    EXPECT_TRUE(below(L"/tmp", L""));
    EXPECT_TRUE(below(L"", L""));
    EXPECT_TRUE(below(L"/tmp", L"/"));
    EXPECT_FALSE(below(L"", L"/"));
    EXPECT_FALSE(below(L"/tmp", L"/tmp/"));
    EXPECT_FALSE(below(L"/tm", L"/tmp"));
    EXPECT_FALSE(below(L"/Tmp/a", L"/tmp"));
    EXPECT_FALSE(below(L"/a/tmp", L"tmp"));
}

// --- changing

struct CExtension {
    wchar_t const* text;
    wchar_t const* extension;
    bool replace;
    wchar_t const* expected;
};

TEST_F(CFileSysFileSpecTest, AnExtensionIsAppendedReplacedOrTakenAway) {
    CExtension const cases[] = {// appended, whatever there is
                                {L"a", L"c", false, L"a.c"},
                                {L"a.b", L"c", false, L"a.b.c"},
                                {L"a", L"", false, L"a."},
                                {L"a.b", L"", false, L"a.b."},
                                {L"a.", L"c", false, L"a..c"},
                                {L"", L"c", false, L".c"},
                                {L"/a/", L"c", false, L"/a/.c"},
                                // nothing to replace, nothing to append
                                {L"a", L"", true, L"a"},
                                {L"/a.b/c", L"", true, L"/a.b/c"},
                                {L"", L"", true, L""},
                                // nothing to replace
                                {L"a", L"c", true, L"a.c"},
                                {L"/a.b/c", L"d", true, L"/a.b/c.d"},
                                {L"/a.b/", L"d", true, L"/a.b/.d"},
                                {L"", L"c", true, L".c"},
                                // replaced
                                {L"a.b", L"c", true, L"a.c"},
                                {L"a.", L"x", true, L"a.x"},
                                {L"a.tar.gz", L"zip", true, L"a.tar.zip"},
                                {L"/a/.profile", L"x", true, L"/a/.x"},
                                {L"a.b", L"c.d", true, L"a.c.d"},
                                // taken away with its dot
                                {L"a.b", L"", true, L"a"},
                                {L"a.", L"", true, L"a"},
                                {L"a.tar.gz", L"", true, L"a.tar"},
                                {L"/a/.profile", L"", true, L"/a/"}};
    for (CExtension const& given : cases) {
        CFileSpec spec(given.text);
        spec.setFileExtension(given.extension, given.replace);
        EXPECT_EQ(textOf(spec), given.expected)
            << testing::PrintToString(given.text) << ", " << testing::PrintToString(given.extension)
            << ", " << given.replace;
    }
}

struct CJoin {
    wchar_t const* left;
    wchar_t const* right;
    wchar_t const* expected;
};

TEST_F(CFileSysFileSpecTest, TwoTextsAreJoinedByOneSeparator) {
    CJoin const joins[] = {
        {L"a", L"b", L"a/b"},    {L"a/", L"b", L"a/b"},    {L"a", L"/b", L"a/b"},
        {L"a/", L"/b", L"a/b"},  {L"a//", L"/b", L"a//b"}, {L"a//", L"b", L"a//b"},
        {L"a", L"//b", L"a//b"}, {L"a/", L"//b", L"a//b"}, {L"a//", L"//b", L"a///b"},
        {L"/", L"/x", L"/x"},    {L"/", L"x", L"/x"},      {L"/", L"/", L"/"},
        {L"//", L"/", L"//"},    {L"/", L"//", L"//"},     {L"a", L"/", L"a/"},
        {L"a/", L"/", L"a/"},    {L"", L"x", L"x"},        {L"", L"/x", L"/x"},
        {L"", L"", L""},         {L"", L"/", L"/"},        {L"a", L"", L"a"},
        {L"a/", L"", L"a/"},     {L"/", L"", L"/"},        {L"/a/b", L"c/d/", L"/a/b/c/d/"}};
    for (CJoin const& join : joins) {
        CFileSpec spec(join.left);
        EXPECT_EQ(&(spec += join.right), &spec);
        EXPECT_EQ(textOf(spec), join.expected);
        CFileSpec const left(join.left);
        EXPECT_EQ(textOf(left + join.right), join.expected);
        EXPECT_EQ(textOf(left), join.left);
        EXPECT_EQ(textOf(CFileSpec(join.left) + Strings::string(join.right)), join.expected);
    }
}

// --- constants

TEST_F(CFileSysFileSpecTest, TheSeparatorsAreTheSlashAndTheDot) {
    EXPECT_EQ(CFileSpec::getPathSeparator(), 47);
    EXPECT_EQ(CFileSpec::getExtensionSeparator(), 46);
}

TEST_F(CFileSysFileSpecTest, TheForbiddenCharactersAreTheControlsAndTheSlash) {
    Strings::string const forbidden = CFileSpec::getForbiddenChars();
    ASSERT_EQ(forbidden.size(), 33U);
    for (std::size_t code = 0; code < 32; ++code)
        EXPECT_EQ(forbidden[code], static_cast<wchar_t>(code));
    EXPECT_EQ(forbidden[32], 47);
    EXPECT_NE(CFileSpec::getForbiddenChars().data(), forbidden.data());
}

// --- operators

TEST_F(CFileSysFileSpecTest, EqualSpecificationsHaveTheSameUnits) {
    EXPECT_TRUE(CFileSpec(L"/a") == CFileSpec(L"/a"));
    EXPECT_TRUE(CFileSpec() == CFileSpec(L""));
    EXPECT_FALSE(CFileSpec(L"/a") == CFileSpec(L"/a/"));
    EXPECT_FALSE(CFileSpec(L"/a") == CFileSpec(L"/A"));
    EXPECT_FALSE(CFileSpec(L"\u00E9") == CFileSpec(L"e\u0301"));
    EXPECT_FALSE(CFileSpec(Strings::string(L"a\0b", 3)) == CFileSpec(Strings::string(L"a\0c", 3)));
    EXPECT_FALSE(CFileSpec(Strings::string(L"a\0", 2)) == CFileSpec(L"a"));
}

TEST_F(CFileSysFileSpecTest, TheOrderIsThatOfSignedUnits) {
    auto const less = [](Strings::string const& left, Strings::string const& right) {
        return CFileSpec(left) < CFileSpec(right);
    };
    auto const isOrdered = [&less](Strings::string const& left, Strings::string const& right) {
        return less(left, right) && !less(right, left);
    };
    EXPECT_TRUE(isOrdered(L"/a", L"/a/"));
    EXPECT_TRUE(isOrdered(L"/A", L"/a"));
    EXPECT_TRUE(isOrdered(L"", L"/"));
    EXPECT_TRUE(isOrdered(L"/a/b", L"/ab"));
    EXPECT_TRUE(isOrdered(L"b", L"\u00E9"));
    EXPECT_TRUE(isOrdered(L"\uFFFF", L"\U00010000"));
    EXPECT_TRUE(isOrdered(Strings::string(L"a\0b", 3), Strings::string(L"a\0c", 3)));
    EXPECT_FALSE(less(L"/a", L"/a"));
    EXPECT_FALSE(less(L"", L""));

    Strings::string const negative = {static_cast<wchar_t>(-1)};
    EXPECT_TRUE(isOrdered(negative, L"a"));
    EXPECT_TRUE(isOrdered(negative, Strings::string(1, L'\0')));
    EXPECT_TRUE(isOrdered({static_cast<wchar_t>(-2)}, negative));
    // Where units differ only far behind, too.
    Strings::string const front(40, L'x');
    EXPECT_TRUE(isOrdered(front + negative, front + L"a"));
}

TEST_F(CFileSysFileSpecTest, ASetIsInThatOrder) {
    Strings::string const negative = {static_cast<wchar_t>(-5), L'a'};
    std::set<CFileSpec> const specs = {L"/b", L"/a/", L"/a",     L"\U0001F600",      L"/A",
                                       L"",   L"/a",  L"\uFFFF", CFileSpec(negative)};
    std::vector<Strings::string> texts;
    for (CFileSpec const& spec : specs)
        texts.push_back(textOf(spec));
    EXPECT_EQ(texts, (std::vector<Strings::string>{L"", negative, L"/A", L"/a", L"/a/", L"/b",
                                                   L"\uFFFF", L"\U0001F600"}));
    EXPECT_TRUE(std::less<CFileSpec>()(L"/a", L"/b"));
}

TEST_F(CFileSysFileSpecTest, ACharacterAboveThe16BitRangeIsOneUnit) {
    CFileSpec const spec(std::string("\xF0\x9F\x98\x80"));
    EXPECT_EQ(textOf(spec).size(), 1U);
    EXPECT_EQ(textOf(spec)[0], 0x1F600);
}

TEST_F(CFileSysFileSpecTest, AStreamGetsTheFullName) {
    std::wostringstream stream;
    EXPECT_EQ(&(stream << CFileSpec(L"/caf\u00E9/")), &stream);
    stream << L'|' << CFileSpec() << L'|' << CFileSpec(Strings::string(L"a\0b", 3));
    EXPECT_EQ(stream.str(), Strings::string(L"/caf\u00E9/||a\0b", 11));
}

} // namespace
