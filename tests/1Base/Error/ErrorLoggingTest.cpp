// Which log calls pass, and what reaches the targets.

#include "1Base/Error/Error.h"
#include "2System/FileSys/FileSysExc.h"
#include "2System/SysInfo/SysInfoExc.h"
#include "2System/Time/TimeExc.h"

#include "support/LogRecorder.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <chrono>
#include <future>
#include <memory>
#include <ostream>
#include <set>
#include <stdexcept>
#include <string>
#include <thread>
#include <tuple>
#include <vector>

namespace {

using Error::CLogSingleton;
using Error::CMessage;
using TemplMeta::CNil;
using TemplMeta::CTypeList;
using TestSupport::CInstalledTarget;
using TestSupport::CLogRecord;
using TestSupport::CLogRecorder;
using TestSupport::TParameters;

using CErrorLoggingTest = TestSupport::CErrorTest;

// Calls `visit` with an object of each type of a list.
template <class... TTypes>
struct CTypes {
    template <class TVisit>
    static void each(TVisit const& visit) {
        (visit(TTypes()), ...);
    }
};

using TAllTargets = CTypes<Error::TTgtDebugger, Error::TTgtLogger, Error::TTgtUser>;
using TAllSeverities = CTypes<Error::TSevDebug, Error::TSevLog, Error::TSevInfo, Error::TSevWarn,
                              Error::TSevError, Error::TSevFatal>;

template <class TVisit>
void eachPair(TVisit const& visit) {
    TAllTargets::each([&visit](auto target) {
        TAllSeverities::each([&visit, target](auto severity) { visit(target, severity); });
    });
}

// Installs a target for every pair while it lives.
class CInstalledEverywhere {
  public:
    explicit CInstalledEverywhere(Error::CLogTarget const& target) : target_(target) {
        eachPair([this](auto t, auto s) {
            CLogSingleton::addTarget<decltype(t), decltype(s)>(&target_);
        });
    }
    ~CInstalledEverywhere() {
        eachPair([this](auto t, auto s) {
            CLogSingleton::removeTarget<decltype(t), decltype(s)>(&target_);
        });
    }
    CInstalledEverywhere(CInstalledEverywhere const&) = delete;
    CInstalledEverywhere& operator=(CInstalledEverywhere const&) = delete;

