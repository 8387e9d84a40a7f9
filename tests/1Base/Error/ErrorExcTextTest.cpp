// The text forms of exceptions and their parts, to the blank.

#include "1Base/Error/Error.h"
#include "1Base/StdUtil/StdUtilStreamCast.h"

#include "support/MessageParameters.h"
#include "support/Registry.h"
#include "support/SampleException.h"

#include <gtest/gtest.h>

#include <iomanip>
#include <ios>
#include <sstream>
#include <string>

namespace {

using TestSupport::messageOf;
using TestSupport::sample;
using TestSupport::sampleAt;
using TestSupport::sampleOrigin;
using TestSupport::XSample;

using CErrorExcTextTest = TestSupport::CErrorTest;

constexpr bool plain = false;
constexpr bool detailed = true;

template <class TChar, class TThing>
std::basic_string<TChar> textOf(TThing const& thing, bool isDetailed) {
    std::basic_ostringstream<TChar> stream;
    thing.writeTo(stream, isDetailed);
    return stream.str();
}

// Rendering changes an exception, so each width gets one of its own. `expected` is ASCII.
template <class TMake>
void expectText(TMake const& make, bool isDetailed, std::string const& expected) {
    EXPECT_EQ(textOf<char>(make(), isDetailed), expected);
    EXPECT_EQ(textOf<wchar_t>(make(), isDetailed), std::wstring(expected.begin(), expected.end()));
}

Error::CStackInfo blockAt(unsigned int begin, unsigned int end) {
    return Error::CStackInfo("/build/B", begin, end, "int g()", "Apr 29 2021", "08:35:23");
}

TEST_F(CErrorExcTextTest, APlainOriginIsFileAndLine) {
    expectText([] { return sampleOrigin(); }, plain, "/build/A #118");
}

TEST_F(CErrorExcTextTest, ADetailedOriginHasSignatureAndBuildTime) {
    expectText([] { return sampleOrigin(); }, detailed,
               "/build/A #118, 'int f(int)()', (Apr 29 2021, 08:35:23)");
}

TEST_F(CErrorExcTextTest, TheLineOfAnOriginHasThreePlacesAtLeast) {
    expectText([] { return sampleOrigin(0); }, plain, "/build/A #  0");
    expectText([] { return sampleOrigin(7); }, plain, "/build/A #  7");
    expectText([] { return sampleOrigin(99); }, plain, "/build/A # 99");
    expectText([] { return sampleOrigin(100); }, plain, "/build/A #100");
    expectText([] { return sampleOrigin(4294967295U); }, plain, "/build/A #4294967295");
}

TEST_F(CErrorExcTextTest, TheLinesOfABlockAreNotPadded) {
    expectText([] { return blockAt(7, 9); }, plain, "/build/B [#7...#9] ");
    expectText([] { return blockAt(7, 9); }, detailed,
               "/build/B [#7...#9], 'int g()()', (Apr 29 2021, 08:35:23) ");
    expectText([] { return blockAt(1023, 1030); }, plain, "/build/B [#1023...#1030] ");
}

TEST_F(CErrorExcTextTest, BlocksStandOneAfterTheOther) {
    Error::CStackInfoList list;
    expectText([&list] { return list; }, detailed, "");
    list.add(blockAt(1, 2));
    list.add(blockAt(30, 400));
    expectText([&list] { return list; }, plain, "/build/B [#1...#2] /build/B [#30...#400] ");
    expectText([&list] { return list; }, detailed,
               "/build/B [#1...#2], 'int g()()', (Apr 29 2021, 08:35:23) "
               "/build/B [#30...#400], 'int g()()', (Apr 29 2021, 08:35:23) ");
}

XSample withText() {
    return sample(messageOf("text of the message"));
}

TEST_F(CErrorExcTextTest, APlainExceptionIsOriginSeverityAndMessage) {
    expectText(withText, plain, "/build/A #118: [SevError] \"text of the message\"");
}

TEST_F(CErrorExcTextTest, ADetailedExceptionWithoutBlocksEndsInABlank) {
    expectText(withText, detailed,
               "'Sample': /build/A #118, 'int f(int)()', (Apr 29 2021, 08:35:23): [SevError] "
               "\"text of the message\" ");
}

TEST_F(CErrorExcTextTest, ADetailedExceptionEndsInTheBlankOfItsLastBlock) {
    auto const make = [] {
        XSample exc = withText();
        exc.getStackInfo().add(blockAt(1023, 1030));
        return exc;
    };
    expectText(make, detailed,
               "'Sample': /build/A #118, 'int f(int)()', (Apr 29 2021, 08:35:23): [SevError] "
               "\"text of the message\" "
               "/build/B [#1023...#1030], 'int g()()', (Apr 29 2021, 08:35:23) ");
    expectText(make, plain, "/build/A #118: [SevError] \"text of the message\"");
}

TEST_F(CErrorExcTextTest, TheSeverityIsNamed) {
    char const* const names[] = {"SevDebug", "SevLog",   "SevInfo",
                                 "SevWarn",  "SevError", "SevFatal"};
    int value = 0;
    for (char const* const name : names) {
        auto const severity = static_cast<Error::ESeverity>(++value);
        expectText([severity] { return Error::CInfo(sampleOrigin(), severity, messageOf("m")); },
                   plain, std::string("/build/A #118: [") + name + "] \"m\"");
    }
}

TEST_F(CErrorExcTextTest, ASeverityOutsideTheListHasNoName) {
    for (int const value : {0, 7, -1, 1000}) {
        auto const severity = static_cast<Error::ESeverity>(value);
        expectText([severity] { return Error::CInfo(sampleOrigin(), severity, messageOf("m")); },
                   plain, "/build/A #118: [] \"m\"");
    }
}

XSample withParameters() {
    return sample(messageOf("@(a), @(z)"), TestSupport::parameterList("a", "1") +
                                               Error::buildNamedParameter("c", 3) +
                                               Error::buildNamedParameter("b", 2));
}

TEST_F(CErrorExcTextTest, APlainRenderingFillsThePlaceholdersAndLeavesTheRestOut) {
    expectText(withParameters, plain, "/build/A #118: [SevError] \"1, @(z)\"");
}

TEST_F(CErrorExcTextTest, ADetailedRenderingListsTheParametersThatAreLeftOver) {
    expectText(withParameters, detailed,
               "'Sample': /build/A #118, 'int f(int)()', (Apr 29 2021, 08:35:23): [SevError] "
               "\"1, @(z) (b: \"2\", c: \"3\")\" ");
}

TEST_F(CErrorExcTextTest, ADetailedRenderingAfterAPlainOneListsEveryParameter) {
    XSample const exc = withParameters();
    EXPECT_EQ(textOf<char>(exc, plain), "/build/A #118: [SevError] \"1, @(z)\"");
    EXPECT_EQ(textOf<char>(exc, detailed),
              "'Sample': /build/A #118, 'int f(int)()', (Apr 29 2021, 08:35:23): [SevError] "
              "\"1, @(z) (a: \"1\", b: \"2\", c: \"3\")\" ");
    EXPECT_EQ(textOf<char>(exc, plain),
              "/build/A #118: [SevError] \"1, @(z) (a: \"1\", b: \"2\", c: \"3\")\"");
}

TEST_F(CErrorExcTextTest, ARenderingRunsTwoExpansions) {
    auto const make = [] {
        return sample(messageOf("@@(a) @@@@(a)"), TestSupport::parameterList("a", "1"));
    };
    // The first makes "@(a) @@(a)" of it, and the second fills in what that is.
    expectText(make, plain, "/build/A #118: [SevError] \"1 @(a)\"");
    expectText(make, detailed,
               "'Sample': /build/A #118, 'int f(int)()', (Apr 29 2021, 08:35:23): [SevError] "
               "\"1 @(a) (a: \"1\")\" ");
}

TEST_F(CErrorExcTextTest, AWrapperShowsTheInnerTextInQuotes) {
    auto const make = [] {
        return sample(TestSupport::XOtherSample("/build/I", 1, "h()", "", "", Error::msgEndOf,
                                                Error::buildNamedParameter("types", "files")));
    };
    expectText(make, plain, "/build/A #118: [SevError] \"\"End of files\"\"");
    expectText(make, detailed,
               std::string("'Sample': /build/A #118, 'int f(int)()', (Apr 29 2021, 08:35:23): "
                           "[SevError] \"\"End of files\" (__type__: \"") +
                   typeid(TestSupport::XOtherSample).name() + "\")\" ");
}

// What a rendering does to the stream, and what it takes from it.

template <class TChar>
void expectRightAdjustmentToStay() {
    std::basic_ostringstream<TChar> stream;
    stream << std::left;
    sampleOrigin(7).writeTo(stream, plain);
    EXPECT_EQ(stream.flags() & std::ios_base::adjustfield, std::ios_base::right);
    stream.str({});
    stream << std::setw(3) << 5;
    TChar const expected[] = {' ', ' ', '5', 0};
    EXPECT_EQ(stream.str(), expected);
}

TEST_F(CErrorExcTextTest, TheRightAdjustmentOfTheLineStaysOnTheStream) {
    expectRightAdjustmentToStay<char>();
    expectRightAdjustmentToStay<wchar_t>();
}

TEST_F(CErrorExcTextTest, TheLineIsPaddedOnItsLeftWhateverTheStreamDidBefore) {
    std::ostringstream stream;
    stream << std::left;
    sampleAt(7, messageOf("m")).writeTo(stream, plain);
    EXPECT_EQ(stream.str(), "/build/A #  7: [SevError] \"m\"");
}

TEST_F(CErrorExcTextTest, TheFillIsTheStreamsAndStays) {
    std::ostringstream narrow;
    narrow << std::setfill('0');
    sampleOrigin(7).writeTo(narrow, plain);
    EXPECT_EQ(narrow.str(), "/build/A #007");
    EXPECT_EQ(narrow.fill(), '0');

    std::wostringstream wide;
    wide << std::setfill(L'*');
    sampleOrigin(7).writeTo(wide, plain);
    EXPECT_EQ(wide.str(), L"/build/A #**7");
    EXPECT_EQ(wide.fill(), L'*');
}

TEST_F(CErrorExcTextTest, NoWidthIsLeftBehind) {
    std::ostringstream stream;
    withText().writeTo(stream, detailed);
    EXPECT_EQ(stream.width(), 0);
}

// Texts that are not ASCII: UTF-8 in the narrow pieces, decoded on a wide stream.

TEST_F(CErrorExcTextTest, TextsThatAreNotAsciiKeepTheirCharacters) {
    auto const make = [] {
        XSample exc("/caf\xC3\xA9", 1, "f\xE2\x82\xAC()", "d\xC3\xA4te", "t\xC3\xAEme",
                    messageOf("na\xC3\xAFve @(v)"),
                    TestSupport::parameterList("v", "\xF0\x9F\x98\x80"));
        exc.getStackInfo().add(
            Error::CStackInfo("/b\xC3\xB6", 1, 2, "g\xC3\xB8()", "\xC3\xA6", "\xC3\xBE"));
        return exc;
    };
    EXPECT_EQ(textOf<char>(make(), detailed),
              "'Sample': /caf\xC3\xA9 #  1, 'f\xE2\x82\xAC()()', (d\xC3\xA4te, t\xC3\xAEme): "
              "[SevError] \"na\xC3\xAFve \xF0\x9F\x98\x80\" "
              "/b\xC3\xB6 [#1...#2], 'g\xC3\xB8()()', (\xC3\xA6, \xC3\xBE) ");
    EXPECT_EQ(textOf<wchar_t>(make(), detailed),
              L"'Sample': /caf\u00E9 #  1, 'f\u20AC()()', (d\u00E4te, t\u00EEme): "
              L"[SevError] \"na\u00EFve \U0001F600\" "
              L"/b\u00F6 [#1...#2], 'g\u00F8()()', (\u00E6, \u00FE) ");
}

// The ways from an exception to text.

TEST_F(CErrorExcTextTest, AWideStreamTakesAnExceptionInThePlainForm) {
    std::wostringstream stream;
    stream << withParameters();
    EXPECT_EQ(stream.str(), L"/build/A #118: [SevError] \"1, @(z)\"");
}

TEST_F(CErrorExcTextTest, ACastGivesThePlainForm) {
    XSample const exc = withParameters();
    Error::CException const& root = exc;
    EXPECT_EQ(StdUtil::stream_cast<Strings::string>(root),
              L"/build/A #118: [SevError] \"1, @(z)\"");
}

TEST_F(CErrorExcTextTest, AnExceptionMayBeAParameter) {
    XSample const inner = withText();
    XSample const outer =
        sample(Error::msgInternalError, Error::buildNamedParameter("error", inner));
    EXPECT_EQ(textOf<char>(outer, plain),
              "/build/A #118: [SevError] \"Internal error: /build/A #118: [SevError] "
              "\"text of the message\"\"");
}

TEST_F(CErrorExcTextTest, AMessageMadeOfAnExceptionIsItsPlainFormForGood) {
    XSample const exc = withParameters();
    Error::CMessage message(exc);
    Strings::string const expected = L"/build/A #118: [SevError] \"1, @(z)\"";
    EXPECT_EQ(message.getString(false), expected);
    EXPECT_EQ(message.begin(), message.end());
    message.add("a", "9");
    EXPECT_EQ(message.getString(true), expected);
    exc.getInfo().getMessage().insertParameters(true);
    EXPECT_EQ(message.getString(true), expected);
}

} // namespace
