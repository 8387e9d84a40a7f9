// What guarded blocks make of what passes them.

#include "1Base/Error/Error.h"

#include "support/MessageParameters.h"
#include "support/Place.h"
#include "support/Registry.h"
#include "support/SampleException.h"

#include <gtest/gtest.h>

#include <exception>
#include <new>
#include <ostream>
#include <stdexcept>
#include <string>
#include <typeinfo>
#include <vector>

namespace {

using TestSupport::placeOf;
using TestSupport::TExcSample;
using TestSupport::TParameters;
using TestSupport::TPlace;
using TestSupport::XSample;

using CErrorExcBlockTest = TestSupport::CErrorTest;

// Two functions as the system writes them, one calling the other.

char const* innerFunc = nullptr;
char const* outerFunc = nullptr;

constexpr unsigned int innerBegin = __LINE__ + 3;
template <class TRaise>
void inner(TRaise const& raise) {
    ERROR_BLOCK_BEGIN
    innerFunc = __PRETTY_FUNCTION__;
    raise();
    ERROR_BLOCK_END
}
constexpr unsigned int innerEnd = __LINE__ - 2;

constexpr unsigned int outerBegin = __LINE__ + 3;
template <class TRaise>
void outer(TRaise const& raise) {
    ERROR_BLOCK_BEGIN
    outerFunc = __PRETTY_FUNCTION__;
    inner(raise);
    ERROR_BLOCK_END
}
constexpr unsigned int outerEnd = __LINE__ - 2;

struct CBlock {
    char const* func;
    unsigned int begin;
    unsigned int end;
};

void expectTrace(Error::CException const& exc, std::vector<CBlock> const& blocks) {
    auto entry = exc.getStackInfo().begin();
    for (CBlock const& block : blocks) {
        ASSERT_NE(entry, exc.getStackInfo().end());
        EXPECT_STREQ(entry->getFile(), __FILE__);
        EXPECT_EQ(entry->getLineBegin(), block.begin);
        EXPECT_EQ(entry->getLineEnd(), block.end);
        EXPECT_STREQ(entry->getFunc(), block.func);
        EXPECT_STREQ(entry->getDate(), __DATE__);
        EXPECT_STREQ(entry->getTime(), __TIME__);
        ++entry;
    }
    EXPECT_EQ(entry, exc.getStackInfo().end());
}

TEST_F(CErrorExcBlockTest, TheBlocksThatAnExceptionPassesStandInItsTrace) {
    try {
        outer([] { ERROR_THROW(TExcSample, Error::msgDuplicate); });
        FAIL();
    } catch (TExcSample const& exc) {
        expectTrace(exc, {{innerFunc, innerBegin, innerEnd}, {outerFunc, outerBegin, outerEnd}});
    }
}

TEST_F(CErrorExcBlockTest, NestedBlocksOfOneFunctionStandOneByOne) {
    unsigned int lines[4] = {};
    try {
        lines[0] = __LINE__ + 1;
        ERROR_BLOCK_BEGIN
        lines[1] = __LINE__ + 1;
        ERROR_BLOCK_BEGIN
        lines[2] = __LINE__ + 3;
        lines[3] = __LINE__ + 3;
        ERROR_THROW(TExcSample, Error::msgDuplicate);
        ERROR_BLOCK_END
        ERROR_BLOCK_END
    } catch (TExcSample const& exc) {
        char const* const func = __PRETTY_FUNCTION__;
        expectTrace(exc, {{func, lines[1], lines[2]}, {func, lines[0], lines[3]}});
    }
    EXPECT_NE(lines[3], 0U);
}

TEST_F(CErrorExcBlockTest, ABlockHandsBackWhatItsBodyReturns) {
    auto const half = [](int value) -> int {
        ERROR_BLOCK_BEGIN
        if (value % 2 != 0)
            ERROR_THROW(TExcSample, Error::msgNotExpected, ERROR_PARAM(value));
        return value / 2;
        ERROR_BLOCK_END
    };
    EXPECT_EQ(half(4), 2);
    EXPECT_THROW(half(5), TExcSample);
}

TEST_F(CErrorExcBlockTest, AnExceptionOfTheFamilyPassesAsTheSameObject) {
    Error::CException const* raised = nullptr;
    try {
        outer([&raised] {
            try {
                ERROR_THROW(TExcSample, Error::msgDuplicate);
            } catch (Error::CException const& exc) {
                raised = &exc;
                throw;
            }
        });
    } catch (Error::CException const& exc) {
        EXPECT_EQ(&exc, raised);
        EXPECT_EQ(TestSupport::liveExceptions().size(), 1U);
    }
    EXPECT_NE(raised, nullptr);
}

TEST_F(CErrorExcBlockTest, AnIntPassesUntouched) {
    try {
        outer([] { throw 7; });
        FAIL();
    } catch (int value) {
        EXPECT_EQ(value, 7);
    }
    EXPECT_TRUE(TestSupport::liveExceptions().empty());
}

Strings::string asciiOf(char const* text) {
    return Strings::string(text, text + std::string(text).size());
}

// The exception that a standard one has become: where, of which type, and what it said.
template <class TExcX>
void expectConverted(Error::CException const& exc, char const* func, unsigned int line,
                     Strings::string const& what, std::type_info const& type) {
    EXPECT_NE(dynamic_cast<Error::XExc<TExcX> const*>(&exc), nullptr);
    Error::CInfo const& info = exc.getInfo();
    EXPECT_EQ(placeOf(info.getOrigin()), TPlace(__FILE__, line, func, __DATE__, __TIME__));
    EXPECT_EQ(info.getSeverity(), Error::SevError);
    EXPECT_EQ(TestSupport::parametersOf(info.getMessage()),
              (TParameters{{"CStdLibExceptionWhat", what},
                           {"CStdLibExceptionType", asciiOf(type.name())}}));
    EXPECT_EQ(info.getMessage().getString(true), L"Standard library exception of type '" +
                                                     asciiOf(type.name()) +
                                                     L"' caught.\nMessage: \"" + what + L"\"");
}

TEST_F(CErrorExcBlockTest, AStandardExceptionBecomesOneOfTheFamily) {
    try {
        outer([] { throw std::runtime_error("caf\xC3\xA9"); });
        FAIL();
    } catch (Error::TExcStdLibException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "StdLibException");
        expectConverted<Error::TExcStdLibException>(exc, innerFunc, innerEnd, L"caf\u00E9",
                                                    typeid(std::runtime_error));
        // The block that converted it has no entry of its own.
        expectTrace(exc, {{outerFunc, outerBegin, outerEnd}});
        EXPECT_EQ(TestSupport::liveExceptions().size(), 1U);
    }
}

