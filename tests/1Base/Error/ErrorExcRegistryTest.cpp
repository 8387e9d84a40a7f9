// Which exceptions the registry knows, and whom it tells.

#include "1Base/Error/Error.h"

#include "support/LogRecorder.h"
#include "support/Registry.h"
#include "support/SampleException.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <iostream>
#include <memory>
#include <regex>
#include <sstream>
#include <stdexcept>
#include <streambuf>
#include <string>
#include <utility>
#include <vector>

namespace {

using Error::CExcImplementation;
using TestSupport::CLogRecord;
using TestSupport::CRegisteredObserver;
using TestSupport::liveExceptions;
using TestSupport::registry;
using TestSupport::TExcSample;
using TestSupport::XSample;

using CErrorExcRegistryTest = TestSupport::CErrorTest;
using TImplementations = std::vector<CExcImplementation const*>;

// Keeps what it is told: "+" or "-" and the exception.
class CWitness : public Error::CExcRegistry::CObserver {
  public:
    using TEvents = std::vector<std::pair<char, CExcImplementation const*>>;

    void exceptionAdded(CExcImplementation const* impl, Error::CInfo const& info) const override {
        events.emplace_back('+', impl);
        texts.push_back(info.getMessage().getString(false));
    }
    void exceptionRemoved(CExcImplementation const* impl) const override {
        events.emplace_back('-', impl);
    }

