// What an assertion does, in each of its forms.

#include "1Base/Error/Error.h"

#include "support/LogRecorder.h"
#include "support/MessageParameters.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <ostream>
#include <set>
#include <sstream>
#include <stdexcept>
#include <string>
#include <vector>

// What the debugger's hook does, where a test wants to see it called.
static void (*onInvokeDebugger)() = nullptr;

// Error::invokeDebugger, called from its own library.
extern "C" {
void __real__ZN5Error14invokeDebuggerEv();
void __wrap__ZN5Error14invokeDebuggerEv();

void __wrap__ZN5Error14invokeDebuggerEv() {
    if (onInvokeDebugger != nullptr)
        onInvokeDebugger();
    __real__ZN5Error14invokeDebuggerEv();
}
}

namespace {

using Error::Detail::CAssertDummy;
using Error::Detail::CAsserter_;
using TestSupport::CLogRecord;
using TestSupport::CLogRecorder;
using TestSupport::parametersOf;
using TestSupport::placeOf;
using TestSupport::TParameters;
using TestSupport::TPlace;

using TParameterList = Strings::CParameterList<wchar_t>;

// Asserts at a fixed place.
template <bool doThrow, bool doReport, class TValue, class TParams>
TValue assertAt(TValue value, char const* expr, TParams const& params) {
    return CAsserter_<doThrow, doReport>::do_assert("/build/A", 7, "int f(int)", "Apr 29 2021",
                                                    "08:35:23", value, expr, params);
}

TPlace fixedPlace() {
    return TPlace("/build/A", 7, "int f(int)", "Apr 29 2021", "08:35:23");
}

// The message's own parameters at that place, in its order.
TParameters parametersAt(Strings::string const& expr) {
    return {{"expr", expr},          {"line", L"7"},           {"file", L"/build/A"},
            {"func", L"int f(int)"}, {"date", L"Apr 29 2021"}, {"time", L"08:35:23"}};
}

Strings::string textAt(Strings::string const& expr) {
    return L"Assertion failed in file /build/A, line #7: \"" + expr + L"\"";
}

// Records the reports, and keeps the hook for itself.
class CErrorAssertTest : public TestSupport::CErrorTest {
  protected:
    void SetUp() override {
        CErrorTest::SetUp();
        debuggerCalls = 0;
        onInvokeDebugger = [] { ++debuggerCalls; };
    }
    void TearDown() override {
        onInvokeDebugger = nullptr;
        CErrorTest::TearDown();
    }

    // The one report there must be, at the fixed place.
    void expectReport(Strings::string const& expr, TParameters parameters) {
        ASSERT_EQ(recorder_.records().size(), 1U);
        CLogRecord const& record = recorder_.records()[0];
        EXPECT_EQ(record.place, fixedPlace());
        EXPECT_EQ(record.tag, "ErrorAssert");
        EXPECT_EQ(record.target, "TgtLogger");
        EXPECT_EQ(record.severity, "SevFatal");
        parameters.emplace_back("__msg__", textAt(expr));
        EXPECT_EQ(record.parameters, parameters);
        EXPECT_EQ(record.expanded, textAt(expr));
        recorder_.clear();
    }

    void expectNoReport() const {
        EXPECT_TRUE(recorder_.records().empty());
        EXPECT_EQ(debuggerCalls, 0);
    }

    CLogRecorder recorder_;
    static int debuggerCalls;

