// The check that all reading of dates and times goes through.

#include "2System/Time/_Imp/TimeInput.h"

#include "2System/Time/TimeFailure.h"
#include "support/Place.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <ios>
#include <sstream>
#include <string>

namespace {

using TestSupport::TParameters;
using Time::Detail::checkInputStream;
using TimeTest::badStream;
using TimeTest::CTimeFailure;
using TimeTest::timeFailureOf;

using CTimeInputTest = TestSupport::CErrorTest;

constexpr std::ios_base::iostate bad = std::ios_base::badbit;
constexpr std::ios_base::iostate eof = std::ios_base::eofbit;
constexpr std::ios_base::iostate fail = std::ios_base::failbit;

Error::COrigin origin() {
    return Error::COrigin("/src/2System/Time/A.cpp", 118, "int f(int)", "Apr 29 2021", "08:35:23");
}

template <class TStream>
CTimeFailure checked(std::ios_base::iostate state) {
    TStream stream;
    stream.setstate(state);
    CTimeFailure const failure =
        timeFailureOf([&] { checkInputStream(stream, "issMonth", origin()); });
    EXPECT_EQ(stream.rdstate(), state);
    return failure;
}

template <class TStream>
void expectTheStatesToTell() {
    EXPECT_EQ(checked<TStream>(std::ios_base::goodbit), CTimeFailure());
    EXPECT_EQ(checked<TStream>(eof), CTimeFailure());
    EXPECT_EQ(checked<TStream>(fail), badStream(L"issMonth", 4));
    EXPECT_EQ(checked<TStream>(bad), badStream(L"issMonth", 1));
    EXPECT_EQ(checked<TStream>(eof | fail), badStream(L"issMonth", 6));
    EXPECT_EQ(checked<TStream>(eof | bad), badStream(L"issMonth", 3));
    EXPECT_EQ(checked<TStream>(eof | fail | bad), badStream(L"issMonth", 7));
}

TEST_F(CTimeInputTest, TheStateTellsTheReason) {
    expectTheStatesToTell<std::istringstream>();
    expectTheStatesToTell<std::wistringstream>();
}

template <class TMakeMessage>
CTimeFailure checkedWith(std::ios_base::iostate state, TMakeMessage const& makeMessage) {
    std::istringstream stream;
    stream.setstate(state);
    return timeFailureOf([&] { checkInputStream(stream, "iss", origin(), makeMessage); });
}

TEST_F(CTimeInputTest, AMessageThatHasAReasonKeepsIt) {
    auto const makeMessage = [] {
        std::string const type = "PDF date";
        std::string const key = "D:x";
        std::string const reason = "Invalid format";
        return Error::CMessage(
            Error::msgWrongArgument,
            ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key), ERROR_PARAM(reason)));
    };
    EXPECT_EQ(checkedWith(eof | fail, makeMessage),
              TimeTest::wrongArgument(L"PDF date", L"D:x", L"Invalid format",
                                      {{"stream_name", L"iss"}, {"is.rdstate()", L"6"}}));
}

TEST_F(CTimeInputTest, AMessageWithoutAReasonGetsOneBehindItsOwnParameters) {
    auto const makeMessage = [] {
        std::string const types = "files";
        return Error::CMessage(Error::msgEndOf, ERROR_PARAM(types));
    };
    EXPECT_EQ(checkedWith(eof | fail, makeMessage), (CTimeFailure{L"End of @(types)",
                                                                  {{"types", L"files"},
                                                                   {"reason", L"End of input data"},
                                                                   {"stream_name", L"iss"},
                                                                   {"is.rdstate()", L"6"}},
                                                                  L"End of files"}));
    EXPECT_EQ(checkedWith(fail, makeMessage).parameters[1].second,
              L"Internal error: bad input stream");
}

TEST_F(CTimeInputTest, AMessageIsMadeOnlyForAFailedStream) {
    auto const makeMessage = []() -> Error::CMessage {
        ADD_FAILURE();
        return Error::CMessage(std::string());
    };
    EXPECT_EQ(checkedWith(std::ios_base::goodbit, makeMessage), CTimeFailure());
    EXPECT_EQ(checkedWith(eof, makeMessage), CTimeFailure());
}

TEST_F(CTimeInputTest, TheFailureIsTheCallers) {
    std::istringstream stream;
    stream.setstate(fail);
    try {
        checkInputStream(stream, "is", origin());
        FAIL();
    } catch (Time::TExcTimeDateTime const& exc) {
        EXPECT_EQ(TestSupport::placeOf(exc.getInfo().getOrigin()), TestSupport::placeOf(origin()));
    }
}

} // namespace
