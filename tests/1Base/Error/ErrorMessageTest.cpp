#include "1Base/Error/ErrorMessage.h"

#include "1Base/Error/ErrorMacros.h"
#include "support/ObjectCount.h"

#include <set>
#include <sstream>
#include <string>
#include <type_traits>
#include <utility>

namespace {

using Error::CMessage;
using Error::EMsgID;
using TParameters = Strings::CParameterList<wchar_t>;

static_assert(sizeof(EMsgID) == 4 && std::is_convertible_v<EMsgID, int>);
static_assert(sizeof(CMessage) == sizeof(Strings::CMessage<wchar_t, TParameters>));
static_assert(sizeof(Error::COSErrMessage) == sizeof(CMessage));
static_assert(std::is_copy_constructible_v<CMessage> && std::is_move_constructible_v<CMessage>);
static_assert(std::has_virtual_destructor_v<CMessage::CMessageLoader>);
static_assert(std::is_abstract_v<CMessage::CMessageLoader>);

struct CRow {
    int number;
    EMsgID id;
    wchar_t const* text;
};

// The whole catalogue, apart from the one that is tested.
CRow const catalogue[] = {
    {0, Error::msgStdLibException,
     L"Standard library exception of type '@(CStdLibExceptionType)' caught.\nMessage: "
     L"\"@(CStdLibExceptionWhat)\""},
    {1, Error::msgAssertionFailed, L"Assertion failed in file @(file), line #@(line): \"@(expr)\""},
    {2, Error::msgQuotedMessage, L"\"@(__msg__)\""},
    {3, Error::msgPlainMessage, L"@(__msg__)"},
    {4, Error::msgLoggingStarted, L"Logging started at @(time)"},
    {5, Error::msgLoggingStopped, L"Logging stopped at @(time)"},
    {6, Error::msgEnterScope, L"Entering scope \"@(name)\""},
    {7, Error::msgLeaveScope, L"Leaving scope \"@(name)\""},
    {8, Error::msgEnterFunction, L"Entering function '@(name)'"},
    {9, Error::msgLeaveFunction, L"Leaving function '@(name)'"},
    {10, Error::msgExceptionAdded, L"Exception @@(pExc) added to the exception registry."},
    {11, Error::msgExceptionRemoved, L"Exception @@(pExc) removed from the exception registry."},
    {12, Error::msgParams, L"@(param1)@(param2)@(param3)"},
    {13, Error::msgAccessConflict, L"Access conflict"},
    {14, Error::msgAccessConflictOn, L"Access conflict using @(type) @(key)"},
    {15, Error::msgWrongArgument, L"Argument @(type) @(key) is wrong: @(reason)"},
    {16, Error::msgMissingArgument, L"Argument @(type) is missing"},
    {17, Error::msgBadStream, L"Bad stream"},
    {18, Error::msgBadInputStream, L"Bad input stream"},
    {19, Error::msgBadOutputStream, L"Bad output stream"},
    {20, Error::msgCastFailed, L"Could not cast '@(source)' to '@(target)'"},
    {21, Error::msgConcurrentUpdateOf, L"Concurrent update of @(type) @(key)"},
    {22, Error::msgConcurrentUpdate, L"Concurrent update"},
    {23, Error::msgCouldNot, L"Could not @(process) @(type) @(key): @(reason)"},
    {24, Error::msgDependentExists, L"Dependent object(s) exist(s)"},
    {25, Error::msgDependentMissing, L"Dependent object(s) do(es) not exist"},
    {26, Error::msgDependentExistsOn, L"Object(s) dependent from @(type) @(key) exist(s)"},
    {27, Error::msgDependentMissingOn, L"Dependent object(s) do(es) not exist for @(type) @(key)"},
    {28, Error::msgDuplicate, L"Duplicate object exists"},
    {29, Error::msgDuplicateOf, L"Duplicate object @(type) @(key) exists"},
    {30, Error::msgEndOf, L"End of @(types)"},
    {31, Error::msgResourceExhausted,
     L"Resource @(resource) exhausted. Needed: @(needed) ;available: @(available)!"},
    {33, Error::msgInternalError, L"Internal error: @(error)"},
    {34, Error::msgNoPermission, L"No permission to @(action)"},
    {35, Error::msgNoPermissionOn, L"No permission to @(action) @(type) @(key)"},
    {36, Error::msgNotExpected, L"@(type) @(key) was not expected"},
    {37, Error::msgNotExpectedIn, L"@(type) @(key) was not expected in @(location)"},
    {38, Error::msgNotFound, L"@(type) @(key) was not found"},
    {39, Error::msgNotFoundIn, L"@(type) @(key) was not found in @(location)"},
    {40, Error::msgNotImplemented, L"@(function) has not been implemented yet"},
    {41, Error::msgNotPerformed, L"@(process) not performed due to above errors"},
    {42, Error::msgNotPerformedOn, L"@(process) @(type) @(key) not performed due to above errors"},
    {43, Error::msgSystemNotReady, L"The system is not ready: @(reason)."},
    {44, Error::msgNotNow, L"Not now: @(reason)"},
    {45, Error::msgOSCall, L"Error in OS call @(function): @(error)"},
    {46, Error::msgOSCallArgs, L"Error in OS call @(function)(@(args)): @(error)"},
    {47, Error::msgTooLarge, L"@(value) too large for @(type) (max. @(max))"},
    {48, Error::msgTooSmall, L"@(value) too small for @(type) (min. @(max))"},
    {49, Error::msgModuleError, L"@(module) @(error)"},
};

constexpr int unknownIds[] = {32, 50, -1, 1000000};

EMsgID idOf(int number) {
    return static_cast<EMsgID>(number);
}

std::wstring textOf(EMsgID id, TParameters const& parameters = TParameters()) {
    return CMessage(id, parameters).getString(false);
}

class CErrorMessageTest : public TestSupport::CObjectCountTest {};

TEST_F(CErrorMessageTest, EachTextStandsToTheCharacter) {
    for (CRow const& row : catalogue) {
        EXPECT_EQ(static_cast<int>(row.id), row.number);
        EXPECT_EQ(Error::loadDefaultMessage(row.id), row.text) << row.number;
        EXPECT_EQ(CMessage::loadMessage(row.id), row.text) << row.number;
        EXPECT_EQ(textOf(row.id), row.text) << row.number;
    }
}

TEST_F(CErrorMessageTest, ThereAreFortyNineTextsAndNoneAtThirtyTwo) {
    std::set<int> numbers;
    for (CRow const& row : catalogue)
        numbers.insert(row.number);
    EXPECT_EQ(numbers.size(), 49U);
    for (int number = -100; number < 1000; ++number)
        EXPECT_EQ(Error::loadDefaultMessage(idOf(number)).empty(), numbers.count(number) == 0)
            << number;
}

TEST_F(CErrorMessageTest, AnUnknownIdHasTheEmptyText) {
    for (int const number : unknownIds) {
        EXPECT_EQ(CMessage::loadMessage(idOf(number)), L"");
        EXPECT_EQ(textOf(idOf(number)), L"");
    }
    CMessage const message(idOf(32), ERROR_PARAMS(Error::buildNamedParameter("a", 1)));
    message.insertParameters(true);
    EXPECT_EQ(message.getString(false), L" (a: \"1\")");
}

TEST_F(CErrorMessageTest, AnIdIsStreamedAsItsNumber) {
    std::wostringstream stream;
    stream << Error::msgCastFailed;
    EXPECT_EQ(stream.str(), L"20");
}

TEST_F(CErrorMessageTest, AMessageOfTheCatalogueIsFilledIn) {
    std::string const source = "abc";
    wchar_t const* const target = L"caf\u00E9";
    CMessage const message(Error::msgCastFailed,
                           ERROR_PARAMS(ERROR_PARAM(source), ERROR_PARAM(target)));
    EXPECT_EQ(message.getString(true), L"Could not cast 'abc' to 'caf\u00E9'");
}

TEST_F(CErrorMessageTest, TheLowerLimitIsNamedLikeTheUpperOne) {
    TParameters parameters;
    parameters.add("value", 1);
    parameters.add("type", "byte");
    parameters.add("max", 5);
    EXPECT_EQ(CMessage(Error::msgTooSmall, parameters).getString(true),
              L"1 too small for byte (min. 5)");
}

TEST_F(CErrorMessageTest, TheRegistrysTextsComeOutWithALiteralPlaceholder) {
    TParameters parameters;
    parameters.add("pExc", 7);
    CMessage const message(Error::msgExceptionAdded, parameters);
    EXPECT_EQ(message.getString(true), L"Exception @(pExc) added to the exception registry.");
    EXPECT_EQ(message.getString(true), L"Exception 7 added to the exception registry.");
}

TEST_F(CErrorMessageTest, ANarrowTextIsAMessageWithoutTheCatalogue) {
    CMessage const message(std::string("caf\xC3\xA9 @(a) @@"));
    EXPECT_EQ(message.getString(false), L"caf\u00E9 @(a) @@");
    EXPECT_EQ(message.begin(), message.end());
    EXPECT_EQ(message.getString(true), L"caf\u00E9 @(a) @");
}

TEST_F(CErrorMessageTest, AMessageWithParametersAddedIsANewOne) {
    TParameters first;
    first.add("type", "File");
    TParameters second;
    second.add("key", "a");
    second.add("type", "Folder");
    CMessage const message(Error::msgNotFound, first);
    CMessage const longer = message + second;
    EXPECT_EQ(message.end() - message.begin(), 1);
    ASSERT_EQ(longer.end() - longer.begin(), 3);
    EXPECT_EQ((longer.begin() + 2)->getValue(), L"Folder");
    EXPECT_EQ(message.getString(false), L"@(type) @(key) was not found");
    EXPECT_EQ(longer.getString(true), L"File a was not found");
    EXPECT_EQ((CMessage(longer) + TParameters()).getString(false), L"File a was not found");
}

TEST_F(CErrorMessageTest, CopiesAndMovesKeepTextAndParameters) {
    TParameters parameters;
    parameters.add("error", "a rather long explanation");
    CMessage message(Error::msgInternalError, parameters);
    CMessage const copy(message);
    CMessage const moved(std::move(message));
    EXPECT_EQ(copy.getString(true), L"Internal error: a rather long explanation");
    EXPECT_EQ(moved.getString(false), L"Internal error: @(error)");
    EXPECT_EQ(moved.getString(true), L"Internal error: a rather long explanation");
}

TEST_F(CErrorMessageTest, AMessageWritesItselfExpandedToBothKindsOfStream) {
    TParameters parameters;
    parameters.add("action", std::wstring(L"\u00E9tudier"));
    std::ostringstream narrow;
    std::wostringstream wide;
    narrow << CMessage(Error::msgNoPermission, parameters);
    wide << CMessage(Error::msgNoPermission, parameters);
    EXPECT_EQ(narrow.str(), "No permission to \xC3\xA9tudier");
    EXPECT_EQ(wide.str(), L"No permission to \u00E9tudier");
}

// Overrides the one operation alone.
class CAnswering : public CMessage {
  public:
    using CMessage::CMessage;