  private:
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevFatal> const installed_{recorder_};
};

int CErrorAssertTest::debuggerCalls = 0;

// The forms that a failure's further parameters come in, with what they become.
template <class TVisit>
void eachForm(TVisit const& visit) {
    std::string const value = "value";
    visit(CAssertDummy(), TParameters());
    visit(Error::buildNamedParameter("name", value), TParameters{{"name", L"value"}});
    TParameterList list(Error::buildNamedParameter("name", value));
    list.add("n", 2);
    visit(list, TParameters{{"name", L"value"}, {"n", L"2"}});
    visit(TParameterList(), TParameters());
}

TEST_F(CErrorAssertTest, TheSilentFormOnlyReturnsTheValue) {
    eachForm([this](auto const& params, TParameters const&) {
        EXPECT_FALSE((assertAt<false, false>(false, "x > 0", params)));
        EXPECT_TRUE((assertAt<false, false>(true, "x > 0", params)));
        expectNoReport();
    });
}

TEST_F(CErrorAssertTest, TheReportingFormReportsAndReturnsTheValue) {
    eachForm([this](auto const& params, TParameters const& expected) {
        EXPECT_FALSE((assertAt<false, true>(false, "x > 0", params)));
        expectReport(L"x > 0", expected);
        EXPECT_EQ(debuggerCalls, 0);
    });
}

TEST_F(CErrorAssertTest, ThePassingFormsOnlyReturnTheValue) {
    int const object = 0;
    eachForm([this, &object](auto const& params, TParameters const&) {
        EXPECT_TRUE((assertAt<false, true>(true, "x > 0", params)));
        EXPECT_TRUE((assertAt<true, false>(true, "x > 0", params)));
        EXPECT_TRUE((assertAt<true, true>(true, "x > 0", params)));
        EXPECT_EQ((assertAt<true, true>(&object, "p", params)), &object);
        expectNoReport();
    });
}

// Asserts, and checks the report and the exception.
template <bool doThrow, bool doReport, class TValue, class TParams, class TReport>
void expectRaised(TValue value, TParams const& params, TParameters const& more,
                  TReport const& expectReport) {
    try {
        assertAt<doThrow, doReport>(value, "x > 0", params);
        FAIL() << "nothing was raised";
    } catch (Error::CException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "ErrorAssert");
        EXPECT_NE(dynamic_cast<Error::TExcErrorAssert const*>(&exc), nullptr);
        EXPECT_EQ(placeOf(exc.getInfo().getOrigin()), fixedPlace());
        EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
        EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
        TParameters expected = parametersAt(L"x > 0");
        expected.insert(expected.end(), more.begin(), more.end());
        EXPECT_EQ(parametersOf(exc.getInfo().getMessage()), expected);
        EXPECT_EQ(exc.getInfo().getMessage().getString(false), textAt(L"x > 0"));
    }
    expectReport(L"x > 0", more);
}

TEST_F(CErrorAssertTest, TheThrowingFormsReportAndRaise) {
    auto const report = [this](Strings::string const& expr, TParameters const& parameters) {
        expectReport(expr, parameters);
    };
    int* const null = nullptr;
    eachForm([&](auto const& params, TParameters const& more) {
        debuggerCalls = 0;
        expectRaised<true, false>(false, params, more, report);
        expectRaised<true, true>(false, params, more, report);
        expectRaised<true, true>(null, params, more, report);
        EXPECT_EQ(debuggerCalls, 3);
    });
}

TEST_F(CErrorAssertTest, AFailureIsLoggedThenShownToTheDebuggerThenRaised) {
    static std::vector<std::string> events;
    class CLogEvent : public Error::CLogTarget {
      public:
        void write(char const*, unsigned int, char const*, char const*, char const*, char const*,
                   char const*, char const*, Error::CMessage const&) const override {
            events.push_back("logged");
        }
    };
    class CRaiseEvent : public Error::CExcRegistry::CObserver {
      public:
        void exceptionAdded(Error::CExcImplementation const*, Error::CInfo const&) const override {
            events.push_back("raised");
        }
        void exceptionRemoved(Error::CExcImplementation const*) const override {}
    };
    CLogEvent const target;
    CRaiseEvent const observer;
    TestSupport::CRegisteredObserver const registered(observer);
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevFatal> const installed(target);
    onInvokeDebugger = [] { events.push_back("debugger"); };
    events.clear();
    EXPECT_THROW(ERROR_ASSERT(1 > 2), Error::TExcErrorAssert);
    EXPECT_EQ(events, (std::vector<std::string>{"logged", "debugger", "raised"}));
}

