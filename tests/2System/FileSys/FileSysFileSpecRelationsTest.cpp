#include "2System/FileSys/FileSys.h"

#include "1Base/Encoding/EncodingExc.h"
#include "support/LogRecorder.h"
#include "support/RaisedException.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <string>
#include <vector>

namespace {

using FileSys::CFileSpec;
using TestSupport::CRaised;
using TestSupport::TParameters;

class FileSysFileSpecRelationsTest : public TestSupport::CErrorTest {};

std::wstring absolute(std::wstring const& abs, std::wstring const& rel) {
    return CFileSpec::convertRelativeToAbsolutePath(CFileSpec(abs), CFileSpec(rel))
        .getFullName(false);
}

std::wstring base(std::wstring const& path, std::wstring const& other) {
    return CFileSpec(path).getBasePath(CFileSpec(other)).getFullName(false);
}

std::wstring relative(std::wstring const& path, std::wstring const& folder) {
    return CFileSpec(path).getRelativePath(CFileSpec(folder)).getFullName(false);
}

std::wstring acrobat(std::string const& text, int a = 0, int b = 0) {
    return FileSys::createFileSpecFromAcrobatFileSpec(text, a, b).getFullName(false);
}

// Texts of all characters of `alphabet`, up to `length` of them.
template <class TText>
std::vector<TText> textsUpTo(std::size_t length, TText const& alphabet) {
    std::vector<TText> texts(1);
    for (std::size_t first = 0; texts[first].size() < length; ++first) {
        for (auto const character : alphabet)
            texts.push_back(texts[first] + character);
    }
    return texts;
}

TEST_F(FileSysFileSpecRelationsTest, ARelativePathIsJoinedToTheAbsoluteOne) {
    EXPECT_EQ(absolute(L"/a/b", L"c"), L"/a/b/c");
    EXPECT_EQ(absolute(L"/a/b/", L"./c"), L"/a/b/c");
    EXPECT_EQ(absolute(L"/a/b", L"."), L"/a/b/.");
    EXPECT_EQ(absolute(L"/a/b", L""), L"/a/b");
    EXPECT_EQ(absolute(L"a", L"c"), L"a/c");
    EXPECT_EQ(absolute(L"", L"c"), L"c");
    EXPECT_EQ(absolute(L"", L""), L"");
}

TEST_F(FileSysFileSpecRelationsTest, AnAbsolutePathComesBackUnchanged) {
    EXPECT_EQ(absolute(L"/a/b", L"/x"), L"/x");
    EXPECT_EQ(absolute(L"/a/b", L"//x/../y//"), L"//x/../y//");
    EXPECT_EQ(absolute(L"", L"/"), L"/");
}

TEST_F(FileSysFileSpecRelationsTest, RunsOfSeparatorsInTheAbsolutePathCollapse) {
    EXPECT_EQ(absolute(L"//a///b////", L"c"), L"/a/b/c");
    EXPECT_EQ(absolute(L"/a//b", L"../c"), L"/a/c");
    EXPECT_EQ(absolute(L"////", L"c"), L"c");
}

TEST_F(FileSysFileSpecRelationsTest, TheRootIsLost) {
    EXPECT_EQ(absolute(L"/", L"x"), L"x");
    EXPECT_EQ(absolute(L"/", L""), L"");
}

TEST_F(FileSysFileSpecRelationsTest, OneLeadingDotIsRemoved) {
    EXPECT_EQ(absolute(L"/a", L"././c"), L"/a/./c");
    EXPECT_EQ(absolute(L"/a", L".c"), L"/a/.c");
    EXPECT_EQ(absolute(L"/a/b", L"./../c"), L"/a/c");
    EXPECT_EQ(absolute(L"/a/b", L".././c"), L"/a/./c");
}

TEST_F(FileSysFileSpecRelationsTest, LeadingDoubleDotsClimb) {
    EXPECT_EQ(absolute(L"/a/b", L"../c"), L"/a/c");
    EXPECT_EQ(absolute(L"/a/b", L".."), L"/a");
    EXPECT_EQ(absolute(L"/a/b", L"../"), L"/a");
    EXPECT_EQ(absolute(L"/a/b/c", L"../../d"), L"/a/d");
    EXPECT_EQ(absolute(L"a", L"../x"), L"x");
    EXPECT_EQ(absolute(L"a/b", L"../x"), L"a/x");
}

TEST_F(FileSysFileSpecRelationsTest, WhatFollowsTwoDotsGoesWithThem) {
    EXPECT_EQ(absolute(L"/a/b", L"..x/y"), L"/a/y");
    EXPECT_EQ(absolute(L"/a/b", L"..x"), L"/a");
    EXPECT_EQ(absolute(L"/a/b", L"..."), L"/a");
    EXPECT_EQ(absolute(L"/a/b/c", L"....../d"), L"/a/d");
    // "..//c" leaves "/c", which joins with one separator.
    EXPECT_EQ(absolute(L"/a/b", L"..//c"), L"/a/c");
}

TEST_F(FileSysFileSpecRelationsTest, DoubleDotsFurtherInsideStay) {
    EXPECT_EQ(absolute(L"/x", L"a/../b"), L"/x/a/../b");
    EXPECT_EQ(absolute(L"/x/..", L"b"), L"/x/../b");
}

TEST_F(FileSysFileSpecRelationsTest, ClimbingEndsAtTheRoot) {
    EXPECT_EQ(absolute(L"/a", L".."), L"/");
    EXPECT_EQ(absolute(L"/a", L"../../../x"), L"/x");
}

TEST_F(FileSysFileSpecRelationsTest, ClimbingAboveTheStartRaises) {
    using FileSys::TExcFileSpec;
    EXPECT_THROW(absolute(L"a", L"../.."), TExcFileSpec);
    EXPECT_THROW(absolute(L"/", L".."), TExcFileSpec);
    EXPECT_THROW(absolute(L"", L".."), TExcFileSpec);
    EXPECT_THROW(absolute(L"", L"./..x"), TExcFileSpec);
}

TEST_F(FileSysFileSpecRelationsTest, TheFailureShowsTheArgumentsAsTheyWere) {
    CRaised const raised =
        TestSupport::raisedBy<Error::CException>([] { absolute(L"a//b/", L"./../../../\u00E9"); });
    EXPECT_EQ(raised.name, "FileInfo");
    EXPECT_EQ(raised.severity, Error::SevError);
    EXPECT_EQ(raised.text, Error::loadDefaultMessage(Error::msgOSCallArgs));
    EXPECT_EQ(raised.parameters,
              (TParameters{{"function", L"convertRelativeToAbsolutePath"},
                           {"error", L"relative path is longer as the absolute one"},
                           {"args", L"absolute path: a//b/relative path: ./../../../\u00E9"}}));
}

TEST_F(FileSysFileSpecRelationsTest, TheFailureHasPassedItsOwnFunction) {
    CRaised const raised =
        TestSupport::raisedBy<Error::CException>([] { absolute(L"a", L"../.."); });
    EXPECT_NE(raised.file.find("2System/FileSys/_Imp/FileSysFileSpec"), std::string::npos)
        << raised.file;
    EXPECT_NE(raised.func.find("CFileSpec::convertRelativeToAbsolutePath("), std::string::npos)
        << raised.func;
    EXPECT_EQ(raised.trace, std::vector<std::string>{raised.func});
}

TEST_F(FileSysFileSpecRelationsTest, TheFailureIsCaughtAtEachLevel) {
    auto const climb = [] { absolute(L"a", L"../.."); };
    EXPECT_THROW(climb(), FileSys::TExcFileInfo);
    EXPECT_THROW(climb(), FileSys::TExcFileSpec);
    EXPECT_THROW(climb(), FileSys::TExcFileSys);
    EXPECT_THROW(climb(), TExcSystem);
    EXPECT_THROW(climb(), Error::CException);
}

TEST_F(FileSysFileSpecRelationsTest, LinesForDebuggingDoNotPassTheLogger) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevDebug> const installed(recorder);
    absolute(L"/a", L"b");
    EXPECT_TRUE(recorder.records().empty());
}