    mutable TEvents events;
    mutable std::vector<Strings::string> texts;
};

// Fails at everything.
class CFailingObserver : public Error::CExcRegistry::CObserver {
  public:
    void exceptionAdded(CExcImplementation const*, Error::CInfo const&) const override {
        throw std::runtime_error("added");
    }
    void exceptionRemoved(CExcImplementation const*) const override { throw 7; }
};

std::unique_ptr<XSample> makeSample() {
    return std::make_unique<XSample>(ERROR_ORIGIN, Error::msgDuplicate);
}

// So many exceptions, the oldest first.
std::vector<std::unique_ptr<XSample>> makeSamples(std::size_t count) {
    std::vector<std::unique_ptr<XSample>> samples;
    while (samples.size() < count)
        samples.push_back(makeSample());
    return samples;
}

TImplementations pointersTo(std::vector<std::unique_ptr<XSample>> const& samples) {
    TImplementations pointers;
    for (auto const& each : samples)
        pointers.push_back(each.get());
    return pointers;
}

TEST_F(CErrorExcRegistryTest, ExceptionsStandInTheOrderOfTheirBirth) {
    auto const samples = makeSamples(3);
    EXPECT_EQ(liveExceptions(), pointersTo(samples));
}

TEST_F(CErrorExcRegistryTest, RemovalKeepsTheOrderOfTheOthers) {
    auto samples = makeSamples(5);
    samples.erase(samples.begin() + 1);
    EXPECT_EQ(liveExceptions(), pointersTo(samples));
    samples.erase(samples.begin());
    EXPECT_EQ(liveExceptions(), pointersTo(samples));
    samples.pop_back();
    EXPECT_EQ(liveExceptions(), pointersTo(samples));
}

TEST_F(CErrorExcRegistryTest, RaisingAndDestroyingLeavesTheCountAsItWas) {
    auto const samples = makeSamples(2);
    for (int i = 0; i < 200; ++i)
        EXPECT_THROW(ERROR_THROW(TExcSample, Error::msgDuplicate), TExcSample);
    EXPECT_EQ(liveExceptions(), pointersTo(samples));
}

TEST_F(CErrorExcRegistryTest, TheContentsAreACopy) {
    auto samples = makeSamples(2);
    TImplementations const before = liveExceptions();
    samples.clear();
    EXPECT_EQ(before.size(), 2U);
}

TEST_F(CErrorExcRegistryTest, A127ExceptionsAreAllKnown) {
    auto const samples = makeSamples(127);
    EXPECT_EQ(liveExceptions(), pointersTo(samples));
}

TEST_F(CErrorExcRegistryTest, EachFurtherOneTakesThePlaceOfThe65thOldest) {
    auto const samples = makeSamples(130);
    TImplementations expected = pointersTo(samples);
    expected.erase(expected.begin() + 64, expected.begin() + 67);
    EXPECT_EQ(liveExceptions(), expected);
    EXPECT_EQ(liveExceptions().size(), 127U);
}

TEST_F(CErrorExcRegistryTest, TheDeathOfAForgottenExceptionIsNotTold) {
    auto samples = makeSamples(128);
    CWitness const witness;
    CRegisteredObserver const registered(witness);
    CExcImplementation const* const forgotten = samples[64].get();
    CExcImplementation const* const known = samples[65].get();
    samples[64].reset();
    EXPECT_TRUE(witness.events.empty());
    EXPECT_EQ(liveExceptions().size(), 127U);
    samples[65].reset();
    EXPECT_EQ(witness.events, (CWitness::TEvents{{'-', known}}));
    EXPECT_EQ(liveExceptions().size(), 126U);
    EXPECT_FALSE(registry().removeException_(forgotten));
}

TEST_F(CErrorExcRegistryTest, RemovalSaysWhetherTheExceptionWasKnown) {
    auto const sample = makeSample();
    EXPECT_TRUE(registry().removeException_(sample.get()));
    EXPECT_FALSE(registry().removeException_(sample.get()));
    EXPECT_TRUE(liveExceptions().empty());
}

TEST_F(CErrorExcRegistryTest, BeginAndEndGiveContentsAndNotPositions) {
    auto samples = makeSamples(3);
    CExcImplementation const* const first = samples[0].get();
    CExcImplementation const* const second = samples[1].get();
    CExcImplementation const* const third = samples[2].get();
    EXPECT_EQ(registry().begin(), first);
    // What a freed slot held stays in it.
    samples.pop_back();
    EXPECT_EQ(registry().begin(), first);
    EXPECT_EQ(registry().end(), third);
    samples.erase(samples.begin());
    EXPECT_EQ(registry().begin(), second);
    EXPECT_EQ(registry().end(), second);
    samples.clear();
    EXPECT_EQ(registry().begin(), second);
    EXPECT_EQ(registry().end(), second);
}

TEST_F(CErrorExcRegistryTest, EndOfAFullRegistryStaysInBounds) {
    auto const samples = makeSamples(140);
    EXPECT_EQ(registry().begin(), samples.front().get());
    EXPECT_NE(registry().end(), samples.back().get());
}

// Observers.

TEST_F(CErrorExcRegistryTest, AnObserverIsToldWhatComesAndGoes) {
    CWitness const witness;
    CRegisteredObserver const registered(witness);
    auto first = makeSample();
    auto second = makeSample();
    CExcImplementation const* const a = first.get();
    CExcImplementation const* const b = second.get();
    first.reset();
    second.reset();
    EXPECT_EQ(witness.events, (CWitness::TEvents{{'+', a}, {'+', b}, {'-', a}, {'-', b}}));
    EXPECT_EQ(witness.texts, (std::vector<Strings::string>(2, L"Duplicate object exists")));
}

TEST_F(CErrorExcRegistryTest, ObserversAreToldInTheOrderOfRegistration) {
    class CNamed : public Error::CExcRegistry::CObserver {
      public:
        CNamed(char name, std::string& told) : name_(name), told_(told) {}
        void exceptionAdded(CExcImplementation const*, Error::CInfo const&) const override {
            told_ += name_;
        }
        void exceptionRemoved(CExcImplementation const*) const override { told_ += name_; }

      private:
        char name_;
        std::string& told_;
    };
    std::string told;
    CNamed const first('1', told);
    CNamed const second('2', told);
    CNamed const third('3', told);
    CRegisteredObserver const registered1(first);
    {
        CRegisteredObserver const registered2(second);
        CRegisteredObserver const registered3(third);
        makeSample();
        EXPECT_EQ(told, "123123");
    }
    told.clear();
    makeSample();
    EXPECT_EQ(told, "11");
}

TEST_F(CErrorExcRegistryTest, RemovingAnObserverKeepsTheOrderOfTheOthers) {
    CWitness const first;
    CWitness const second;
    CRegisteredObserver const registered2(second);
    {
        CRegisteredObserver const registered1(first);
        makeSample();
    }
    makeSample();
    EXPECT_EQ(first.events.size(), 2U);
    EXPECT_EQ(second.events.size(), 4U);
}

TEST_F(CErrorExcRegistryTest, AnObserverThatIsRegisteredTwiceIsToldTwice) {
    CWitness const witness;
    CRegisteredObserver const registered(witness);
    {
        CRegisteredObserver const again(witness);
        makeSample();
        EXPECT_EQ(witness.events.size(), 4U);
    }
    witness.events.clear();
    makeSample();
    EXPECT_EQ(witness.events.size(), 2U);
}

// The two lines.

class CErrorExcRegistryLogTest : public CErrorExcRegistryTest {
  protected:
    // The logged texts of all pairs that the registry's logger could reach.
    std::vector<Strings::string> texts() const {
        std::vector<Strings::string> result;
        for (CLogRecord const& record : recorder_.records())
            result.push_back(record.expanded);
        return result;
    }