// Neither lock is held while the other one is taken.
TEST_F(CErrorAssertTest, LoggingIsOverWhenTheExceptionIsBuilt) {
    class CLockProbe : public Error::CExcRegistry::CObserver {
      public:
        void exceptionAdded(Error::CExcImplementation const*, Error::CInfo const&) const override {
            wasFree = Error::CLogSingleton::mutex_().try_lock();
            if (wasFree)
                Error::CLogSingleton::mutex_().unlock();
        }
        void exceptionRemoved(Error::CExcImplementation const*) const override {}
        mutable bool wasFree = false;
    };
    CLockProbe const probe;
    TestSupport::CRegisteredObserver const registered(probe);
    EXPECT_THROW(ERROR_ASSERT(1 > 2), Error::TExcErrorAssert);
    EXPECT_TRUE(probe.wasFree);
}

// What passes builds nothing.

class CThrowing {};

std::wostream& operator<<(std::wostream& stream, CThrowing const&) {
    throw std::runtime_error("cast");
    return stream;
}

class CCountingLoader : public Error::CMessage::CMessageLoader {
  public:
    CCountingLoader() : old_(Error::CMessage::setMessageLoader(this)) {}
    ~CCountingLoader() override { Error::CMessage::setMessageLoader(old_); }
    mutable int count = 0;

  private:
    Strings::string doLoadMessage(Error::EMsgID const& id) const override {
        ++count;
        return Error::loadDefaultMessage(id);
    }

    Error::CMessage::CMessageLoader const* old_;
};

TEST_F(CErrorAssertTest, NoMessageAndNoTextIsBuiltWhereNothingIsReported) {
    CCountingLoader const loader;
    auto const param = Error::buildNamedParameter("name", CThrowing());
    assertAt<false, false>(false, "x > 0", param);
    assertAt<false, true>(true, "x > 0", param);
    assertAt<true, false>(true, "x > 0", param);
    assertAt<true, true>(true, "x > 0", param);
    EXPECT_EQ(loader.count, 0);
    assertAt<false, true>(false, "x > 0", CAssertDummy());
    // The assertion's text, and the one of the record.
    EXPECT_EQ(loader.count, 2);
}

TEST_F(CErrorAssertTest, AParameterThatIsNoTextReplacesTheFailure) {
    auto const param = Error::buildNamedParameter("name", CThrowing());
    EXPECT_THROW((assertAt<true, true>(false, "x > 0", param)), std::runtime_error);
    expectNoReport();
}

// Text forms.

TEST_F(CErrorAssertTest, TheLineIsPlainDecimal) {
    try {
        CAsserter_<true, true>::do_assert("/build/A", 12345, "f()", "", "", false, "x",
                                          CAssertDummy());
    } catch (Error::CException const& exc) {
        std::ostringstream stream;
        exc.writeTo(stream, false);
        EXPECT_EQ(stream.str(), "/build/A #12345: [SevError] \"Assertion failed in file /build/A, "
                                "line #12345: \"x\"\"");
    }
}

TEST_F(CErrorAssertTest, ADetailedRenderingListsTheParametersThatTheReportTook) {
    try {
        assertAt<true, true>(false, "x > 0", Error::buildNamedParameter("name", 9));
    } catch (Error::CException const& exc) {
        std::ostringstream stream;
        exc.writeTo(stream, true);
        EXPECT_EQ(stream.str(),
                  "'ErrorAssert': /build/A #  7, 'int f(int)()', (Apr 29 2021, 08:35:23): "
                  "[SevError] \"Assertion failed in file /build/A, line #7: \"x > 0\" "
                  "(date: \"Apr 29 2021\", expr: \"x > 0\", file: \"/build/A\", "
                  "func: \"int f(int)\", line: \"7\", name: \"9\", time: \"08:35:23\")\" ");
    }
}

// The forms that code is written in.

template <class TAssertion>
Strings::string failedTextOf(TAssertion const& assertion) {
    try {
        assertion();
    } catch (Error::TExcErrorAssert const& exc) {
        return TestSupport::parameterOf(exc.getInfo().getMessage(), "expr");
    }
    return L"(passed)";
}

TEST_F(CErrorAssertTest, AnAssertionHandsTheValueBack) {
    int const object = 5;
    EXPECT_EQ(*ERROR_ASSERT(&object), 5);
    EXPECT_TRUE(ERROR_ASSERT(object == 5));
    EXPECT_TRUE(ERROR_ASSERT_P(ERROR_PARAM(object), object > 4));
    EXPECT_EQ(ERROR_ASSERT_TEXT(&object, "there is one"), &object);
    expectNoReport();
}