// The rules one by one, on one character after the other.
std::wstring naiveAbsolute(std::wstring const& absText, std::wstring const& relText) {
    if (!relText.empty() && relText[0] == L'/')
        return relText;
    std::wstring abs;
    for (wchar_t const character : absText) {
        if (character != L'/' || abs.empty() || abs[abs.size() - 1] != L'/')
            abs += character;
    }
    if (!abs.empty() && abs[abs.size() - 1] == L'/')
        abs = std::wstring(abs, 0, abs.size() - 1);
    std::size_t start = relText.size() > 1 && relText[0] == L'.' && relText[1] == L'/' ? 2 : 0;
    while (relText.size() >= start + 2 && relText[start] == L'.' && relText[start + 1] == L'.') {
        if (abs.empty())
            return L"raised";
        std::size_t kept = abs.size();
        while (kept > 0 && abs[kept - 1] != L'/')
            --kept;
        abs = std::wstring(abs, 0, kept > 1 ? kept - 1 : kept);
        start += relText.size() > start + 2 ? 3 : 2;
    }
    std::wstring const rest(relText, start);
    bool const needsSeparator = !abs.empty() && !rest.empty() && abs.back() != L'/';
    if (!abs.empty() && !rest.empty() && rest[0] == L'/')
        return (abs.back() == L'/' ? std::wstring(abs, 0, abs.size() - 1) : abs) + rest;
    return abs + (needsSeparator ? L"/" : L"") + rest;
}

