// Each step of a conversion that the platform may refuse, refused.

#include "1Base/Encoding/Encoding.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <functional>
#include <string>
#include <vector>

namespace {

using Encoding::CConverter;
using Strings::stringUTF16;
using TBytes = std::basic_string<unsigned char>;
using TestSupport::CConversionFailure;
using TestSupport::conversionFailureOf;
using TestSupport::CPlatformCalls;

class CEncodingConverterFailuresTest : public TestSupport::CObjectCountTest {
  protected:
    /// Runs `conversion` with the nth call of `function` refused, and returns what it raises.
    CConversionFailure failureOf(std::function<void()> const& conversion,
                                 std::string const& function, int nth) {
        CPlatformCalls calls;
        calls.fail(function, nth);
        CConversionFailure const failure = conversionFailureOf(conversion);
        calls_ = calls.all();
        return failure;
    }

    /// Shows that the platform string of the conversion that failed has its one owner still, and
    /// takes it away, so that the sanitizers see no leak.
    void releaseWhatWasLeft() {
        std::vector<CFTypeRef> alive;
        for (TestSupport::CPlatformCall const& call : calls_) {
            if (call.function == "CFStringCreateWithBytes")
                alive.push_back(call.object);
            if (call.function == "CFRelease")
                alive.pop_back();
        }
        ASSERT_EQ(alive.size(), 1U);
        EXPECT_EQ(TestSupport::liveObjects(), liveAtStart_ + 1);
        EXPECT_EQ(CFGetRetainCount(alive[0]), 1);
        CFRelease(alive[0]);
    }

