// Logging an exception that was caught.

#include "1Base/Error/Error.h"

#include "support/LogRecorder.h"
#include "support/Registry.h"
#include "support/SampleException.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using TestSupport::CLogRecord;
using TestSupport::messageOf;
using TestSupport::parameterOf;
using TestSupport::sample;
using TestSupport::TParameters;
using TestSupport::XSample;

class CErrorExcLogTest : public TestSupport::CErrorTest {
  protected:
    template <class TLogger = Error::TLoggerError>
    CLogRecord logged(Error::CException const& exc) {
        recorder_.clear();
        Error::log<TLogger, Error::TTgtLogger>(exc);
        EXPECT_EQ(recorder_.records().size(), 1U);
        return recorder_.records().empty() ? CLogRecord() : recorder_.records()[0];
    }

  private:
    TestSupport::CLogRecorder recorder_;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed_{recorder_};
};

TEST_F(CErrorExcLogTest, TheRecordHasTheExceptionsOrigin) {
    CLogRecord const record = logged(sample(Error::msgDuplicate));
    EXPECT_EQ(record.place, TestSupport::placeOf(TestSupport::sampleOrigin()));
    EXPECT_EQ(record.tag, "Error");
    EXPECT_EQ(record.target, "TgtLogger");
    EXPECT_EQ(record.severity, "SevError");
    EXPECT_EQ(record.text, L"@(__msg__)");
    EXPECT_EQ(record.parameters, (TParameters{{"__msg__", L"Duplicate object exists"}}));
}

TEST_F(CErrorExcLogTest, TheRecordHasTheTagOfTheLoggerThatWasCalled) {
    EXPECT_EQ(logged<Error::TLoggerErrorAssert>(sample(Error::msgDuplicate)).tag, "ErrorAssert");
}

TEST_F(CErrorExcLogTest, TheTextListsTheParametersThatAreLeftOver) {
    CLogRecord const record =
        logged(sample(Error::msgEndOf, Error::buildNamedParameter("types", "files") +
                                           Error::buildNamedParameter("n", 2)));
    EXPECT_EQ(record.parameters, (TParameters{{"__msg__", L"End of files (n: \"2\")"}}));
    EXPECT_EQ(record.expanded, L"End of files (n: \"2\")");
}

TEST_F(CErrorExcLogTest, TheTextIsExpandedOnce) {
    XSample const exc = sample(messageOf("@@(a)"), TestSupport::parameterList("a", "1"));
    EXPECT_EQ(logged(exc).parameters, (TParameters{{"__msg__", L"@(a) (a: \"1\")"}}));
}

TEST_F(CErrorExcLogTest, TheExceptionKeepsItsText) {
    XSample const exc = sample(Error::msgEndOf, Error::buildNamedParameter("types", "files"));
    logged(exc);
    EXPECT_EQ(exc.getInfo().getMessage().getString(false), L"End of @(types)");
    EXPECT_EQ(logged(exc).expanded, L"End of files");
}

TEST_F(CErrorExcLogTest, WhateverItsSeverityAnExceptionIsLoggedAsAnError) {
    for (Error::ESeverity const severity : {Error::SevDebug, Error::SevWarn, Error::SevFatal}) {
        TestSupport::XSampleOfSeverity const exc(severity, messageOf("m"));
        EXPECT_EQ(logged(exc).severity, "SevError");
    }
}

TEST_F(CErrorExcLogTest, TextsThatAreNotAsciiKeepTheirCharacters) {
    XSample const exc =
        sample(messageOf("na\xC3\xAFve @(v)"), TestSupport::parameterList("v", "\xF0\x9F\x98\x80"));
    EXPECT_EQ(logged(exc).expanded, L"na\u00EFve \U0001F600");
}

TEST_F(CErrorExcLogTest, AFilteredPairIsNotLogged) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtDebugger, Error::TSevError> const installed(recorder);
    Error::log<Error::TLoggerError, Error::TTgtDebugger>(sample(Error::msgDuplicate));
    EXPECT_TRUE(recorder.records().empty());
}

} // namespace