TEST_F(FileSysFileSpecRelationsTest, EveryPairOfShortPathsIsJoinedByTheRules) {
    std::vector<std::wstring> const texts = textsUpTo<std::wstring>(5, L"/.a");
    std::size_t raised = 0;
    for (std::wstring const& abs : texts) {
        for (std::wstring const& rel : texts) {
            std::wstring result;
            try {
                result = absolute(abs, rel);
            } catch (FileSys::TExcFileInfo const&) {
                result = L"raised";
                ++raised;
            }
            ASSERT_EQ(result, naiveAbsolute(abs, rel))
                << testing::PrintToString(abs) << " with " << testing::PrintToString(rel);
        }
    }
    EXPECT_GT(raised, 0U);
}

TEST_F(FileSysFileSpecRelationsTest, TheBaseEndsInTheLastCommonSeparator) {
    EXPECT_EQ(base(L"/a/b", L"/a/c"), L"/a/");
    EXPECT_EQ(base(L"/a/b", L"/a/bc"), L"/a/");
    EXPECT_EQ(base(L"/a/bc", L"/a/b"), L"/a/");
    EXPECT_EQ(base(L"/a/b/c", L"/a/b"), L"/a/");
    EXPECT_EQ(base(L"/a/b", L"/a/b/c"), L"/a/");
    EXPECT_EQ(base(L"/a/b/", L"/a/b/c"), L"/a/b/");
    EXPECT_EQ(base(L"/a", L"/b"), L"/");
}

TEST_F(FileSysFileSpecRelationsTest, TheBaseOfEqualPathsIsThePathItself) {
    EXPECT_EQ(base(L"/a/b", L"/a/b"), L"/a/b");
    EXPECT_EQ(base(L"/a/b/", L"/a/b/"), L"/a/b/");
    EXPECT_EQ(base(L"a", L"a"), L"a");
    EXPECT_EQ(base(L"", L""), L"");
}

TEST_F(FileSysFileSpecRelationsTest, PathsWithoutACommonSeparatorHaveNoBase) {
    EXPECT_EQ(base(L"a", L"b"), L"");
    EXPECT_EQ(base(L"a", L"/a"), L"");
    EXPECT_EQ(base(L"", L"/a"), L"");
    EXPECT_EQ(base(L"/a", L""), L"");
}

TEST_F(FileSysFileSpecRelationsTest, ASeparatorThatMeetsAnotherCharacterCounts) {
    EXPECT_EQ(base(L"/a/b", L"/a_c"), L"/a/");
    EXPECT_EQ(base(L"/a_c", L"/a/b"), L"/");
    EXPECT_EQ(base(L"/a", L"a"), L"/");
}

// Both relations told by the length of the common beginning.
TEST_F(FileSysFileSpecRelationsTest, EveryPairOfShortPathsIsRelatedByItsCommonBeginning) {
    std::vector<std::wstring> const texts = textsUpTo<std::wstring>(5, L"/ab");
    for (std::wstring const& path : texts) {
        for (std::wstring const& other : texts) {
            std::size_t same = 0;
            while (same < path.size() && same < other.size() && path[same] == other[same])
                ++same;
            bool const bothGoOn = same < path.size() && same < other.size();
            std::wstring const seen = path.substr(0, same + (bothGoOn ? 1 : 0));
            std::wstring const folder = seen.substr(0, seen.rfind(L'/') + 1);
            ASSERT_EQ(base(path, other), path == other ? path : folder)
                << testing::PrintToString(path) << " with " << testing::PrintToString(other);

            std::wstring expected = path;
            if (same == other.size()) {
                bool const hasSeparator = same < path.size() && path[same] == L'/';
                expected = path.substr(same + (hasSeparator ? 1 : 0));
            }
            ASSERT_EQ(relative(path, other), expected)
                << testing::PrintToString(path) << " with " << testing::PrintToString(other);
        }
    }
}

