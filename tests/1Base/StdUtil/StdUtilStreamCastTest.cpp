#include "1Base/StdUtil/StdUtilStreamCast.h"

#include "1Base/StdUtil/StdUtilCastFailure.h"
#include "support/ObjectCount.h"

#include <boost/thread/thread.hpp>

#include <cwchar>
#include <limits>
#include <ostream>
#include <sstream>
#include <string>
#include <thread>
#include <typeinfo>
#include <vector>

using StdUtilTest::CCastFailure;

extern "C" {
[[noreturn]] void __real__ZN7StdUtil6Detail20throwStreamCastErrorEPKcjS2_S2_S2_S2_S2_(
    char const*, unsigned int, char const*, char const*, char const*, char const*, char const*);
[[noreturn]] void __wrap__ZN7StdUtil6Detail20throwStreamCastErrorEPKcjS2_S2_S2_S2_S2_(
    char const* file, unsigned int line, char const* func, char const* date, char const* time,
    char const* source, char const* target) {
    throw CCastFailure{file, line, func, date, time, source, target};
}
}

namespace Fruit {

enum EFruit { eApple, ePear = 7, eNone = -1 };
enum ESmallFruit : unsigned char { eCherry = 65 };

/// Has an output operator of its own.
enum class EKind { soft };

std::wostream& operator<<(std::wostream& out, EKind) {
    return out << L"soft";
}

struct CBasket {
    int apples;
};

template <class TChar, class TTraits>
std::basic_ostream<TChar, TTraits>& operator<<(std::basic_ostream<TChar, TTraits>& out,
                                               CBasket const& basket) {
    return out << basket.apples << TChar('!');
}

/// Cannot be made, only referred to.
class CTree {
  public:
    virtual ~CTree() = default;
    virtual void writeTo(std::wostream& out) const = 0;
};

class COak : public CTree {
  public:
    void writeTo(std::wostream& out) const override { out << L"oak"; }
};

std::wostream& operator<<(std::wostream& out, CTree const& tree) {
    tree.writeTo(out);
    return out;
}

/// Leaves the given state behind.
struct CSpoiler {
    std::ios_base::iostate state;
};

std::wostream& operator<<(std::wostream& out, CSpoiler const& spoiler) {
    out << L"spoilt";
    out.setstate(spoiler.state);
    return out;
}

struct CThrower {};
struct XFruit {};

std::wostream& operator<<(std::wostream&, CThrower const&) {
    throw XFruit();
}

} // namespace Fruit

