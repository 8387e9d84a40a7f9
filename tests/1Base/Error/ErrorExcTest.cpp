// What an exception carries, and how one wraps another.

#include "1Base/Error/Error.h"

#include "support/MessageParameters.h"
#include "support/Place.h"
#include "support/Registry.h"
#include "support/SampleException.h"

#include <gtest/gtest.h>

#include <exception>
#include <string>
#include <type_traits>
#include <typeinfo>
#include <vector>

namespace {

using TestSupport::messageOf;
using TestSupport::parameterList;
using TestSupport::parametersOf;
using TestSupport::placeOf;
using TestSupport::sample;
using TestSupport::TExcSample;
using TestSupport::TParameters;
using TestSupport::XOtherSample;
using TestSupport::XSample;

using CErrorExcTest = TestSupport::CErrorTest;

// The shape of the family.
static_assert(!std::is_base_of_v<std::exception, Error::CException>);
static_assert(std::is_abstract_v<Error::CException>);
static_assert(std::is_abstract_v<TExcSample>);
static_assert(std::has_virtual_destructor_v<Error::CException>);
static_assert(sizeof(Error::CException) == sizeof(void*));
static_assert(sizeof(TExcSample) == sizeof(void*));
static_assert(std::is_base_of_v<Error::CExcImplementation, XSample>);
static_assert(
    std::is_base_of_v<Error::Detail::CExcImplBase<TExcSample, Error::CExcImplementation>, XSample>);
static_assert(sizeof(XSample) ==
              sizeof(Error::Detail::CExcImplBase<TExcSample, Error::CExcImplementation>));
static_assert(std::is_copy_constructible_v<XSample>);
static_assert(!std::is_copy_assignable_v<XSample>);
static_assert(std::is_same_v<decltype(std::declval<XSample const&>().getExcName()), char const*>);
static_assert(
    std::is_same_v<decltype(std::declval<XSample const&>().getInfo()), Error::CInfo const&>);
static_assert(std::is_same_v<decltype(std::declval<XSample const&>().getStackInfo()),
                             Error::CStackInfoList const&>);
static_assert(
    std::is_same_v<decltype(std::declval<XSample&>().getStackInfo()), Error::CStackInfoList&>);

// The records of places hold plain pointers.
static_assert(std::is_trivially_copyable_v<Error::COrigin>);
static_assert(std::is_trivially_copyable_v<Error::CStackInfo>);
static_assert(sizeof(Error::COrigin) == 5 * sizeof(void*));
static_assert(sizeof(Error::CStackInfo) == 5 * sizeof(void*));

// The tree has virtual bases only above the data: a cast down from a virtual base is refused.
template <class TBase, class TDerived, class = void>
struct CIsVirtualBase : std::is_base_of<TBase, TDerived> {};

template <class TBase, class TDerived>
struct CIsVirtualBase<TBase, TDerived,
                      std::void_t<decltype(static_cast<TDerived*>(std::declval<TBase*>()))>>
    : std::false_type {};

static_assert(CIsVirtualBase<Error::CException, TExcSample>::value);
static_assert(CIsVirtualBase<Error::CException, Error::CExcImplementation>::value);
static_assert(CIsVirtualBase<Error::TExcStdLibException, Error::TExcBadAllocException>::value);
static_assert(!CIsVirtualBase<TExcSample, XSample>::value);
static_assert(!CIsVirtualBase<Error::CExcImplementation, XSample>::value);

void expectSampleOrigin(Error::COrigin const& origin) {
    EXPECT_EQ(origin.getFile(), TestSupport::sampleFile);
    EXPECT_EQ(origin.getLine(), TestSupport::sampleLine);
    EXPECT_EQ(origin.getFunc(), TestSupport::sampleFunc);
    EXPECT_EQ(origin.getDate(), TestSupport::sampleDate);
    EXPECT_EQ(origin.getTime(), TestSupport::sampleTime);
}

void expectSample(Error::CException const& exc, Strings::string const& text,
                  TParameters const& parameters) {
    EXPECT_STREQ(exc.getExcName(), "Sample");
    expectSampleOrigin(exc.getInfo().getOrigin());
    EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
    EXPECT_EQ(exc.getInfo().getMessage().getString(false), text);
    EXPECT_EQ(parametersOf(exc.getInfo().getMessage()), parameters);
    EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
}

TEST_F(CErrorExcTest, TheNumberOfATextNeedsNoParameters) {
    expectSample(sample(Error::msgNotFound), L"@(type) @(key) was not found", {});
}

TEST_F(CErrorExcTest, TheNumberOfATextTakesParametersInEveryForm) {
    Strings::string const text = L"@(type) @(key) was not found";
    std::string const key = "/tmp/a";
    expectSample(sample(Error::msgNotFound, Error::buildNamedParameter("key", key)), text,
                 {{"key", L"/tmp/a"}});
    expectSample(sample(Error::msgNotFound, Error::buildNamedParameter("type", "file") +
                                                Error::buildNamedParameter("key", key)),
                 text, {{"type", L"file"}, {"key", L"/tmp/a"}});
    expectSample(sample(Error::msgNotFound, parameterList("key", "/tmp/a")), text,
                 {{"key", L"/tmp/a"}});
    expectSample(sample(Error::msgNotFound, TemplMeta::CNil()), text, {});
}

TEST_F(CErrorExcTest, AMessageIsTakenWithItsParameters) {
    Error::CMessage const message(Error::msgEndOf, parameterList("types", "files"));
    expectSample(sample(message), L"End of @(types)", {{"types", L"files"}});
}

TEST_F(CErrorExcTest, ParametersBesideAMessageComeBehindItsOwn) {
    Error::CMessage const message(Error::msgEndOf, parameterList("types", "files"));
    expectSample(sample(message, parameterList("where", "here")), L"End of @(types)",
                 {{"types", L"files"}, {"where", L"here"}});
    EXPECT_EQ(parametersOf(message), (TParameters{{"types", L"files"}}));
}

TEST_F(CErrorExcTest, ValuesBecomeTextWhenTheExceptionIsBuilt) {
    int count = 1;
    XSample const exc = sample(Error::msgEndOf, Error::buildNamedParameter("types", count));
    count = 2;
    EXPECT_EQ(parametersOf(exc.getInfo().getMessage()), (TParameters{{"types", L"1"}}));
}

TEST_F(CErrorExcTest, AnInfoCopiesTheMessageAndPointsToTheOrigin) {
    Error::CMessage message(Error::msgEndOf, parameterList("types", "files"));
    Error::CInfo const info(TestSupport::sampleOrigin(), Error::SevWarn, message);
    Error::CInfo const fromValues(TestSupport::sampleFile, TestSupport::sampleLine,
                                  TestSupport::sampleFunc, TestSupport::sampleDate,
                                  TestSupport::sampleTime, Error::SevWarn, message);
    Error::CInfo const copy(info);
    message.add("more", "later");
    for (Error::CInfo const* const each : {&info, &fromValues, &copy}) {
        expectSampleOrigin(each->getOrigin());
        EXPECT_EQ(each->getSeverity(), Error::SevWarn);
        EXPECT_EQ(parametersOf(each->getMessage()), (TParameters{{"types", L"files"}}));
    }
}

TEST_F(CErrorExcTest, AThrowSiteGivesItsPlaceAndItsBuild) {
    char const* func = nullptr;
    unsigned int line = 0;
    try {
        func = __PRETTY_FUNCTION__;
        line = __LINE__ + 1;
        ERROR_THROW(TExcSample, Error::msgDuplicate);
    } catch (Error::CException const& exc) {
        EXPECT_EQ(placeOf(exc.getInfo().getOrigin()),
                  TestSupport::TPlace(__FILE__, line, func, __DATE__, __TIME__));
        EXPECT_EQ(exc.getInfo().getMessage().getString(true), L"Duplicate object exists");
    }
    EXPECT_NE(line, 0U);
}

TEST_F(CErrorExcTest, AThrowSiteNamesValuesAfterTheirExpressions) {
    struct {
        int getSize(int scale) const { return 3 * scale; }
    } const fs;
    std::string const key = "a";
    try {
        ERROR_THROW(TExcSample, Error::msgNotFound,
                    ERROR_PARAMS(ERROR_PARAM(key), ERROR_PARAM(fs.getSize(2)), ERROR_PARAM(1 + 1)));
    } catch (TExcSample const& exc) {
        EXPECT_EQ(parametersOf(exc.getInfo().getMessage()),
                  (TParameters{{"key", L"a"}, {"fs.getSize(2)", L"6"}, {"1 + 1", L"2"}}));
    }
}

TEST_F(CErrorExcTest, AThrowSiteTakesNoParametersAMessageOrAnException) {
    EXPECT_THROW(ERROR_THROW(TExcSample, Error::msgEndOf, ERROR_PARAMS()), TExcSample);
    EXPECT_THROW(ERROR_THROW(TExcSample, messageOf("text")), TExcSample);
    EXPECT_THROW(ERROR_THROW(TExcSample, messageOf("text"), parameterList("a", "1")), TExcSample);
    EXPECT_THROW(ERROR_THROW(TExcSample, XOtherSample(ERROR_ORIGIN, Error::msgEndOf)), TExcSample);
}

// What the registry was told, by address and as far as it can be compared.
class CAddedInfo : public Error::CExcRegistry::CObserver {
  public:
    void exceptionAdded(Error::CExcImplementation const*, Error::CInfo const& info) const override {
        told.push_back(&info);
        texts.push_back(info.getMessage().getString(false));
    }
    void exceptionRemoved(Error::CExcImplementation const*) const override {}