  private:
    Error::CLogTarget const& target_;
};

// Tag, target and severity of each record.
using TSeen = std::set<std::tuple<std::string, std::string, std::string>>;

// What passes of one call through TLogger for each pair of target and severity.
template <class TLogger>
TSeen passing() {
    CLogRecorder const recorder;
    CInstalledEverywhere const installed(recorder);
    eachPair([](auto target, auto severity) {
        TLogger::template log<decltype(target), decltype(severity)>(ERROR_ORIGIN, "text");
    });
    TSeen seen;
    for (CLogRecord const& record : recorder.records())
        EXPECT_TRUE(seen.emplace(record.tag, record.target, record.severity).second);
    return seen;
}

TSeen standard(std::string const& tag) {
    TSeen expected;
    for (char const* const target : {"TgtLogger", "TgtUser"})
        for (char const* const severity : {"SevLog", "SevInfo", "SevWarn", "SevError", "SevFatal"})
            expected.emplace(tag, target, severity);
    return expected;
}

// The loggers of single files.
TEMPLMETA_TAG_NAME(ExceptionRegistry);
TEMPLMETA_TAG_NAME(FileInfo);
TEMPLMETA_TAG_NAME(SysInfoPrefsFolder);

using TDebugAndStdSeverities = CTypeList<Error::TSevDebug, Error::TStdSeverities>;
using TDebuggerAndStdTargets = CTypeList<Error::TTgtDebugger, Error::TStdTargets>;

template <class TTag, class TParent>
using TStdLogger =
    Error::CLogger<TTag, Error::TStdSeverities, Error::TStdTargets, TParent, TemplMeta::CAnd>;
using TLoggerFileInfo =
    TStdLogger<TemplMeta::CTag<CTag_Name_FileInfo<char const*>>, FileSys::TLoggerFileSysBase>;
using TLoggerPrefsFolder =
    TStdLogger<TemplMeta::CTag<CTag_Name_SysInfoPrefsFolder<char const*>>, SysInfo::TLoggerSysInfo>;

using TTagRegistry = TemplMeta::CTag<CTag_Name_ExceptionRegistry<char const*>>;
using TLoggerRegistry = Error::CLogger<TTagRegistry, TDebugAndStdSeverities, TDebuggerAndStdTargets,
                                       Error::TLoggerError, TemplMeta::CAnd>;

TEST_F(CErrorLoggingTest, EachLoggerLetsTheStandardPairsThroughUnderItsOwnTag) {
    EXPECT_EQ(passing<Error::TLoggerError>(), standard("Error"));
    EXPECT_EQ(passing<Error::TLoggerErrorAssert>(), standard("ErrorAssert"));
    EXPECT_EQ(passing<TLoggerSystem>(), standard("System"));
    EXPECT_EQ(passing<FileSys::TLoggerFileSysBase>(), standard("FileSys"));
    EXPECT_EQ(passing<FileSys::TLoggerFileSys>(), standard("FileSys"));
    EXPECT_EQ(passing<TLoggerFileInfo>(), standard("FileInfo"));
    EXPECT_EQ(passing<SysInfo::TLoggerSysInfo>(), standard("SysInfo"));
    EXPECT_EQ(passing<TLoggerPrefsFolder>(), standard("SysInfoPrefsFolder"));
    EXPECT_EQ(passing<Time::TLoggerTime>(), standard("Time"));
    EXPECT_EQ(passing<Time::TLoggerTimeDateTime>(), standard("TimeDateTime"));
}

TEST_F(CErrorLoggingTest, AChildDoesNotWidenItsParent) {
    EXPECT_EQ(passing<TLoggerRegistry>(), standard("ExceptionRegistry"));
}

TEST_F(CErrorLoggingTest, AChildPassesMoreOnceItsParentDoes) {
    using TWideParent =
        Error::CLogger<TemplMeta::CTag<CTag_Name_FileInfo<char const*>>, TDebugAndStdSeverities,
                       TDebuggerAndStdTargets, Error::CGlobalLogger, TemplMeta::CAnd>;
    using TChild = Error::CLogger<TTagRegistry, TDebugAndStdSeverities, TDebuggerAndStdTargets,
                                  TWideParent, TemplMeta::CAnd>;
    TSeen expected;
    for (char const* const target : {"TgtDebugger", "TgtLogger", "TgtUser"})
        for (char const* const severity :
             {"SevDebug", "SevLog", "SevInfo", "SevWarn", "SevError", "SevFatal"})
            expected.emplace("ExceptionRegistry", target, severity);
    EXPECT_EQ(passing<TChild>(), expected);
}

TEST_F(CErrorLoggingTest, AChildNarrowsItsParent) {
    using TChild =
        Error::CLogger<TTagRegistry, CTypeList<Error::TSevFatal, CNil>,
                       CTypeList<Error::TTgtUser, CNil>, Error::TLoggerError, TemplMeta::CAnd>;
    EXPECT_EQ(passing<TChild>(), (TSeen{{"ExceptionRegistry", "TgtUser", "SevFatal"}}));
}

TEST_F(CErrorLoggingTest, AGrandparentFiltersToo) {
    using TNarrow = Error::CLogger<TTagRegistry, CTypeList<Error::TSevFatal, CNil>,
                                   Error::TStdTargets, Error::CGlobalLogger, TemplMeta::CAnd>;
    using TParent = TStdLogger<TTagRegistry, TNarrow>;
    using TChild = TStdLogger<TemplMeta::CTag<CTag_Name_FileInfo<char const*>>, TParent>;
    EXPECT_EQ(passing<TChild>(),
              (TSeen{{"FileInfo", "TgtLogger", "SevFatal"}, {"FileInfo", "TgtUser", "SevFatal"}}));
}

TEST_F(CErrorLoggingTest, ALoggerWithoutListsLetsNothingThrough) {
    using TNone = Error::CLogger<TTagRegistry, CNil, CNil, Error::CGlobalLogger, TemplMeta::CAnd>;
    EXPECT_TRUE(passing<TNone>().empty());
}

// Where a record goes.

TEST_F(CErrorLoggingTest, EachPairHasAListOfItsOwn) {
    eachPair([](auto target, auto severity) {
        CLogRecorder const recorder;
        CInstalledTarget<decltype(target), decltype(severity)> const installed(recorder);
        // The global logger filters nothing, so that every pair is tried.
        eachPair([](auto otherTarget, auto otherSeverity) {
            Error::CGlobalLogger::logFwd_<TTagRegistry, decltype(otherTarget),
                                          decltype(otherSeverity)>(ERROR_ORIGIN, "text", CNil());
        });
        ASSERT_EQ(recorder.records().size(), 1U);
        EXPECT_EQ(recorder.records()[0].target, TemplMeta::getTagName<decltype(target)>());
        EXPECT_EQ(recorder.records()[0].severity, TemplMeta::getTagName<decltype(severity)>());
    });
}

TEST_F(CErrorLoggingTest, AListIsTheSameOneAtEachCall) {
    EXPECT_EQ((&CLogSingleton::getTargetList_<Error::TTgtLogger, Error::TSevWarn>()),
              (&CLogSingleton::getTargetList_<Error::TTgtLogger, Error::TSevWarn>()));
    EXPECT_TRUE((CLogSingleton::getTargetList_<Error::TTgtLogger, Error::TSevWarn>().empty()));
}

// The site of the tests below.
template <class TText, class... TParams>
void logWarning(TText const* text, TParams const&... params) {
    TLoggerSystem::log<Error::TTgtLogger, Error::TSevWarn>(
        "/build/A", 118, "int f(int)", "Apr 29 2021", "08:35:23", text, params...);
}

using CInstalledForWarnings = CInstalledTarget<Error::TTgtLogger, Error::TSevWarn>;

class CErrorLoggingRecordTest : public CErrorLoggingTest {
  protected:
    // Logs and returns the one record.
    template <class TText, class... TParams>
    CLogRecord logged(TText const* text, TParams const&... params) {
        recorder_.clear();
        logWarning(text, params...);
        EXPECT_EQ(recorder_.records().size(), 1U);
        return recorder_.records().empty() ? CLogRecord() : recorder_.records()[0];
    }