  protected:
    std::wstring findMissingParamter(std::string const& name) const override {
        return L"no " + std::wstring(name.begin(), name.end());
    }
};

TEST_F(CErrorMessageTest, ASubclassMayAnswerWhatNoParameterDoes) {
    TParameters parameters;
    parameters.add("module", "FileSys");
    EXPECT_EQ(CAnswering(Error::msgModuleError, parameters).getString(true), L"FileSys no error");
}

TEST_F(CErrorMessageTest, AnErrorOfTheOperatingSystemIsUnknown) {
    Error::COSErrMessage const message(5);
    EXPECT_EQ(message.getString(true), L"unknown error");
    EXPECT_EQ(message.begin(), message.end());
    EXPECT_EQ(Error::COSErrMessage().getString(true), L"unknown error");
    EXPECT_EQ(Error::COSErrMessage(-1).getString<std::string>(false), "unknown error");
}

// Has texts for two ids, one of them outside the catalogue.
class CLoader : public CMessage::CMessageLoader {
  protected:
    std::wstring doLoadMessage(EMsgID const& id) const override {
        if (id == Error::msgNotFound)
            return L"@(key) fehlt";
        return id == idOf(1000000) ? L"eine Million" : L"";
    }
};

class CErrorMessageLoaderTest : public CErrorMessageTest {
  protected:
    void SetUp() override {
        CErrorMessageTest::SetUp();
        before_ = CMessage::setMessageLoader(&loader_);
    }
    void TearDown() override {
        CMessage::setMessageLoader(nullptr);
        CErrorMessageTest::TearDown();
    }