    mutable std::vector<Error::CInfo const*> told;
    mutable std::vector<Strings::string> texts;
};

// The type's name as the compiler has it: ASCII.
template <class T>
Strings::string typeName(T const&) {
    std::string const name = typeid(T).name();
    return Strings::string(name.begin(), name.end());
}

TEST_F(CErrorExcTest, AWrapperHasTheInnerTextAsAParameterAndTheInnerParameters) {
    XOtherSample const inner("/build/I", 1, "g()", "", "", Error::msgEndOf,
                             Error::buildNamedParameter("types", "files") +
                                 Error::buildNamedParameter("n", 2));
    XSample const outer = sample(inner);
    expectSample(outer, L"\"@(__msg__)\"",
                 {{"__msg__", L"End of @(types)"},
                  {"__type__", typeName(inner)},
                  {"types", L"files"},
                  {"n", L"2"}});
    EXPECT_EQ(outer.getInfo().getMessage().getString(true), L"\"End of files\"");
}

TEST_F(CErrorExcTest, AWrapperNamesTheTypeThatWasRaisedAlsoBehindALevel) {
    XOtherSample const inner("/build/I", 1, "g()", "", "", Error::msgEndOf);
    Error::CException const& level = inner;
    XSample const outer = sample(level);
    EXPECT_EQ(TestSupport::parameterOf(outer.getInfo().getMessage(), "__type__"), typeName(inner));
}

TEST_F(CErrorExcTest, AWrapperTakesTheInnerTextAsItStands) {
    XOtherSample const inner("/build/I", 1, "g()", "", "", Error::msgEndOf,
                             Error::buildNamedParameter("types", "files"));
    inner.getInfo().getMessage().insertParameters(false);
    EXPECT_EQ(TestSupport::parameterOf(sample(inner).getInfo().getMessage(), "__msg__"),
              L"End of files");
}

TEST_F(CErrorExcTest, AWrapperInheritsTheSeverity) {
    for (Error::ESeverity const severity : {Error::SevDebug, Error::SevWarn, Error::SevFatal}) {
        TestSupport::XSampleOfSeverity const inner(severity, messageOf("text"));
        XOtherSample const outer("/build/O", 1, "h()", "", "", inner);
        EXPECT_EQ(outer.getInfo().getSeverity(), severity);
        EXPECT_EQ(sample(outer).getInfo().getSeverity(), severity);
    }
}

TEST_F(CErrorExcTest, AWrapperStartsWithoutATrace) {
    XSample inner = sample(Error::msgDuplicate);
    inner.getStackInfo().add(Error::CStackInfo("/build/B", 1, 2, "f()", "", ""));
    XSample const outer = sample(inner);
    EXPECT_EQ(outer.getStackInfo().begin(), outer.getStackInfo().end());
    EXPECT_NE(inner.getStackInfo().begin(), inner.getStackInfo().end());
}

TEST_F(CErrorExcTest, AWrapperTellsTheRegistryWhatTheInnerExceptionSays) {
    CAddedInfo const observer;
    TestSupport::CRegisteredObserver const registered(observer);
    XOtherSample const inner("/build/I", 1, "g()", "", "", Error::msgDuplicate);
    observer.told.clear();
    observer.texts.clear();
    XSample const outer = sample(inner);
    EXPECT_EQ(observer.told, (std::vector<Error::CInfo const*>{&inner.getInfo()}));
    EXPECT_EQ(observer.texts, (std::vector<Strings::string>{L"Duplicate object exists"}));
}

TEST_F(CErrorExcTest, AWrapperMayAddParameters) {
    class XWrapper : public Error::Detail::CExcImplBase<TExcSample, Error::CExcImplementation> {
      public:
        explicit XWrapper(Error::CException const& inner)
            : CExcImplBase(TestSupport::sampleOrigin(), inner, parameterList("more", "m")) {}
    };
    XOtherSample const inner("/build/I", 1, "g()", "", "", Error::msgEndOf,
                             Error::buildNamedParameter("types", "files"));
    TParameters const parameters = parametersOf(XWrapper(inner).getInfo().getMessage());
    ASSERT_EQ(parameters.size(), 4U);
    EXPECT_EQ(parameters[2].first, "types");
    EXPECT_EQ(parameters[3], (TParameters::value_type{"more", L"m"}));
}

TEST_F(CErrorExcTest, ACopyIsAnExceptionOfItsOwnToTheRegistry) {
    XSample original = sample(Error::msgEndOf, Error::buildNamedParameter("types", "files"));
    original.getStackInfo().add(Error::CStackInfo("/build/B", 1, 2, "f()", "", ""));
    {
        XSample const copy(original);
        EXPECT_EQ(TestSupport::liveExceptions(),
                  (std::vector<Error::CExcImplementation const*>{&original, &copy}));
        EXPECT_STREQ(copy.getExcName(), "Sample");
        EXPECT_EQ(copy.getInfo().getMessage().getString(true), L"End of files");
        ASSERT_NE(copy.getStackInfo().begin(), copy.getStackInfo().end());
        EXPECT_EQ(copy.getStackInfo().begin()->getLineEnd(), 2U);
        EXPECT_EQ(original.getInfo().getMessage().getString(false), L"End of @(types)");
    }
    EXPECT_EQ(TestSupport::liveExceptions(),
              (std::vector<Error::CExcImplementation const*>{&original}));
}

TEST_F(CErrorExcTest, AThrownCopyKeepsTheRegistryBalanced) {
    XSample const original = sample(Error::msgDuplicate);
    try {
        throw original;
    } catch (TExcSample const& exc) {
        EXPECT_NE(&exc, &static_cast<TExcSample const&>(original));
        EXPECT_EQ(TestSupport::liveExceptions().size(), 2U);
    }
    EXPECT_EQ(TestSupport::liveExceptions().size(), 1U);
}

TEST_F(CErrorExcTest, AnExceptionIsKnownBeforeItIsThrownAndUnknownOnceItIsGone) {
    try {
        throw sample(Error::msgDuplicate);
    } catch (Error::CExcImplementation const& exc) {
        EXPECT_EQ(TestSupport::liveExceptions(),
                  (std::vector<Error::CExcImplementation const*>{&exc}));
    }
    EXPECT_TRUE(TestSupport::liveExceptions().empty());
}

// A value that can't be turned into text.
class CUncastable {};

std::wostream& operator<<(std::wostream& stream, CUncastable const&) {
    stream.setstate(std::ios_base::failbit);
    return stream;
}

TEST_F(CErrorExcTest, AValueThatIsNoTextReplacesTheExceptionInTheMaking) {
    try {
        ERROR_THROW(TExcSample, Error::msgEndOf,
                    Error::buildNamedParameter("types", CUncastable()));
    } catch (Error::CException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "StreamCast");
        EXPECT_EQ(TestSupport::liveExceptions().size(), 1U);
    }
}

} // namespace