TEST_F(CErrorExcBlockTest, AStandardExceptionIsNamedByItsDynamicType) {
    class XOwn : public std::logic_error {
      public:
        using logic_error::logic_error;
    };
    try {
        inner([] { throw XOwn("mine"); });
        FAIL();
    } catch (Error::TExcStdLibException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "StdLibException");
        expectConverted<Error::TExcStdLibException>(exc, innerFunc, innerEnd, L"mine",
                                                    typeid(XOwn));
    }
}

TEST_F(CErrorExcBlockTest, AStandardExceptionIsNotTakenForAFailedAllocation) {
    EXPECT_THROW(inner([] { throw std::runtime_error("x"); }), Error::TExcStdLibException);
    try {
        inner([] { throw std::runtime_error("x"); });
    } catch (Error::TExcBadAllocException const&) {
        FAIL();
    } catch (Error::CException const&) {
    }
}

TEST_F(CErrorExcBlockTest, AFailedAllocationIsOnALevelOfItsOwn) {
    std::bad_alloc const expected;
    try {
        outer([] { throw std::bad_alloc(); });
        FAIL();
    } catch (Error::TExcBadAllocException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "BadAllocException");
        expectConverted<Error::TExcBadAllocException>(
            exc, innerFunc, innerEnd, asciiOf(expected.what()), typeid(std::bad_alloc));
        expectTrace(exc, {{outerFunc, outerBegin, outerEnd}});
    }
    EXPECT_THROW(inner([] { throw std::bad_alloc(); }), Error::TExcStdLibException);
    EXPECT_THROW(inner([] { throw std::bad_array_new_length(); }), Error::TExcBadAllocException);
}

TEST_F(CErrorExcBlockTest, AFamilyMemberThatIsAStandardExceptionTooStaysItself) {
    class XBoth : public XSample, public std::bad_alloc {
      public:
        XBoth() : XSample(ERROR_ORIGIN, Error::msgDuplicate) {}
        XBoth(XBoth const& other) : Error::CException(other), XSample(other), bad_alloc(other) {}
    };
    try {
        outer([] { throw XBoth(); });
        FAIL();
    } catch (XBoth const& exc) {
        expectTrace(exc, {{innerFunc, innerBegin, innerEnd}, {outerFunc, outerBegin, outerEnd}});
    }
}

// The function behind the blocks, called in a handler of any form.

template <class TRaise>
void passOn(TRaise const& raise) {
    try {
        raise();
    } catch (...) {
        Error::Detail::addStackTrace_("/build/B", 7, 9, "int g()", "Jan  1 2020", "00:00:01");
    }
}

TEST_F(CErrorExcBlockTest, ATraceEntryHasTheSixValuesThatWereGiven) {
    try {
        passOn([] { ERROR_THROW(TExcSample, Error::msgDuplicate); });
        FAIL();
    } catch (TExcSample const& exc) {
        ASSERT_EQ(exc.getStackInfo().end() - exc.getStackInfo().begin(), 1);
        Error::CStackInfo const& entry = *exc.getStackInfo().begin();
        EXPECT_STREQ(entry.getFile(), "/build/B");
        EXPECT_EQ(entry.getLineBegin(), 7U);
        EXPECT_EQ(entry.getLineEnd(), 9U);
        EXPECT_STREQ(entry.getFunc(), "int g()");
        EXPECT_STREQ(entry.getDate(), "Jan  1 2020");
        EXPECT_STREQ(entry.getTime(), "00:00:01");
    }
}

template <class TExcX, class XStandard>
void expectConvertedAt(XStandard const& standard) {
    try {
        passOn([&standard] { throw standard; });
        FAIL();
    } catch (TExcX const& exc) {
        EXPECT_EQ(placeOf(exc.getInfo().getOrigin()),
                  TPlace("/build/B", 9, "int g()", "Jan  1 2020", "00:00:01"));
        EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
    }
}

TEST_F(CErrorExcBlockTest, AConvertedExceptionHasTheBlocksLastLine) {
    expectConvertedAt<Error::TExcStdLibException>(std::out_of_range("x"));
    expectConvertedAt<Error::TExcBadAllocException>(std::bad_alloc());
}

TEST_F(CErrorExcBlockTest, WhatIsNoExceptionOfEitherKindGoesOnUnchanged) {
    static std::string const text = "thrown";
    try {
        passOn([] { throw &text; });
        FAIL();
    } catch (std::string const* thrown) {
        EXPECT_EQ(thrown, &text);
    }
    EXPECT_THROW(passOn([] { throw 7; }), int);
    EXPECT_TRUE(TestSupport::liveExceptions().empty());
}

} // namespace