TEST_F(FileSysFileSpecRelationsTest, ABaseIsStripped) {
    EXPECT_EQ(relative(L"/a/b", L"/a"), L"b");
    EXPECT_EQ(relative(L"/a/b", L"/a/"), L"b");
    EXPECT_EQ(relative(L"/a/b/c", L"/a"), L"b/c");
    EXPECT_EQ(relative(L"/a//b", L"/a"), L"/b");
    EXPECT_EQ(relative(L"/a/", L"/a"), L"");
    EXPECT_EQ(relative(L"a", L""), L"a");
    EXPECT_EQ(relative(L"/a", L""), L"a");
}

TEST_F(FileSysFileSpecRelationsTest, APathAgainstItselfIsEmpty) {
    EXPECT_EQ(relative(L"/a/b", L"/a/b"), L"");
    EXPECT_EQ(relative(L"", L""), L"");
}

TEST_F(FileSysFileSpecRelationsTest, ABaseThatDoesNotApplyIsNotStripped) {
    EXPECT_EQ(relative(L"/a", L"/a/b"), L"/a");
    EXPECT_EQ(relative(L"/a", L"/a/"), L"/a");
    EXPECT_EQ(relative(L"/a/b", L"/c"), L"/a/b");
    EXPECT_EQ(relative(L"", L"/"), L"");
}

TEST_F(FileSysFileSpecRelationsTest, ABaseKnowsNoComponents) {
    EXPECT_EQ(relative(L"/a/bc", L"/a/b"), L"c");
}

TEST_F(FileSysFileSpecRelationsTest, ForbiddenCharactersBecomeLowLines) {
    EXPECT_EQ(CFileSpec::makeFileName(L"a/b"), L"a_b");
    EXPECT_EQ(CFileSpec::makeFileName(L"a\tb"), L"a_b");
    EXPECT_EQ(CFileSpec::makeFileName(std::wstring(1, L'\0') + L"\x1F\n/"), L"____");
    EXPECT_EQ(CFileSpec::makeFileName(L"a b\\c:d*\x7F\u00E9\U0001F600"),
              L"a b\\c:d*\x7F\u00E9\U0001F600");
}

TEST_F(FileSysFileSpecRelationsTest, BlanksAndDotsAtTheEndGo) {
    EXPECT_EQ(CFileSpec::makeFileName(L"a. . "), L"a");
    EXPECT_EQ(CFileSpec::makeFileName(L"....."), L"");
    EXPECT_EQ(CFileSpec::makeFileName(L" . "), L"");
    EXPECT_EQ(CFileSpec::makeFileName(L""), L"");
    EXPECT_EQ(CFileSpec::makeFileName(L" .a"), L" .a");
    // A tab is replaced before the end is looked at.
    EXPECT_EQ(CFileSpec::makeFileName(L"a. \t"), L"a. _");
}

// Characters that differ from their neighbours, so that it shows which were taken out.
std::wstring distinct(std::size_t count) {
    std::wstring text;
    for (std::size_t i = 0; i < count; ++i)
        text += static_cast<wchar_t>(L'\u4E00' + static_cast<wchar_t>(i));
    return text;
}

TEST_F(FileSysFileSpecRelationsTest, ANameOf255CharactersStands) {
    EXPECT_EQ(CFileSpec::makeFileName(distinct(251) + L".pdf"), distinct(251) + L".pdf");
    EXPECT_EQ(CFileSpec::makeFileName(distinct(255)), distinct(255));
    // Its end is looked at before its length.
    EXPECT_EQ(CFileSpec::makeFileName(distinct(255) + L"..."), distinct(255));
}

TEST_F(FileSysFileSpecRelationsTest, ALongNameWithoutADotIsCut) {
    EXPECT_EQ(CFileSpec::makeFileName(distinct(256)), distinct(255));
    EXPECT_EQ(CFileSpec::makeFileName(distinct(300)), distinct(255));
}

TEST_F(FileSysFileSpecRelationsTest, TheExtensionOfALongNameSurvives) {
    std::wstring const stem = distinct(300);
    EXPECT_EQ(CFileSpec::makeFileName(stem + L".pdf"),
              stem.substr(0, 250) + stem.substr(299) + L".pdf");
    EXPECT_EQ(CFileSpec::makeFileName(distinct(252) + L".pdf"),
              distinct(250) + distinct(252).substr(251) + L".pdf");
}

TEST_F(FileSysFileSpecRelationsTest, ADotTooFarInFrontIsNoExtension) {
    std::wstring name = distinct(300);
    name[46] = L'.';
    EXPECT_EQ(CFileSpec::makeFileName(name), name.substr(0, 255));
    name[46] = distinct(300)[46];
    name[47] = L'.';
    EXPECT_EQ(CFileSpec::makeFileName(name), name.substr(0, 1) + name.substr(46));
    name[0] = L'.';
    EXPECT_EQ(CFileSpec::makeFileName(name), name.substr(0, 1) + name.substr(46)) << "the last dot";
}