TEST_F(CErrorAssertTest, AnAssertionHasItsPlace) {
    char const* const func = __PRETTY_FUNCTION__;
    unsigned int line = 0;
    try {
        line = __LINE__ + 1;
        ERROR_ASSERT(1 > 2);
    } catch (Error::CException const& exc) {
        EXPECT_EQ(placeOf(exc.getInfo().getOrigin()),
                  TPlace(__FILE__, line, func, __DATE__, __TIME__));
    }
    ASSERT_EQ(recorder_.records().size(), 1U);
    EXPECT_EQ(recorder_.records()[0].place, TPlace(__FILE__, line, func, __DATE__, __TIME__));
}

TEST_F(CErrorAssertTest, TheTextIsTheExpressionWithItsMacrosExpanded) {
    int const object = 0;
    int const* const s = &object;
    std::set<int> const empty;
    EXPECT_EQ(failedTextOf([&] { ERROR_ASSERT(s == NULL); }), L"s == __null");
    EXPECT_EQ(failedTextOf([&] { ERROR_ASSERT(!s); }), L"!s");
    EXPECT_EQ(failedTextOf([&] {
                  ERROR_ASSERT(empty == std::set<int>{1, 2});
              }),
              L"empty == std::set<int>{1, 2}");
    EXPECT_EQ(failedTextOf([&] { ERROR_ASSERT_P(ERROR_PARAM(object), object != 0); }),
              L"object != 0");
    EXPECT_EQ(failedTextOf([&] { ERROR_ASSERT_TEXT(object != 0, "there is one"); }),
              L"there is one");
}

TEST_F(CErrorAssertTest, AnAssertionTakesAParameterOrSeveral) {
    int const n = 3;
    std::string const key = "k";
    try {
        ERROR_ASSERT_P(ERROR_PARAMS(ERROR_PARAM(n), ERROR_PARAM(key)), n > 3);
    } catch (Error::CException const& exc) {
        TParameters const parameters = parametersOf(exc.getInfo().getMessage());
        ASSERT_EQ(parameters.size(), 8U);
        EXPECT_EQ(parameters[6], (TParameters::value_type{"n", L"3"}));
        EXPECT_EQ(parameters[7], (TParameters::value_type{"key", L"k"}));
    }
    ASSERT_EQ(recorder_.records().size(), 1U);
}

TEST_F(CErrorAssertTest, AFailurePassesGuardedBlocksLikeAnyException) {
    try {
        ERROR_BLOCK_BEGIN
        ERROR_ASSERT(1 > 2);
        ERROR_BLOCK_END
    } catch (Error::TExcErrorAssert const& exc) {
        EXPECT_EQ(exc.getStackInfo().end() - exc.getStackInfo().begin(), 1);
    }
    EXPECT_EQ(recorder_.records().size(), 1U);
}

// The self-test.

TEST_F(CErrorAssertTest, TheSelfTestEndsWithTheFirstFormThatRaises) {
    try {
        Error::Test::testAssertions();
        FAIL() << "nothing was raised";
    } catch (Error::TExcErrorAssert const& exc) {
        TParameters const parameters = parametersOf(exc.getInfo().getMessage());
        ASSERT_EQ(parameters.size(), 6U);
        EXPECT_EQ(parameters[0], (TParameters::value_type{"expr", L"false"}));
    }
    // The reporting form in its three forms of parameters, then the first throwing one.
    TParameters const named = {{"name", L"value"}};
    std::vector<TParameters> const expected = {{}, named, named, {}};
    ASSERT_EQ(recorder_.records().size(), expected.size());
    for (std::size_t i = 0; i < expected.size(); ++i) {
        TParameters actual = recorder_.records()[i].parameters;
        actual.pop_back();
        EXPECT_EQ(actual, expected[i]) << i;
        EXPECT_NE(recorder_.records()[i].expanded.find(L": \"false\""), Strings::string::npos);
    }
    EXPECT_EQ(debuggerCalls, 1);
}

} // namespace