  private:
    CLogRecorder recorder_;
    CInstalledForWarnings const installed_{recorder_};
};

TEST_F(CErrorLoggingRecordTest, ARecordHasOriginTagTargetAndSeverity) {
    CLogRecord const record = logged("text");
    EXPECT_EQ(record.place,
              TestSupport::TPlace("/build/A", 118, "int f(int)", "Apr 29 2021", "08:35:23"));
    EXPECT_EQ(record.tag, "System");
    EXPECT_EQ(record.target, "TgtLogger");
    EXPECT_EQ(record.severity, "SevWarn");
}

TEST_F(CErrorLoggingRecordTest, TheMessageIsUnexpandedWithTheTextAsItsParameter) {
    CLogRecord const record = logged("text");
    EXPECT_EQ(record.text, L"@(__msg__)");
    EXPECT_EQ(record.parameters, (TParameters{{"__msg__", L"text"}}));
    EXPECT_EQ(record.expanded, L"text");
}

TEST_F(CErrorLoggingRecordTest, NarrowTextsAreUTF8AndWideOnesStayAsTheyAre) {
    EXPECT_EQ(logged("caf\xC3\xA9 \xF0\x9F\x98\x80").expanded, L"caf\u00E9 \U0001F600");
    EXPECT_EQ(logged(L"caf\u00E9 \U0001F600").expanded, L"caf\u00E9 \U0001F600");
    EXPECT_EQ(logged("").expanded, L"");
    EXPECT_EQ(logged(L"").expanded, L"");
}

TEST_F(CErrorLoggingRecordTest, ParametersOfEveryFormComeBeforeTheText) {
    std::string const key = "/tmp/a";
    int const line = 7;
    auto const one = Error::buildNamedParameter("key", key);
    auto const two = one + Error::buildNamedParameter("line", line);
    Strings::string const expanded = L"no /tmp/a";

    CLogRecord record = logged("no @(key)", one);
    EXPECT_EQ(record.parameters, (TParameters{{"key", L"/tmp/a"}, {"__msg__", L"no @(key)"}}));
    EXPECT_EQ(record.expanded, expanded);

    record = logged("no @(key)", two);
    EXPECT_EQ(record.parameters,
              (TParameters{{"key", L"/tmp/a"}, {"line", L"7"}, {"__msg__", L"no @(key)"}}));
    EXPECT_EQ(record.expanded, expanded);

    Strings::CParameterList<wchar_t> list(two);
    list.add("__msg__", "mine");
    record = logged(L"no @(key)", list);
    EXPECT_EQ(
        record.parameters,
        (TParameters{
            {"key", L"/tmp/a"}, {"line", L"7"}, {"__msg__", L"mine"}, {"__msg__", L"no @(key)"}}));

    EXPECT_EQ(logged("no @(key)", CNil()).parameters, (TParameters{{"__msg__", L"no @(key)"}}));
}

TEST_F(CErrorLoggingRecordTest, ASiteNamesItsParametersAfterTheirExpressions) {
    class CFile {
      public:
        int size(int scale) const { return 3 * scale; }
    };
    CLogRecorder const recorder;
    CInstalledTarget<Error::TTgtLogger, Error::TSevInfo> const installed(recorder);
    CFile const fs;
    char const* const func = __PRETTY_FUNCTION__;
    // Compilers differ in the line of a macro that spans several.
    using FileSys::TLoggerFileSys, Error::TTgtLogger, Error::TSevInfo;
    unsigned int const line = __LINE__ + 1;
    ERROR_LOG(TLoggerFileSys, TTgtLogger, TSevInfo, "at @(fs.size(1))", ERROR_PARAM(fs.size(1)));
    ASSERT_EQ(recorder.records().size(), 1U);
    CLogRecord const& record = recorder.records()[0];
    EXPECT_EQ(record.expanded, L"at 3");
    EXPECT_EQ(record.parameters[0], (TParameters::value_type{"fs.size(1)", L"3"}));
    EXPECT_EQ(record.place, TestSupport::TPlace(__FILE__, line, func, __DATE__, __TIME__));
}

// Two targets of one pair.

TEST_F(CErrorLoggingTest, TargetsAreCalledInTheirOrderEachWithAMessageOfItsOwn) {
    class COrdered : public CLogRecorder {
      public:
        COrdered(char name, std::string& order, std::vector<CMessage const*>& messages)
            : name_(name), order_(order), messages_(messages) {}
        void write(char const* file, unsigned int line, char const* func, char const* date,
                   char const* time, char const* tag, char const* target, char const* severity,
                   CMessage const& message) const override {
            order_ += name_;
            messages_.push_back(&message);
            // Leaves its message expanded, with leftovers.
            CLogRecorder::write(file, line, func, date, time, tag, target, severity, message);
            message.insertParameters(true);
        }

      private:
        char name_;
        std::string& order_;
        std::vector<CMessage const*>& messages_;
    };
    std::string order;
    std::vector<CMessage const*> messages;
    COrdered const first('1', order, messages);
    COrdered const second('2', order, messages);
    CInstalledForWarnings const installed1(first);
    CInstalledForWarnings const installed2(second);
    logWarning("no @(key)", Error::buildNamedParameter("key", "k"));
    EXPECT_EQ(order, "12");
    for (COrdered const* const each : {&first, &second}) {
        ASSERT_EQ(each->records().size(), 1U);
        EXPECT_EQ(each->records()[0].text, L"@(__msg__)");
        EXPECT_EQ(each->records()[0].parameters,
                  (TParameters{{"key", L"k"}, {"__msg__", L"no @(key)"}}));
    }
}

TEST_F(CErrorLoggingTest, ATargetThatIsInstalledTwiceIsCalledTwice) {
    CLogRecorder recorder;
    CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevWarn>(&recorder);
    CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevWarn>(&recorder);
    logWarning("text");
    EXPECT_EQ(recorder.records().size(), 2U);
    EXPECT_TRUE((CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevWarn>(&recorder)));
    recorder.clear();
    logWarning("text");
    EXPECT_EQ(recorder.records().size(), 1U);
    EXPECT_TRUE((CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevWarn>(&recorder)));
    EXPECT_FALSE((CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevWarn>(&recorder)));
    logWarning("text");
    EXPECT_EQ(recorder.records().size(), 1U);
}

TEST_F(CErrorLoggingTest, RemovalTakesTheFirstEqualTargetOfThePairAlone) {
    CLogRecorder const a;
    CLogRecorder const b;
    auto& list = CLogSingleton::getTargetList_<Error::TTgtLogger, Error::TSevWarn>();
    for (CLogRecorder const* const target : {&a, &b, &a})
        CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevWarn>(target);
    EXPECT_FALSE((CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevError>(&a)));
    EXPECT_FALSE((CLogSingleton::removeTarget<Error::TTgtUser, Error::TSevWarn>(&a)));
    EXPECT_TRUE((CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevWarn>(&a)));
    EXPECT_EQ(list, (std::vector<Error::CLogTarget const*>{&b, &a}));
    for (CLogRecorder const* const target : {&b, &a})
        EXPECT_TRUE((CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevWarn>(target)));
    EXPECT_TRUE(list.empty());
}

// What is turned into text, and when.

class CThrowing {};

std::wostream& operator<<(std::wostream& stream, CThrowing const&) {
    throw std::runtime_error("cast");
    return stream;
}

TEST_F(CErrorLoggingTest, WithoutATargetNothingIsTurnedIntoText) {
    CThrowing const value;
    EXPECT_NO_THROW(logWarning("@(value)", ERROR_PARAM(value)));
    // The text is no UTF-8 either.
    EXPECT_NO_THROW(logWarning("\xFF"));
}

TEST_F(CErrorLoggingTest, AFilteredCallTurnsNothingIntoTextWhateverIsInstalled) {
    CThrowing const value;
    CLogRecorder const recorder;
    CInstalledEverywhere const installed(recorder);
    EXPECT_NO_THROW(ERROR_LOG(TLoggerSystem, Error::TTgtLogger, Error::TSevDebug, "@(value)",
                              ERROR_PARAM(value)));
    EXPECT_NO_THROW(ERROR_LOG(TLoggerSystem, Error::TTgtDebugger, Error::TSevError, "@(value)",
                              ERROR_PARAM(value)));
}

bool isUnlocked() {
    bool const locked = CLogSingleton::mutex_().try_lock();
    if (locked)
        CLogSingleton::mutex_().unlock();
    return locked;
}

TEST_F(CErrorLoggingTest, WhatACastThrowsPassesToTheCallerAndReleasesTheLock) {
    CThrowing const value;
    CLogRecorder const recorder;
    CInstalledForWarnings const installed(recorder);
    EXPECT_THROW(logWarning("@(value)", ERROR_PARAM(value)), std::runtime_error);
    EXPECT_TRUE(isUnlocked());
    EXPECT_TRUE(recorder.records().empty());
}

TEST_F(CErrorLoggingTest, WhatATargetThrowsPassesToTheCallerAndReleasesTheLock) {
    class CFailing : public CLogRecorder {
      public:
        void write(char const*, unsigned int, char const*, char const*, char const*, char const*,
                   char const*, char const*, CMessage const&) const override {
            throw 7;
        }
    };
    CLogRecorder const before;
    CFailing const failing;
    CLogRecorder const after;
    CInstalledForWarnings const installed1(before);
    CInstalledForWarnings const installed2(failing);
    CInstalledForWarnings const installed3(after);
    EXPECT_THROW(logWarning("text"), int);
    EXPECT_TRUE(isUnlocked());
    EXPECT_EQ(before.records().size(), 1U);
    EXPECT_TRUE(after.records().empty());
}

// The lock.

TEST_F(CErrorLoggingTest, TheLockIsHeldWhileTargetsWrite) {
    class CLockProbe : public Error::CLogTarget {
      public:
        void write(char const*, unsigned int, char const*, char const*, char const*, char const*,
                   char const*, char const*, CMessage const&) const override {
            std::thread([this] { wasUnlocked |= isUnlocked(); }).join();
            ++calls;
        }
        mutable bool wasUnlocked = false;
        mutable int calls = 0;
    };
    CLockProbe const probe;
    CInstalledForWarnings const installed1(probe);
    CInstalledForWarnings const installed2(probe);
    logWarning("text");
    EXPECT_EQ(probe.calls, 2);
    EXPECT_FALSE(probe.wasUnlocked);
    EXPECT_TRUE(isUnlocked());
}

TEST_F(CErrorLoggingTest, AFilteredCallTakesNoLock) {
    boost::unique_lock<boost::mutex> const lock(CLogSingleton::mutex_());
    ERROR_LOG(TLoggerSystem, Error::TTgtLogger, Error::TSevDebug, "text");
    ERROR_LOG(TLoggerSystem, Error::TTgtDebugger, Error::TSevFatal, "text");
}

// Whether `act`, on a thread of its own, waits for the lock of logging.
template <class TAct>
bool waitsForLock(TAct const& act) {
    boost::unique_lock<boost::mutex> lock(CLogSingleton::mutex_());
    std::future<void> const done = std::async(std::launch::async, act);
    bool const waits = done.wait_for(std::chrono::milliseconds(50)) == std::future_status::timeout;
    lock.unlock();
    done.wait();
    return waits;
}

TEST_F(CErrorLoggingTest, APassingCallAndTheListsWaitForTheLock) {
    CLogRecorder const recorder;
    EXPECT_TRUE(waitsForLock([] { logWarning("text"); }));
    EXPECT_TRUE(waitsForLock(
        [&] { CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevWarn>(&recorder); }));
    EXPECT_TRUE(waitsForLock(
        [&] { CLogSingleton::removeTarget<Error::TTgtLogger, Error::TSevWarn>(&recorder); }));
}

} // namespace