namespace {

using StdUtil::stream_cast;

using CStdUtilStreamCastTest = TestSupport::CObjectCountTest;

constexpr char const* accentedBytes = "caf\xC3\xA9";
constexpr wchar_t const* accentedText = L"caf\u00E9";

template <class TSource>
std::wstring streamed(TSource const& source) {
    std::wostringstream out;
    out << source;
    return out.str();
}

template <class TSource>
std::wstring textOf(TSource const& source) {
    return stream_cast<std::wstring>(source);
}

template <class TNumber>
TNumber numberOf(std::wstring const& text) {
    return stream_cast<TNumber>(text);
}

template <class TNumber>
bool isRefused(std::wstring const& text) {
    try {
        numberOf<TNumber>(text);
        return false;
    } catch (CCastFailure const&) {
        return true;
    }
}

// From one kind of text to the wide one.

TEST_F(CStdUtilStreamCastTest, AWideTextIsCopiedWithoutAStream) {
    long const objectsBefore = TestSupport::objectsMade();
    EXPECT_EQ(textOf(std::wstring(accentedText)), accentedText);
    // A stream buffer takes this element for the end of input and drops it.
    std::wstring const endOfFile(1, static_cast<wchar_t>(std::char_traits<wchar_t>::eof()));
    EXPECT_EQ(textOf(endOfFile), endOfFile);
    EXPECT_EQ(textOf(std::wstring(L"a\0b", 3)), std::wstring(L"a\0b", 3));
    EXPECT_EQ(TestSupport::objectsMade(), objectsBefore);
}

TEST_F(CStdUtilStreamCastTest, ANarrowTextIsDecoded) {
    EXPECT_EQ(textOf(std::string(accentedBytes)), accentedText);
    EXPECT_EQ(textOf(std::string("a\0b", 3)), std::wstring(L"a\0b", 3));
    EXPECT_EQ(textOf(std::string()), L"");
}

TEST_F(CStdUtilStreamCastTest, APointerToCharactersIsDecoded) {
    char buffer[] = "caf\xC3\xA9\0rest";
    EXPECT_EQ((stream_cast<std::wstring, char const*>(buffer)), accentedText);
    EXPECT_EQ((stream_cast<std::wstring, char*>(buffer)), accentedText);
    char* const constant = buffer;
    EXPECT_EQ(textOf(constant), accentedText);
}

TEST_F(CStdUtilStreamCastTest, APointerToWideCharactersIsAText) {
    wchar_t buffer[] = L"caf\u00E9\0rest";
    EXPECT_EQ((stream_cast<std::wstring, wchar_t const*>(buffer)), accentedText);
    EXPECT_EQ((stream_cast<std::wstring, wchar_t*>(buffer)), accentedText);
    wchar_t* const constant = buffer;
    EXPECT_EQ(textOf(constant), accentedText);
}

TEST_F(CStdUtilStreamCastTest, MalformedBytesFailAsTheirConversionDoes) {
    // No CCastFailure: the failure is the conversion's own.
    EXPECT_ANY_THROW(try { textOf(std::string("\xC3")); } catch (CCastFailure const&){});
    char const* const pointer = "a\xFF";
    EXPECT_ANY_THROW(try { textOf(pointer); } catch (CCastFailure const&){});
}

// Arrays are no texts of a kind: their bytes are widened one by one.

TEST_F(CStdUtilStreamCastTest, AnArrayIsWidenedByteByByte) {
    long const objectsBefore = TestSupport::objectsMade();
    EXPECT_EQ(textOf("plain"), L"plain");
    EXPECT_EQ(textOf(""), L"");
    char const accented[] = "caf\xC3\xA9";
    EXPECT_EQ(textOf(accented), streamed(accented));
    EXPECT_NE(textOf(accented), accentedText);
    EXPECT_EQ(TestSupport::objectsMade(), objectsBefore);
}

TEST_F(CStdUtilStreamCastTest, EachByteOfAnArrayComesOutAsTheStreamWidensIt) {
    for (int byte = 1; byte < 256; ++byte) {
        char const bytes[] = {'a', static_cast<char>(byte), 'b', 0};
        EXPECT_EQ(textOf(bytes), streamed(bytes)) << byte;
    }
}

TEST_F(CStdUtilStreamCastTest, AnArrayEndsAtItsFirstZero) {
    EXPECT_EQ(textOf("ab\0cd"), L"ab");
    char buffer[8] = "xyz";
    EXPECT_EQ(textOf(buffer), L"xyz");
    EXPECT_EQ(textOf(L"caf\u00E9\0rest"), accentedText);
}

// Values through the stream.

TEST_F(CStdUtilStreamCastTest, ACharacterIsOneElement) {
    EXPECT_EQ(textOf('A'), L"A");
    EXPECT_EQ(textOf('\0'), std::wstring(1, L'\0'));
    EXPECT_EQ(textOf(L'A'), L"A");
    EXPECT_EQ(textOf(L'\u00E9'), L"\u00E9");
    EXPECT_EQ(textOf(L'\U0001F600'), L"\U0001F600");
    for (int byte = 0; byte < 256; ++byte)
        EXPECT_EQ(textOf(static_cast<char>(byte)), streamed(static_cast<char>(byte))) << byte;
}

TEST_F(CStdUtilStreamCastTest, ATruthValueIsADigit) {
    EXPECT_EQ(textOf(true), L"1");
    EXPECT_EQ(textOf(false), L"0");
}

TEST_F(CStdUtilStreamCastTest, ANumberIsItsDecimalDigits) {
    EXPECT_EQ(textOf(0), L"0");
    EXPECT_EQ(textOf(-7), L"-7");
    EXPECT_EQ(textOf(1234567), L"1234567");
    EXPECT_EQ(textOf(std::numeric_limits<int>::max()), L"2147483647");
    EXPECT_EQ(textOf(std::numeric_limits<int>::min()), L"-2147483648");
    EXPECT_EQ(textOf(4294967295U), L"4294967295");
    EXPECT_EQ(textOf(static_cast<unsigned short>(65535)), L"65535");
    EXPECT_EQ(textOf(static_cast<short>(-32768)), L"-32768");
    EXPECT_EQ(textOf(std::numeric_limits<long>::min()), L"-9223372036854775808");
    EXPECT_EQ(textOf(std::numeric_limits<long long>::max()), L"9223372036854775807");
    EXPECT_EQ(textOf(std::numeric_limits<unsigned long>::max()), L"18446744073709551615");
    EXPECT_EQ(textOf(std::numeric_limits<unsigned long long>::max()), L"18446744073709551615");
}

TEST_F(CStdUtilStreamCastTest, AnUnsignedByteIsANumberAndNoCharacter) {
    EXPECT_EQ(textOf(static_cast<unsigned char>(65)), L"65");
    EXPECT_EQ(textOf(static_cast<unsigned char>(255)), L"255");
    EXPECT_EQ(textOf(static_cast<signed char>(-128)), L"-128");
}

TEST_F(CStdUtilStreamCastTest, AnEnumeratorIsItsNumber) {
    EXPECT_EQ(textOf(Fruit::eApple), L"0");
    EXPECT_EQ(textOf(Fruit::ePear), L"7");
    EXPECT_EQ(textOf(Fruit::eNone), L"-1");
    EXPECT_EQ(textOf(Fruit::eCherry), L"65");
}

TEST_F(CStdUtilStreamCastTest, AClassOrEnumerationIsWhatItsOwnOperatorWrites) {
    EXPECT_EQ(textOf(Fruit::EKind::soft), L"soft");
    EXPECT_EQ(textOf(Fruit::CBasket{12}), L"12!");
    Fruit::COak const oak;
    EXPECT_EQ((stream_cast<std::wstring, Fruit::CTree>(oak)), L"oak");
}

TEST_F(CStdUtilStreamCastTest, AThreadIsWhatItsLibraryWrites) {
    boost::thread::id const id = boost::this_thread::get_id();
    EXPECT_EQ(textOf(id), streamed(id));
    EXPECT_FALSE(textOf(id).empty());
}

TEST_F(CStdUtilStreamCastTest, AFailedStreamIsAFailedCast) {
    EXPECT_THROW(textOf(Fruit::CSpoiler{std::ios_base::failbit}), CCastFailure);
    EXPECT_THROW(textOf(Fruit::CSpoiler{std::ios_base::badbit}), CCastFailure);
    EXPECT_THROW(textOf(Fruit::CSpoiler{std::ios_base::failbit | std::ios_base::eofbit}),
                 CCastFailure);
}

TEST_F(CStdUtilStreamCastTest, TheEndOfAStreamAloneIsNoFailure) {
    EXPECT_EQ(textOf(Fruit::CSpoiler{std::ios_base::eofbit}), L"spoilt");
    EXPECT_EQ(textOf(Fruit::CSpoiler{std::ios_base::goodbit}), L"spoilt");
}

TEST_F(CStdUtilStreamCastTest, AnExceptionOfAnOperatorPasses) {
    EXPECT_THROW(textOf(Fruit::CThrower()), Fruit::XFruit);
}

TEST_F(CStdUtilStreamCastTest, AFailedCastToTextNamesTheRawTypesAndTheCaster) {
    try {
        textOf(Fruit::CSpoiler{std::ios_base::failbit});
        FAIL() << "nothing was thrown";
    } catch (CCastFailure const& failure) {
        EXPECT_EQ(failure.source, typeid(Fruit::CSpoiler).name());
        EXPECT_EQ(failure.target, typeid(std::wstring).name());
        EXPECT_NE(failure.file.find("StdUtilStreamCast.h"), std::string::npos);
        EXPECT_GT(failure.line, 0U);
        EXPECT_NE(failure.func.find("CStreamCaster"), std::string::npos);
        EXPECT_NE(failure.func.find("cast"), std::string::npos);
        EXPECT_EQ(failure.date.size(), std::string("Jan  1 2000").size());
        EXPECT_EQ(failure.time.size(), std::string("00:00:00").size());
    }
}

// Numbers from text.

TEST_F(CStdUtilStreamCastTest, ANumberIsReadFromItsDigits) {
    EXPECT_EQ(numberOf<int>(L"2147483647"), 2147483647);
    EXPECT_EQ(numberOf<int>(L"-2147483648"), std::numeric_limits<int>::min());
    EXPECT_EQ(numberOf<unsigned int>(L"4294967295"), 4294967295U);
    EXPECT_EQ(numberOf<unsigned short>(L"65535"), 65535);
    EXPECT_EQ(numberOf<long>(L"9223372036854775807"), std::numeric_limits<long>::max());
    EXPECT_EQ(numberOf<long>(L"-9223372036854775808"), std::numeric_limits<long>::min());
    EXPECT_EQ(numberOf<int>(L"0007"), 7);
    EXPECT_EQ(numberOf<int>(L"000000000000000000000000000000000007"), 7);
    EXPECT_EQ(numberOf<int>(L"+5"), 5);
    EXPECT_EQ(numberOf<int>(L"-0"), 0);
}

TEST_F(CStdUtilStreamCastTest, WhiteSpaceInFrontIsSkipped) {
    EXPECT_EQ(numberOf<int>(L" 7"), 7);
    EXPECT_EQ(numberOf<int>(L" \t\n\v\f\r-7"), -7);
}

TEST_F(CStdUtilStreamCastTest, WhatFollowsTheNumberIsLeftAlone) {
    EXPECT_EQ(numberOf<int>(L"12abc"), 12);
    EXPECT_EQ(numberOf<int>(L"12 34"), 12);
    EXPECT_EQ(numberOf<int>(L"1,000"), 1);
    EXPECT_EQ(numberOf<int>(L"1.9"), 1);
    EXPECT_EQ(numberOf<int>(L"7-"), 7);
    EXPECT_EQ(numberOf<int>(std::wstring(L"1\0"
                                         L"2",
                                         3)),
              1);
}

TEST_F(CStdUtilStreamCastTest, TheBaseIsAlwaysTen) {
    EXPECT_EQ(numberOf<int>(L"0x10"), 0);
    EXPECT_EQ(numberOf<int>(L"010"), 10);
}

TEST_F(CStdUtilStreamCastTest, ATextWithoutANumberIsRefused) {
    for (wchar_t const* const text :
         {L"", L" ", L" \t\n", L"abc", L"-", L"+", L"--5", L"+-5", L"- 5", L".5", L"x1"}) {
        EXPECT_TRUE(isRefused<int>(text)) << std::string(text, text + std::wcslen(text));
        EXPECT_TRUE(isRefused<unsigned int>(text));
        EXPECT_TRUE(isRefused<unsigned short>(text));
        EXPECT_TRUE(isRefused<long>(text));
    }
    EXPECT_TRUE(isRefused<int>(std::wstring(L"\0"
                                            L"1",
                                            2)));
}

TEST_F(CStdUtilStreamCastTest, DigitsOfOtherScriptsAreNone) {
    EXPECT_TRUE(isRefused<int>(L"\u0661\u0662"));
    EXPECT_TRUE(isRefused<int>(L"\uFF11\uFF12"));
    EXPECT_EQ(numberOf<int>(L"1\u0662"), 1);
}

TEST_F(CStdUtilStreamCastTest, ANumberBeyondItsTypeIsRefused) {
    EXPECT_TRUE(isRefused<int>(L"2147483648"));
    EXPECT_TRUE(isRefused<int>(L"-2147483649"));
    EXPECT_TRUE(isRefused<unsigned int>(L"4294967296"));
    EXPECT_TRUE(isRefused<unsigned short>(L"65536"));
    EXPECT_TRUE(isRefused<unsigned short>(L"99999999999999999999999"));
    EXPECT_TRUE(isRefused<long>(L"9223372036854775808"));
    EXPECT_TRUE(isRefused<long>(L"-9223372036854775809"));
    EXPECT_TRUE(isRefused<long>(L"18446744073709551617"));
}

TEST_F(CStdUtilStreamCastTest, ANegativeNumberWrapsIntoAnUnsignedTypeAsTheStreamHasIt) {
    EXPECT_EQ(numberOf<unsigned int>(L"-1"), 4294967295U);
    EXPECT_EQ(numberOf<unsigned short>(L"-1"), 65535);
    EXPECT_EQ(numberOf<unsigned short>(L"-65535"), 1);
    EXPECT_TRUE(isRefused<unsigned short>(L"-65536"));
    EXPECT_TRUE(isRefused<unsigned int>(L"-4294967296"));
}

TEST_F(CStdUtilStreamCastTest, AFailedCastToANumberNamesTheRawTypesAndTheCaster) {
    try {
        numberOf<int>(L"abc");
        FAIL() << "nothing was thrown";
    } catch (CCastFailure const& failure) {
        EXPECT_EQ(failure.source, typeid(std::wstring).name());
        EXPECT_EQ(failure.target, "i");
        EXPECT_NE(failure.file.find("StdUtilStreamCast.h"), std::string::npos);
        EXPECT_NE(failure.func.find("CStreamCaster"), std::string::npos);
    }
}

TEST_F(CStdUtilStreamCastTest, TheFailureItselfNeverReturns) {
    EXPECT_ANY_THROW(__real__ZN7StdUtil6Detail20throwStreamCastErrorEPKcjS2_S2_S2_S2_S2_(
        "file", 1, "func", "date", "time", "source", "target"));
}

TEST_F(CStdUtilStreamCastTest, FurtherPairsFollowTheSameTwoSchemes) {
    EXPECT_EQ(textOf(0.5), L"0.5");
    EXPECT_EQ(numberOf<double>(L" 2.5kg"), 2.5);
    EXPECT_EQ(stream_cast<std::string>(42), "42");
    EXPECT_EQ(stream_cast<int>(std::string("42")), 42);
    EXPECT_EQ(numberOf<short>(L"-32768"), -32768);
    EXPECT_EQ(numberOf<unsigned long>(L"18446744073709551615"),
              std::numeric_limits<unsigned long>::max());
}

TEST_F(CStdUtilStreamCastTest, CastsRunOnSeveralThreadsAtOnce) {
    std::vector<std::thread> threads;
    std::vector<int> wrong(4);
    for (int& count : wrong) {
        threads.emplace_back([&count] {
            for (int number = -2000; number < 2000; ++number)
                count +=
                    numberOf<int>(textOf(number)) != number || textOf(Fruit::CBasket{1}) != L"1!";
        });
    }
    for (std::thread& thread : threads)
        thread.join();
    EXPECT_EQ(wrong, std::vector<int>(4));
}

} // namespace