    CLoader const loader_{};
    CMessage::CMessageLoader const* before_ = nullptr;
};

TEST_F(CErrorMessageLoaderTest, NoneIsInstalledAtFirst) {
    EXPECT_EQ(before_, nullptr);
}

TEST_F(CErrorMessageLoaderTest, InstallingReturnsTheOneBefore) {
    CLoader const other{};
    EXPECT_EQ(CMessage::setMessageLoader(&other), &loader_);
    EXPECT_EQ(CMessage::setMessageLoader(nullptr), &other);
    EXPECT_EQ(CMessage::setMessageLoader(&loader_), nullptr);
}

TEST_F(CErrorMessageLoaderTest, ALoaderReplacesTheCatalogueWholly) {
    for (CRow const& row : catalogue) {
        if (row.id == Error::msgNotFound)
            continue;
        EXPECT_EQ(textOf(row.id), L"<#" + std::to_wstring(row.number) + L">?");
    }
    EXPECT_EQ(textOf(Error::msgNotFound), L"@(key) fehlt");
    EXPECT_EQ(CMessage::loadMessage(Error::msgCastFailed), L"<#20>?");
    EXPECT_EQ(loader_.load(idOf(7)), L"<#7>?");
}

TEST_F(CErrorMessageLoaderTest, ALoadedTextIsATemplateLikeAnyOther) {
    TParameters parameters;
    parameters.add("key", "a");
    EXPECT_EQ(CMessage(Error::msgNotFound, parameters).getString(true), L"a fehlt");
}

TEST_F(CErrorMessageLoaderTest, AnUnknownIdIsMarked) {
    EXPECT_EQ(textOf(idOf(32)), L"<#32>?");
    EXPECT_EQ(textOf(idOf(-1)), L"<#-1>?");
    EXPECT_EQ(textOf(idOf(1000000)), L"eine Million");
}

TEST_F(CErrorMessageLoaderTest, TheCatalogueItselfStaysAsItIs) {
    for (CRow const& row : catalogue)
        EXPECT_EQ(Error::loadDefaultMessage(row.id), row.text);
    for (int const number : unknownIds)
        EXPECT_EQ(Error::loadDefaultMessage(idOf(number)), L"");
    CMessage::setMessageLoader(nullptr);
    EXPECT_EQ(textOf(Error::msgNotFound), L"@(type) @(key) was not found");
}

TEST_F(CErrorMessageLoaderTest, TheTextOfAnOperatingSystemErrorIsNotLoaded) {
    EXPECT_EQ(Error::COSErrMessage(5).getString(true), L"unknown error");
}

// A message that is made by the static initialiser of another file finds the catalogue filled.
std::wstring const madeAtStart = textOf(Error::msgModuleError);

TEST_F(CErrorMessageTest, TheCatalogueIsThereBeforeAnythingCanAsk) {
    EXPECT_EQ(madeAtStart, L"@(module) @(error)");
}

} // namespace
