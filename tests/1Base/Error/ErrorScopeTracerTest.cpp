#include "1Base/Error/Error.h"

#include "support/LogRecorder.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <type_traits>
#include <vector>

namespace {

using CErrorScopeTracerTest = TestSupport::CErrorTest;
using CTracer = Error::CScopeTracer<Error::TLoggerError, Error::TTgtLogger, Error::TSevLog>;
using CFilteredTracer =
    Error::CScopeTracer<Error::TLoggerError, Error::TTgtLogger, Error::TSevDebug>;
using CInstalled = TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevLog>;
using TTexts = std::vector<Strings::string>;

static_assert(!std::is_copy_constructible_v<CTracer>);
static_assert(!std::is_copy_assignable_v<CTracer>);

// The catalogue has texts of this kind too, with other quotes; a tracer's are its own.
struct CTexts : Error::Detail::CScopeTracerBase {
    static std::string enter() { return enterMsg_; }
    static std::string leave() { return leaveMsg_; }
};

TEST_F(CErrorScopeTracerTest, TheTextsNameTheScope) {
    EXPECT_EQ(CTexts::enter(), "Entering scope '@(scope)'...");
    EXPECT_EQ(CTexts::leave(), "Leaving scope '@(scope)'...");
}

TTexts textsOf(TestSupport::CLogRecorder const& recorder) {
    TTexts texts;
    for (TestSupport::CLogRecord const& record : recorder.records())
        texts.push_back(record.expanded);
    return texts;
}

TEST_F(CErrorScopeTracerTest, LogsOnEnteringAndOnLeaving) {
    TestSupport::CLogRecorder const recorder;
    CInstalled const installed(recorder);
    {
        CTracer const outer("/build/A", 7, "f()", "Apr 29 2021", "08:35:23", "outer");
        CTracer const inner("/build/A", 8, "f()", "Apr 29 2021", "08:35:23", "inner");
        EXPECT_EQ(recorder.records().size(), 2U);
    }
    EXPECT_EQ(textsOf(recorder),
              (TTexts{L"Entering scope 'outer'...", L"Entering scope 'inner'...",
                      L"Leaving scope 'inner'...", L"Leaving scope 'outer'..."}));
    for (TestSupport::CLogRecord const& record : recorder.records()) {
        EXPECT_EQ(record.tag, "Error");
        EXPECT_EQ(record.severity, "SevLog");
    }
    TestSupport::TPlace const outer("/build/A", 7, "f()", "Apr 29 2021", "08:35:23");
    EXPECT_EQ(recorder.records()[0].place, outer);
    EXPECT_EQ(recorder.records()[3].place, outer);
}

TEST_F(CErrorScopeTracerTest, LogsOnLeavingByAnException) {
    TestSupport::CLogRecorder const recorder;
    CInstalled const installed(recorder);
    try {
        CTracer const tracer(ERROR_ORIGIN, "scope");
        throw 7;
    } catch (int) {
    }
    EXPECT_EQ(textsOf(recorder),
              (TTexts{L"Entering scope 'scope'...", L"Leaving scope 'scope'..."}));
}

TEST_F(CErrorScopeTracerTest, IsSilentWhereItsPairIsFiltered) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevDebug> const installed(recorder);
    { CFilteredTracer const tracer(ERROR_ORIGIN, "scope"); }
    EXPECT_TRUE(recorder.records().empty());
}

// Fails from its second record on.
class CFailingTarget : public TestSupport::CLogRecorder {
  public:
    void write(char const* file, unsigned int line, char const* func, char const* date,
               char const* time, char const* tag, char const* target, char const* severity,
               Error::CMessage const& message) const override {
        CLogRecorder::write(file, line, func, date, time, tag, target, severity, message);
        if (records().size() > 1)
            throw std::runtime_error("target");
    }
};

TEST_F(CErrorScopeTracerTest, ARecordThatFailsOnLeavingIsDropped) {
    CFailingTarget const target;
    CInstalled const installed(target);
    { CTracer const tracer(ERROR_ORIGIN, "scope"); }
    EXPECT_EQ(target.records().size(), 2U);
    EXPECT_THROW(CTracer(ERROR_ORIGIN, "scope"), std::runtime_error);
}

} // namespace
