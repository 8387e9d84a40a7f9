// What failed conversions and checks of the text modules raise.

#include "1Base/Encoding/Encoding.h"
#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Error/Error.h"

#include "support/LogRecorder.h"
#include "support/Registry.h"
#include "support/TextFailures.h"

#include <CoreFoundation/CoreFoundation.h>

#include <gtest/gtest.h>

#include <sstream>
#include <string>

// The first string that the platform has made since this was null: a conversion that fails while
// reading leaves it behind.
static CFStringRef firstMade = nullptr;

extern "C" {
CFStringRef __real_CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes,
                                           CFIndex count, CFStringEncoding encoding,
                                           Boolean isExternalRepresentation);
CFStringRef __wrap_CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes,
                                           CFIndex count, CFStringEncoding encoding,
                                           Boolean isExternalRepresentation);

CFStringRef __wrap_CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes,
                                           CFIndex count, CFStringEncoding encoding,
                                           Boolean isExternalRepresentation) {
    CFStringRef const made =
        __real_CFStringCreateWithBytes(allocator, bytes, count, encoding, isExternalRepresentation);
    if (firstMade == nullptr)
        firstMade = made;
    return made;
}
}

namespace {

using TestSupport::CConversionFailure;
using TestSupport::conversionFailureOf;
using TestSupport::failedCheckOf;
using TestSupport::parametersOf;
using TestSupport::TParameters;

using CEncodingFailuresTest = TestSupport::CErrorTest;

bool endsWith(std::string const& text, std::string const& end) {
    return text.size() >= end.size() &&
           text.compare(text.size() - end.size(), end.size(), end) == 0;
}

// Raises what a narrow text of nothing but a byte order mark ends in: it is measured as empty. The
// string that stays unreleased is taken away.
void convertMarkAlone() {
    firstMade = nullptr;
    try {
        Encoding::convert<Strings::string>("\xEF\xBB\xBF");
    } catch (...) {
        CFRelease(firstMade);
        throw;
    }
}

void expectEncoding(Error::CException const& exc, TParameters const& parameters) {
    EXPECT_STREQ(exc.getExcName(), "Encoding");
    Error::CInfo const& info = exc.getInfo();
    EXPECT_EQ(info.getSeverity(), Error::SevError);
    EXPECT_EQ(info.getMessage().getString(false), L"Error in OS call @(function): @(error)");
    EXPECT_EQ(parametersOf(info.getMessage()), parameters);
    EXPECT_TRUE(endsWith(info.getOrigin().getFile(), "1Base/Encoding/_Imp/EncodingFailures.cpp"));
    EXPECT_GT(info.getOrigin().getLine(), 0U);
    EXPECT_NE(std::string(info.getOrigin().getFunc()).find("throwConversionError"),
              std::string::npos);
    EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
}

TEST_F(CEncodingFailuresTest, ANarrowTextThatIsNoUTF8RaisesWithItsParametersInOrder) {
    try {
        Encoding::convert<Strings::string>(std::string("a\xFFz"));
        FAIL();
    } catch (Encoding::TExcEncoding const& exc) {
        expectEncoding(exc, {{"eenc", L"53"},
                             {"function", L"CFStringCreateWithBytes"},
                             {"error", L"Could not create string with encoding UTF8"}});
    }
}

TEST_F(CEncodingFailuresTest, AnUnreadableTextRaisesWithItsParametersInOrder) {
    try {
        convertMarkAlone();
        FAIL();
    } catch (Encoding::TExcEncoding const& exc) {
        expectEncoding(exc, {{"eenc", L"53"},
                             {"function", L"CFStringGetBytes"},
                             {"error", L"Could not get string with encoding UTF16"}});
    }
}

TEST_F(CEncodingFailuresTest, WhatIsRaisedNamesTheTextsThatWereGiven) {
    std::string const error = "caf\xC3\xA9";
    auto const eenc = static_cast<Encoding::ESysEncoding>(4000000000U);
    try {
        Encoding::Detail::throwConversionError("f", error, eenc);
    } catch (Encoding::TExcEncoding const& exc) {
        expectEncoding(exc, {{"eenc", L"4000000000"}, {"function", L"f"}, {"error", L"caf\u00E9"}});
    }
}

// One expansion that lists what is left over gives the whole sentence.
constexpr char sentence[] = "Error in OS call CFStringGetBytes: Could not get string with encoding "
                            "UTF16 (eenc: \"53\")";

TEST_F(CEncodingFailuresTest, TheTextWithLeftoversNamesTheEncoding) {
    try {
        convertMarkAlone();
        FAIL();
    } catch (Error::CException const& exc) {
        Error::CMessage const& message = exc.getInfo().getMessage();
        message.insertParameters(true);
        EXPECT_EQ(message.getString<std::string>(false), sentence);
    }
}

TEST_F(CEncodingFailuresTest, ADetailedRenderingHasTheTextWithLeftovers) {
    try {
        convertMarkAlone();
        FAIL();
    } catch (Error::CException const& exc) {
        std::ostringstream stream;
        exc.writeTo(stream, true);
        EXPECT_TRUE(endsWith(stream.str(), std::string(": [SevError] \"") + sentence + "\" "))
            << stream.str();
        EXPECT_EQ(stream.str().find("'Encoding': "), 0U);
    }
}

TEST_F(CEncodingFailuresTest, ALoggedFailureHasTheTextWithLeftovers) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    try {
        convertMarkAlone();
        FAIL();
    } catch (Error::CException const& exc) {
        Error::log<Error::TLoggerError, Error::TTgtLogger>(exc);
    }
    ASSERT_EQ(recorder.records().size(), 1U);
    std::string const expected = sentence;
    EXPECT_EQ(recorder.records()[0].expanded, Strings::string(expected.begin(), expected.end()));
}