TEST_F(FileSysFileSpecRelationsTest, EveryLongNameKeeps255Characters) {
    for (std::size_t size = 256; size <= 600; size += 43) {
        for (std::size_t dot = 0; dot + 1 < size; ++dot) {
            std::wstring name = distinct(size);
            name[dot] = L'.';
            std::wstring const made = CFileSpec::makeFileName(name);
            ASSERT_EQ(made.size(), 255U) << size << ", " << dot;
            if (dot + 254 > size)
                ASSERT_EQ(made.substr(254 + dot - size), name.substr(dot - 1))
                    << size << ", " << dot;
            else
                ASSERT_EQ(made, name.substr(0, 255)) << size << ", " << dot;
        }
    }
}

TEST_F(FileSysFileSpecRelationsTest, APdfPathLosesItsLeadingSeparator) {
    EXPECT_EQ(acrobat("/c/dir/file.pdf"), L"c/dir/file.pdf");
    EXPECT_EQ(acrobat("dir/file.pdf"), L"dir/file.pdf");
    EXPECT_EQ(acrobat("//server/file"), L"/server/file");
    EXPECT_EQ(acrobat("/"), L"");
    EXPECT_EQ(acrobat(""), L"");
}

TEST_F(FileSysFileSpecRelationsTest, BackslashesAreResolvedInTheirOrder) {
    EXPECT_EQ(acrobat("a\\\\b"), L"a\\b");
    EXPECT_EQ(acrobat("a\\/b"), L"a/b");
    EXPECT_EQ(acrobat("a\\b"), L"a\\b");
    EXPECT_EQ(acrobat("\\/a"), L"a");
    // The one backslash that two leave is consumed with the separator behind it.
    EXPECT_EQ(acrobat("a\\\\/b"), L"a/b");
    EXPECT_EQ(acrobat("a\\\\\\/b"), L"a\\/b");
    EXPECT_EQ(acrobat("a\\\\\\\\b"), L"a\\\\b");
    EXPECT_EQ(acrobat("a\\\\\\b"), L"a\\\\b");
}

TEST_F(FileSysFileSpecRelationsTest, ThePairOfNulCharactersIsTheMarker) {
    EXPECT_EQ(acrobat(std::string("a\0\0b", 4)), L"a\\b");
    EXPECT_EQ(acrobat(std::string("a\0b", 3)), std::wstring(L"a\0b", 3));
    EXPECT_EQ(acrobat(std::string("a\0\0/b", 5)), L"a/b");
}

TEST_F(FileSysFileSpecRelationsTest, TheNumbersOfAPdfPathChangeNothing) {
    for (int const a : {-1, 0, 4, 5}) {
        for (int const b : {-1, 0, 4, 5})
            EXPECT_EQ(acrobat("/a\\/b/c\\\\d", a, b), L"a/b/c\\d") << a << ", " << b;
    }
}

TEST_F(FileSysFileSpecRelationsTest, APdfPathIsReadAsUtf8) {
    EXPECT_EQ(acrobat("/\xC3\xA9\xF0\x9F\x98\x80"), L"\u00E9\U0001F600");
    CRaised const raised = TestSupport::raisedBy<Encoding::TExcEncoding>([] { acrobat("a\xFF"); });
    ASSERT_EQ(raised.trace.size(), 1U);
    EXPECT_NE(raised.trace[0].find("createFileSpecFromAcrobatFileSpec("), std::string::npos);
}

std::wstring naiveReplaceAll(std::wstring text, std::wstring const& from, std::wstring const& to) {
    for (std::size_t found; (found = text.find(from)) != std::wstring::npos;)
        text = text.substr(0, found) + to + text.substr(found + from.size());
    return text;
}

TEST_F(FileSysFileSpecRelationsTest, EveryShortPdfPathIsResolvedByTheSteps) {
    std::string const alphabet("\\/\0a", 4);
    std::wstring const marker(L"\0\0", 2);
    for (std::string const& text : textsUpTo(7, alphabet)) {
        std::wstring expected(text.begin(), text.end());
        expected = naiveReplaceAll(expected, L"\\\\", marker);
        expected = naiveReplaceAll(expected, marker, L"\\");
        expected = naiveReplaceAll(expected, L"\\/", marker);
        expected = naiveReplaceAll(expected, marker, L"/");
        if (!expected.empty() && expected[0] == L'/')
            expected = expected.substr(1);
        ASSERT_EQ(acrobat(text), expected) << testing::PrintToString(text);
    }
}

} // namespace