    TestSupport::CLogRecorder recorder_;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevLog> const installed_{recorder_};
};

TEST_F(CErrorExcRegistryLogTest, ComingAndGoingOfAnObserverIsLogged) {
    CWitness const witness;
    registry().registerObserver(&witness);
    EXPECT_EQ(texts(), (std::vector<Strings::string>{L"Registered exception logging observer"}));
    CLogRecord const record = recorder_.records()[0];
    EXPECT_EQ(record.tag, "ExceptionRegistry");
    EXPECT_EQ(record.target, "TgtLogger");
    EXPECT_EQ(record.severity, "SevLog");
    recorder_.clear();
    registry().unregisterObserver(&witness);
    EXPECT_EQ(texts(), (std::vector<Strings::string>{L"Unregistered exception logging observer"}));
    EXPECT_EQ(recorder_.records()[0].tag, "ExceptionRegistry");
}

TEST_F(CErrorExcRegistryLogTest, RemovingAnUnknownObserverIsSilentAndChangesNothing) {
    CWitness const known;
    CWitness const unknown;
    CRegisteredObserver const registered(known);
    recorder_.clear();
    registry().unregisterObserver(&unknown);
    EXPECT_TRUE(recorder_.records().empty());
    makeSample();
    EXPECT_EQ(known.events.size(), 2U);
}

// Fails at its first record: what was done before the line was logged stays, what comes after is
// not done.
class CFailingTarget : public Error::CLogTarget {
  public:
    void write(char const*, unsigned int, char const*, char const*, char const*, char const*,
               char const*, char const*, Error::CMessage const&) const override {
        throw std::runtime_error("target");
    }
};

TEST_F(CErrorExcRegistryTest, RegistrationIsLoggedBeforeTheObserverIsAppended) {
    CWitness const witness;
    {
        CFailingTarget const target;
        TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevLog> const installed(target);
        EXPECT_THROW(registry().registerObserver(&witness), std::runtime_error);
    }
    makeSample();
    EXPECT_TRUE(witness.events.empty());
}

TEST_F(CErrorExcRegistryTest, RemovalIsLoggedOnceTheObserverIsGone) {
    CWitness const witness;
    registry().registerObserver(&witness);
    {
        CFailingTarget const target;
        TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevLog> const installed(target);
        EXPECT_THROW(registry().unregisterObserver(&witness), std::runtime_error);
    }
    makeSample();
    EXPECT_TRUE(witness.events.empty());
}

// Observers that fail.

// Stands in for the error stream's buffer.
class CErrorStream {
  public:
    explicit CErrorStream(std::streambuf* buffer) : old_(std::cerr.rdbuf(buffer)) {}
    ~CErrorStream() {
        std::cerr.exceptions(std::ios_base::goodbit);
        std::cerr.rdbuf(old_);
        std::cerr.clear();
    }
    CErrorStream(CErrorStream const&) = delete;
    CErrorStream& operator=(CErrorStream const&) = delete;

  private:
    std::streambuf* old_;
};

// Whether `text` is `<path of the registry's source>(<line>): <message>` and two line feeds.
bool isFatalMessage(std::string const& text, std::string const& message) {
    std::regex const pattern(
        "[^\n]*/1Base/Error/_Imp/ErrorExcRegistry\\.cpp\\([1-9][0-9]*\\): ([^\n]*)"
        "\n\n");
    std::smatch match;
    return std::regex_match(text, match, pattern) && match[1] == message;
}

char const* const toOne = "Uncaught exception. Output to observer canceled.";
char const* const toAll = "Uncaught exception. Output to all remaining observers canceled.";

// A failing observer between two that are well, and what reaches the error stream.
class CErrorExcFailingObserverTest : public CErrorExcRegistryTest {
  protected:
    CWitness const before_{};
    CWitness const after_{};
    std::stringbuf written_;