    long const liveAtStart_ = TestSupport::liveObjects();
    std::vector<TestSupport::CPlatformCall> calls_;
};

// A conversion in one step, with the texts and the number that its failures carry.
struct CStep {
    char const* name;
    std::function<void()> conversion;
    std::string source;
    std::string target;
    unsigned int eenc;
};

// Texts of 9000 characters, which take more than one pass into every kind.
std::vector<CStep> steps() {
    static std::u32string const text(9000, U'a');
    static std::string const narrow = TestSupport::utf8Of(text);
    static stringUTF16 const units = TestSupport::utf16Of(text);
    static Strings::string const wide = TestSupport::wideOf(text);
    static TBytes const bytes = TestSupport::bytesOf(narrow);
    using TReader = CConverter<stringUTF16, TBytes>;
    using TWriter = CConverter<TBytes, stringUTF16>;
    return {
        {"UTF8 in", [] { Encoding::convert<stringUTF16>(narrow); }, "UTF8", "UTF16", 53},
        {"UTF8 out", [] { Encoding::convert<std::string>(units); }, "UTF16", "UTF8", 53},
        {"UTF32 in", [] { Encoding::convert<stringUTF16>(wide); }, "UTF32", "UTF16", 55},
        {"UTF32 out", [] { Encoding::convert<Strings::string>(units); }, "UTF16", "UTF32", 55},
        {"bytes in", [] { TReader::convert(bytes, Encoding::eseUTF8); }, "UTF8", "UTF16", 53},
        {"bytes out", [] { TWriter::convert(units, Encoding::eseUTF8); }, "UTF16", "UTF8", 53},
        {"UTF16 bytes in", [] { TReader::convert(bytes, Encoding::eseUTF16); }, "UTF16", "UTF16",
         54},
        {"unnamed in", [] { TReader::convert(bytes, static_cast<Encoding::ESysEncoding>(10)); },
         "MacRSymbol", "UTF16", 10},
        {"unknown in", [] { TReader::convert(bytes, static_cast<Encoding::ESysEncoding>(99)); },
         "unknown encoding", "UTF16", 99},
        {"unknown out", [] { TWriter::convert(units, static_cast<Encoding::ESysEncoding>(99)); },
         "UTF16", "unknown encoding", 99},
    };
}

TEST_F(CEncodingConverterFailuresTest, APlatformStringThatCanNotBeMadeIsReported) {
    for (CStep const& step : steps()) {
        CConversionFailure const expected = {"CFStringCreateWithBytes",
                                             "Could not create string with encoding " + step.source,
                                             step.eenc};
        EXPECT_EQ(failureOf(step.conversion, "CFStringCreateWithBytes", 1), expected) << step.name;
        EXPECT_EQ(calls_.size(), 1U) << step.name;
        EXPECT_EQ(TestSupport::liveObjects(), liveAtStart_) << step.name;
    }
}

TEST_F(CEncodingConverterFailuresTest, AMeasureOfNothingIsReportedAndLeavesTheString) {
    for (CStep const& step : steps()) {
        CConversionFailure const expected = {
            "CFStringGetBytes", "Could not get string with encoding " + step.target, step.eenc};
        EXPECT_EQ(failureOf(step.conversion, "CFStringGetBytes", 1), expected) << step.name;
        EXPECT_EQ(calls_.back().buffer, nullptr) << step.name;
        releaseWhatWasLeft();
    }
}

TEST_F(CEncodingConverterFailuresTest, AnyPassThatReadsNothingIsReportedAndLeavesTheString) {
    for (CStep const& step : steps()) {
        for (int const pass : {1, 2}) {
            CConversionFailure const expected = {
                "CFStringGetBytes", "Could not get string with encoding " + step.target, step.eenc};
            EXPECT_EQ(failureOf(step.conversion, "CFStringGetBytes", 1 + pass), expected)
                << step.name << ", pass " << pass;
            EXPECT_NE(calls_.back().buffer, nullptr) << step.name;
            releaseWhatWasLeft();
        }
    }
}

TEST_F(CEncodingConverterFailuresTest, BytesWithoutANamedEncodingAreLatin1) {
    TBytes const bytes = TestSupport::bytesOf("a");
    stringUTF16 const units = TestSupport::utf16Of(u"a");
    Strings::string const wide = L"a";
    CConversionFailure const unreadable = {"CFStringCreateWithBytes",
                                           "Could not create string with encoding ISO8859_1", 52};
    CConversionFailure const unwritable = {"CFStringGetBytes",
                                           "Could not get string with encoding ISO8859_1", 52};
    EXPECT_EQ(failureOf([&] { CConverter<stringUTF16, TBytes>::convert(bytes); },
                        "CFStringCreateWithBytes", 1),
              unreadable);
    EXPECT_EQ(calls_.back().encoding, 513U);
    EXPECT_EQ(
        failureOf([&] { Encoding::convert<stringUTF16>(bytes); }, "CFStringCreateWithBytes", 1),
        unreadable);
    EXPECT_EQ(
        failureOf([&] { CConverter<TBytes, stringUTF16>::convert(units); }, "CFStringGetBytes", 1),
        unwritable);
    EXPECT_EQ(calls_.back().encoding, 513U);
    releaseWhatWasLeft();
    // Through UTF-16 first, which takes two calls.
    EXPECT_EQ(failureOf([&] { Encoding::convert<TBytes>(wide); }, "CFStringGetBytes", 3),
              unwritable);
    EXPECT_EQ(calls_.back().encoding, 513U);
    releaseWhatWasLeft();
}

TEST_F(CEncodingConverterFailuresTest, TheSecondStepOfNarrowAndWideTextMayFailToo) {
    Strings::string const wide = L"abc";
    std::string const narrow = "abc";
    CConversionFailure const unmade = {"CFStringCreateWithBytes",
                                       "Could not create string with encoding UTF16", 53};
    EXPECT_EQ(
        failureOf([&] { Encoding::convert<std::string>(wide); }, "CFStringCreateWithBytes", 2),
        unmade);
    CConversionFailure const unread = {"CFStringGetBytes",
                                       "Could not get string with encoding UTF32", 55};
    EXPECT_EQ(failureOf([&] { Encoding::convert<Strings::string>(narrow); }, "CFStringGetBytes", 3),
              unread);
    releaseWhatWasLeft();
}

TEST_F(CEncodingConverterFailuresTest, ReadingNothingComesBeforeHavingNothingToRead) {
    // The platform drops the mark, and then measures zero characters: an error, not an empty text.
    CConversionFailure const expected = {"CFStringGetBytes",
                                         "Could not get string with encoding UTF16", 53};
    auto const conversion = [] { Encoding::convert<Strings::string>("\xEF\xBB\xBF"); };
    EXPECT_EQ(failureOf(conversion, "", 0), expected);
    std::vector<std::string> const names = {"CFStringCreateWithBytes", "CFStringGetLength",
                                            "CFStringGetBytes"};
    std::vector<std::string> actual;
    for (TestSupport::CPlatformCall const& call : calls_)
        actual.push_back(call.function);
    EXPECT_EQ(actual, names);
    releaseWhatWasLeft();
}

TEST_F(CEncodingConverterFailuresTest, AnUnpairedSurrogateStopsTheReadingOfUTF8) {
    CConversionFailure const expected = {"CFStringGetBytes",
                                         "Could not get string with encoding UTF8", 53};
    // At the start the measure fails, later a pass does.
    for (std::size_t const before : {0U, 1U, 9000U}) {
        stringUTF16 const units =
            TestSupport::utf16Of(std::u16string(before, u'a') + u"\xD800" + u"z");
        EXPECT_EQ(failureOf([&units] { Encoding::convert<std::string>(units); }, "", 0), expected);
        releaseWhatWasLeft();
    }
}

TEST_F(CEncodingConverterFailuresTest, WhatWasReadBeforeIsGone) {
    std::string const narrow(9000, 'a');
    Strings::string wide = L"untouched";
    failureOf([&] { wide = Encoding::convert<Strings::string>(narrow); }, "CFStringGetBytes", 3);
    EXPECT_EQ(wide, L"untouched");
    releaseWhatWasLeft();
}

} // namespace
