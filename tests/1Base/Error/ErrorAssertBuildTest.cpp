// Assertions do the same in every build. Built into two programs, one without optimisation and one
// with it and NDEBUG; ASSERT_BUILD is the test's name in each.

#include "1Base/Error/ErrorMacros.h"

#include "support/LogRecorder.h"
#include "support/MessageParameters.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <string>

namespace {

// What an assertion returns or raises, without its place.
template <class TAssertion>
std::wstring outcomeOf(TAssertion const& assertion) {
    try {
        return L"returned " + std::to_wstring(assertion());
    } catch (Error::TExcErrorAssert const& exc) {
        Error::CMessage const& message = exc.getInfo().getMessage();
        return L"raised at " + std::to_wstring(exc.getInfo().getSeverity()) + L": " +
               TestSupport::parameterOf(message, "expr") + L" [" +
               TestSupport::parameterOf(message, "count") + L"]";
    }
}

using ASSERT_BUILD = TestSupport::CErrorTest;

TEST_F(ASSERT_BUILD, EveryFormReportsAndRaises) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevFatal> const installed(recorder);
    int const count = 3;
    int const* const s = &count;
    EXPECT_EQ(outcomeOf([&] { return ERROR_ASSERT(count == 3); }), L"returned 1");
    EXPECT_EQ(outcomeOf([&] { return *ERROR_ASSERT(s); }), L"returned 3");
    EXPECT_TRUE(recorder.records().empty());
    EXPECT_EQ(outcomeOf([&] { return ERROR_ASSERT(count == 4); }), L"raised at 5: count == 4 []");
    EXPECT_EQ(outcomeOf([&] { return ERROR_ASSERT(s == NULL); }), L"raised at 5: s == __null []");
    EXPECT_EQ(outcomeOf([&] { return ERROR_ASSERT_P(ERROR_PARAM(count), count < 3); }),
              L"raised at 5: count < 3 [3]");
    EXPECT_EQ(outcomeOf([&] { return ERROR_ASSERT_TEXT(count > 3, "too few"); }),
              L"raised at 5: too few []");
    ASSERT_EQ(recorder.records().size(), 4U);
    EXPECT_EQ(recorder.records()[0].severity, "SevFatal");
}

} // namespace