TEST_F(CEncodingFailuresTest, AFailurePassesTheTextModulesWithoutATrace) {
    Strings::CParameterList<wchar_t> list;
    try {
        list.add("name", static_cast<char const*>("\xFF"));
        FAIL();
    } catch (Encoding::TExcEncoding const& exc) {
        EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
    }
    EXPECT_EQ(list.size(), 0U);
}

TEST_F(CEncodingFailuresTest, TheValuesOfAFailureCanBeComparedAsPlainTexts) {
    CConversionFailure const expected = {"CFStringCreateWithBytes",
                                         "Could not create string with encoding UTF32", 55};
    wchar_t const noText[] = {L'a', 0x110000, 0};
    EXPECT_EQ(conversionFailureOf([&] { Encoding::convert<std::string>(noText); }), expected);
    EXPECT_EQ(conversionFailureOf([] { Encoding::convert<std::string>(L"a"); }),
              (CConversionFailure{"", "", 0}));
}

// Checks.

TEST_F(CEncodingFailuresTest, AWrongContinuationByteFailsACheck) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevFatal> const installed(recorder);
    try {
        // A lead byte for three, then a letter.
        Encoding::convertUTF8ToUTF32("\xE2x");
        FAIL();
    } catch (Error::TExcErrorAssert const& exc) {
        EXPECT_STREQ(exc.getExcName(), "ErrorAssert");
        EXPECT_EQ(TestSupport::parameterOf(exc.getInfo().getMessage(), "expr"),
                  L"0x80 == (0xc0 & cutf8)");
        EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
    }
    ASSERT_EQ(recorder.records().size(), 1U);
    EXPECT_EQ(recorder.records()[0].tag, "ErrorAssert");
    EXPECT_EQ(failedCheckOf([] { Encoding::convertUTF8ToUTF32("\xE2x"); }),
              "0x80 == (0xc0 & cutf8)");
    EXPECT_EQ(failedCheckOf([] { Encoding::convertUTF8ToUTF32("x"); }), "");
}

TEST_F(CEncodingFailuresTest, AConversionOfItselfFailsACheck) {
    try {
        Encoding::Detail::reportRecursion();
    } catch (Error::TExcErrorAssert const& exc) {
        TParameters const parameters = parametersOf(exc.getInfo().getMessage());
        ASSERT_EQ(parameters.size(), 7U);
        EXPECT_EQ(parameters[0], (TParameters::value_type{"expr", L"false"}));
        EXPECT_EQ(parameters[6].second,
                  L"Infinite recursion in 'Encoding::CConverter<T,T>::convert()'!");
    }
}

TEST_F(CEncodingFailuresTest, APairWithoutAConversionFailsThatCheck) {
    EXPECT_EQ(failedCheckOf([] { Encoding::CConverter<std::string, int>::convert(7); }), "false");
}

} // namespace