  private:
    CFailingObserver const failing_{};
    CRegisteredObserver const registered1_{before_};
    CRegisteredObserver const registered2_{failing_};
    CRegisteredObserver const registered3_{after_};
    CErrorStream const errorStream_{&written_};
};

TEST_F(CErrorExcFailingObserverTest, AFailingObserverIsToldToTheErrorStreamAndTheOthersAreToldOn) {
    auto sample = makeSample();
    EXPECT_PRED2(isFatalMessage, written_.str(), toOne);
    written_.str("");
    sample.reset();
    EXPECT_PRED2(isFatalMessage, written_.str(), toOne);
    EXPECT_EQ(before_.events.size(), 2U);
    EXPECT_EQ(after_.events.size(), 2U);
    EXPECT_TRUE(liveExceptions().empty());
}

TEST_F(CErrorExcFailingObserverTest, AFailingObserverDoesNotTouchTheExceptionInTheMaking) {
    EXPECT_THROW(ERROR_THROW(TExcSample, Error::msgDuplicate), TExcSample);
}

// Takes nothing.
class CBrokenBuffer : public std::streambuf {};

// Fails, and puts another buffer into the error stream when its failure is over: between the line
// that cannot be written and the next.
class CMendingObserver : public Error::CExcRegistry::CObserver {
  public:
    explicit CMendingObserver(std::streambuf* next) : next_(next) {}
    void exceptionAdded(CExcImplementation const*, Error::CInfo const&) const override {
        throw CFailure{next_};
    }
    void exceptionRemoved(CExcImplementation const*) const override { throw CFailure{next_}; }

  private:
    struct CFailure {
        ~CFailure() { std::cerr.rdbuf(next); }
        std::streambuf* next;
    };

    std::streambuf* next_;
};

TEST_F(CErrorExcRegistryTest, WhereTheErrorStreamFailsTooTheRemainingObserversAreNotTold) {
    CWitness const before;
    CWitness const after;
    std::stringbuf written;
    CMendingObserver const failing(&written);
    CRegisteredObserver const registered1(before);
    CRegisteredObserver const registered2(failing);
    CRegisteredObserver const registered3(after);
    CBrokenBuffer broken;
    CErrorStream const errorStream(&broken);
    std::cerr.exceptions(std::ios_base::badbit);

    auto sample = makeSample();
    EXPECT_PRED2(isFatalMessage, written.str(), toAll);
    EXPECT_EQ(before.events.size(), 1U);
    EXPECT_TRUE(after.events.empty());

    written.str("");
    std::cerr.rdbuf(&broken);
    sample.reset();
    EXPECT_PRED2(isFatalMessage, written.str(), toAll);
    EXPECT_EQ(before.events.size(), 2U);
    EXPECT_TRUE(after.events.empty());
}

[[noreturn]] void sayTerminated() {
    static char const text[] = "terminated";
    std::fwrite(text, 1, sizeof(text) - 1, stderr);
    std::_Exit(3);
}

TEST_F(CErrorExcRegistryTest, ARemovalThatFailsEndsTheProcess) {
    auto const die = [] {
        std::set_terminate(sayTerminated);
        auto sample = makeSample();
        CBrokenBuffer broken;
        CMendingObserver const failing(&broken);
        registry().registerObserver(&failing);
        CErrorStream const errorStream(&broken);
        std::cerr.exceptions(std::ios_base::badbit);
        sample.reset();
        std::_Exit(0);
    };
    EXPECT_EXIT(die(), testing::ExitedWithCode(3), "^terminated$");
}

// The ready-made observer.

class CErrorExcLogObserverTest : public CErrorExcRegistryLogTest {};

TEST_F(CErrorExcLogObserverTest, LogsEachExceptionThatComesAndGoes) {
    Error::CExcLogObserver const observer;
    CRegisteredObserver const registered(observer);
    recorder_.clear();
    auto sample = makeSample();
    std::ostringstream address;
    address << static_cast<void const*>(static_cast<CExcImplementation const*>(sample.get()));
    std::string const text = address.str();
    Strings::string const wide(text.begin(), text.end());
    sample.reset();
    EXPECT_EQ(texts(), (std::vector<Strings::string>{
                           L"Exception " + wide + L" added to the exception registry.",
                           L"Exception " + wide + L" removed from the exception registry."}));
    for (CLogRecord const& record : recorder_.records()) {
        EXPECT_EQ(record.tag, "Error");
        EXPECT_EQ(record.severity, "SevLog");
        ASSERT_EQ(record.parameters.size(), 2U);
        EXPECT_EQ(record.parameters[0], (TestSupport::TParameters::value_type{"pExc", wide}));
    }
    EXPECT_EQ(recorder_.records()[0].parameters[1].second,
              L"Exception @(pExc) added to the exception registry.");
}

} // namespace
