#include "1Base/Encoding/Encoding.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <atomic>
#include <string>
#include <thread>
#include <vector>

namespace {

using CEncodingConverterTest = TestSupport::CObjectCountTest;

using Encoding::CConverter;
using Encoding::convert;
using Strings::stringUTF16;
using TBytes = std::basic_string<unsigned char>;
using TestSupport::bytesOf;
using TestSupport::conversionFailureOf;
using TestSupport::CPlatformCall;
using TestSupport::CPlatformCalls;
using TestSupport::utf16Of;
using TestSupport::utf8Of;
using TestSupport::wideOf;

// A zero, and a character of each length in each form.
std::u32string const sample = {U'a',   0,       0xE9,    0x915,    0x4E16,
                               0xFFFF, 0x10000, 0x1F600, 0x10FFFF, U'z'};

constexpr char unreadableUTF8[] = "Could not create string with encoding UTF8";
constexpr char unreadableUTF32[] = "Could not create string with encoding UTF32";

// --- the pairs

TEST_F(CEncodingConverterTest, EveryUnicodeKindBecomesEveryOther) {
    EXPECT_EQ(convert<stringUTF16>(utf8Of(sample)), utf16Of(sample));
    EXPECT_EQ(convert<std::string>(utf16Of(sample)), utf8Of(sample));
    EXPECT_EQ(convert<stringUTF16>(wideOf(sample)), utf16Of(sample));
    EXPECT_EQ(convert<Strings::string>(utf16Of(sample)), wideOf(sample));
    EXPECT_EQ(convert<std::string>(wideOf(sample)), utf8Of(sample));
    EXPECT_EQ(convert<Strings::string>(utf8Of(sample)), wideOf(sample));
}

TEST_F(CEncodingConverterTest, BytesAreReadAndWrittenInTheEncodingThatTheCallerNames) {
    using TReader = CConverter<stringUTF16, TBytes>;
    using TWriter = CConverter<TBytes, stringUTF16>;
    stringUTF16 const units = utf16Of(sample);
    auto const* const unitBytes = reinterpret_cast<unsigned char const*>(units.data());
    Strings::string const elements = wideOf(sample);
    auto const* const elementBytes = reinterpret_cast<unsigned char const*>(elements.data());

    TBytes const utf8 = bytesOf(utf8Of(sample));
    EXPECT_EQ(TReader::convert(utf8, Encoding::eseUTF8), units);
    EXPECT_EQ(TWriter::convert(units, Encoding::eseUTF8), utf8);

    TBytes const utf16(unitBytes, units.size() * 2);
    EXPECT_EQ(TReader::convert(utf16, Encoding::eseUTF16), units);
    EXPECT_EQ(TWriter::convert(units, Encoding::eseUTF16), utf16);

    TBytes const utf32(elementBytes, elements.size() * 4);
    EXPECT_EQ(TReader::convert(utf32, Encoding::eseUTF32), units);
    EXPECT_EQ(TWriter::convert(units, Encoding::eseUTF32), utf32);
}

TEST_F(CEncodingConverterTest, AnEncodingWithoutAPlatformValueIsUTF16) {
    stringUTF16 const units = utf16Of(U"caf\u00E9");
    TBytes const bytes(reinterpret_cast<unsigned char const*>(units.data()), units.size() * 2);
    for (unsigned int const number : {10U, 57U, 0xFFFFFFFFU}) {
        auto const encoding = static_cast<Encoding::ESysEncoding>(number);
        EXPECT_EQ((CConverter<stringUTF16, TBytes>::convert(bytes, encoding)), units) << number;
        EXPECT_EQ((CConverter<TBytes, stringUTF16>::convert(units, encoding)), bytes) << number;
    }
}

template <class TString>
void expectItsArgument(TString const& text) {
    CPlatformCalls const calls;
    EXPECT_EQ(&(CConverter<TString, TString>::convert(text)), &text);
    TString const copy = convert<TString>(text);
    EXPECT_EQ(copy, text);
    EXPECT_NE(copy.data(), text.data());
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CEncodingConverterTest, AKindIntoItselfIsTheArgument) {
    expectItsArgument(wideOf(sample));
    expectItsArgument(utf8Of(sample));
    expectItsArgument(utf16Of(sample));
    expectItsArgument(bytesOf("bytes"));
}

TEST_F(CEncodingConverterTest, AKindIntoItselfIsNotEvenLookedAt) {
    std::string const malformed = "\xFF\xC0";
    EXPECT_EQ(convert<std::string>(malformed), malformed);
    Strings::string const surrogate(1, static_cast<wchar_t>(0xD800));
    EXPECT_EQ(convert<Strings::string>(surrogate), surrogate);
}

TEST_F(CEncodingConverterTest, ZeroTerminatedTextsAreStringsOfTheirKind) {
    char const* const narrow = "caf\xC3\xA9";
    wchar_t const* const wide = L"caf\u00E9";
    EXPECT_EQ(convert<Strings::string>(narrow), L"caf\u00E9");
    EXPECT_EQ(convert<stringUTF16>(narrow), utf16Of(u"caf\u00E9"));
    EXPECT_EQ(convert<std::string>(narrow), "caf\xC3\xA9");
    EXPECT_EQ(convert<std::string>(wide), "caf\xC3\xA9");
    EXPECT_EQ(convert<stringUTF16>(wide), utf16Of(u"caf\u00E9"));
    EXPECT_EQ(convert<Strings::string>(wide), L"caf\u00E9");
    EXPECT_EQ((convert<Strings::string, char const*>(narrow)), L"caf\u00E9");
    EXPECT_EQ((convert<std::string, wchar_t const*>(wide)), "caf\xC3\xA9");
}

TEST_F(CEncodingConverterTest, ArraysAndPointersToVariablesAreZeroTerminatedTexts) {
    char narrow[] = "abc\0def";
    wchar_t wide[] = L"abc\0def";
    char* const narrowPointer = narrow;
    wchar_t* const widePointer = wide;
    EXPECT_EQ(convert<Strings::string>(narrow), L"abc");
    EXPECT_EQ(convert<std::string>(wide), "abc");
    EXPECT_EQ(convert<Strings::string>(narrowPointer), L"abc");
    EXPECT_EQ(convert<stringUTF16>(widePointer), utf16Of(u"abc"));
    EXPECT_EQ(convert<stringUTF16>("literal"), utf16Of(u"literal"));
    EXPECT_EQ(convert<std::string>(L"literal"), "literal");
}

template <class TTarget, class TSource>
std::string recursionOf(TSource const& source) {
    return TestSupport::failedCheckOf([&source] { convert<TTarget>(source); }, "reason");
}

TEST_F(CEncodingConverterTest, APairWithoutAConverterOfItsOwnReportsARecursion) {
    std::string const text = "Infinite recursion in 'Encoding::CConverter<T,T>::convert()'!";
    EXPECT_EQ(recursionOf<Strings::string>(bytesOf("a")), text);
    EXPECT_EQ(recursionOf<std::string>(bytesOf("a")), text);
    EXPECT_EQ(recursionOf<TBytes>(std::string("a")), text);
    EXPECT_EQ(recursionOf<Strings::string>(std::basic_string<short>(1, short{'a'})), text);
    EXPECT_EQ(recursionOf<std::basic_string<short>>(utf16Of(u"a")), text);
    EXPECT_EQ(recursionOf<Strings::string>(1), text);
}

// --- what comes through, and what does not

TEST_F(CEncodingConverterTest, AZeroInsideATextPasses) {
    std::u32string const text = {0, U'a', 0, 0, U'b', 0};
    EXPECT_EQ(convert<std::string>(wideOf(text)), utf8Of(text));
    EXPECT_EQ(convert<Strings::string>(utf8Of(text)), wideOf(text));
    EXPECT_EQ(convert<stringUTF16>(utf8Of(text)), utf16Of(text));
    EXPECT_EQ(convert<std::string>(utf16Of(text)), utf8Of(text));
    EXPECT_EQ(convert<Strings::string>(std::string(1, '\0')), Strings::string(1, L'\0'));
}

TEST_F(CEncodingConverterTest, OneLeadingMarkOfUTF8GetsLost) {
    EXPECT_EQ(convert<Strings::string>("\xEF\xBB\xBF"
                                       "a"),
              L"a");
    EXPECT_EQ(convert<Strings::string>("\xEF\xBB\xBF\xEF\xBB\xBF"
                                       "a"),
              L"\uFEFFa");
    EXPECT_EQ(convert<Strings::string>("a\xEF\xBB\xBF"), L"a\uFEFF");
}

TEST_F(CEncodingConverterTest, AMarkInTheOtherKindsStays) {
    std::u32string const text = U"\uFEFFa";
    EXPECT_EQ(convert<stringUTF16>(wideOf(text)), utf16Of(text));
    EXPECT_EQ(convert<Strings::string>(utf16Of(text)), wideOf(text));
    EXPECT_EQ(convert<std::string>(utf16Of(text)), utf8Of(text));
    EXPECT_EQ(convert<std::string>(wideOf(text)), utf8Of(text));
    EXPECT_EQ(convert<stringUTF16>(wideOf(U"\uFEFF")), utf16Of(U"\uFEFF"));
}

TEST_F(CEncodingConverterTest, AnUnpairedSurrogateLeavesUTF16AsAQuestionMark) {
    stringUTF16 const units = utf16Of(std::u16string{0xDC00, u'a', 0xD800, 0xD83D, 0xDE00, 0xD800});
    EXPECT_EQ(convert<Strings::string>(units), L"?a?\U0001F600?");
}

// --- invalid input

TEST_F(CEncodingConverterTest, EveryClassOfInvalidUTF8Fails) {
    std::vector<std::string> const invalid = {"\xC0\x80",
                                              "\xC1\xBF", // overlong, two bytes
                                              "\xE0\x80\x80",
                                              "\xE0\x9F\xBF", // three
                                              "\xF0\x80\x80\x80",
                                              "\xF0\x8F\xBF\xBF", // four
                                              "\xED\xA0\x80",
                                              "\xED\xBF\xBF",
                                              "\xED\xA0\xBD\xED\xB8\x80", // surrogates
                                              "\xF4\x90\x80\x80",         // above 10FFFF
                                              "\xC3",
                                              "\xE4",
                                              "\xE4\xB8",
                                              "\xF0",
                                              "\xF0\x9F",
                                              "\xF0\x9F\x98", // cut off
                                              "\xC3z",
                                              "\xE4\xB8z",
                                              "\xF0\x9F\x98z", // broken off
                                              "\x80",
                                              "\xBF",
                                              "\xA9",
                                              "\xC3\xA9\x80", // stray continuations
                                              "\xF5\x80\x80\x80",
                                              "\xF7\xBF\xBF\xBF",
                                              "\xF8\x88\x80\x80\x80",
                                              "\xFC\x84\x80\x80\x80\x80",
                                              "\xFE",
                                              "\xFF"};
    TestSupport::CConversionFailure const expected = {"CFStringCreateWithBytes", unreadableUTF8,
                                                      53};
    for (std::string const& bytes : invalid) {
        for (std::string const& text :
             {bytes, "a" + bytes, std::string(31, 'a') + bytes, bytes + std::string(40, 'z'),
              std::string(9000, 'a') + bytes + std::string(9000, 'z')}) {
            EXPECT_EQ(conversionFailureOf([&text] { convert<Strings::string>(text); }), expected)
                << testing::PrintToString(bytes);
            EXPECT_EQ(conversionFailureOf([&text] { convert<stringUTF16>(text); }), expected);
            EXPECT_EQ(conversionFailureOf([&text] { convert<Strings::string>(text.c_str()); }),
                      expected);
        }
    }
}

TEST_F(CEncodingConverterTest, AnElementThatIsNoCodePointFails) {
    TestSupport::CConversionFailure const expected = {"CFStringCreateWithBytes", unreadableUTF32,
                                                      55};
    for (unsigned int const element : {0xD800U, 0xDBFFU, 0xDC00U, 0xDFFFU, 0x110000U, 0x7FFFFFFFU,
                                       0x80000000U, 0x80000041U, 0xFFFFFFFFU}) {
        for (std::size_t const before : {0U, 1U, 15U, 16U, 5000U}) {
            Strings::string text(before, L'a');
            text += static_cast<wchar_t>(element);
            text += L"zz";
            EXPECT_EQ(conversionFailureOf([&text] { convert<std::string>(text); }), expected)
                << std::hex << element;
            EXPECT_EQ(conversionFailureOf([&text] { convert<stringUTF16>(text); }), expected);
        }
    }
    // A pair of surrogates is two elements that are no code points.
    Strings::string const pair = {static_cast<wchar_t>(0xD83D), static_cast<wchar_t>(0xDE00)};
    EXPECT_EQ(conversionFailureOf([&pair] { convert<std::string>(pair); }), expected);
}

TEST_F(CEncodingConverterTest, NothingIsLeftOfAConversionThatCouldNotBegin) {
    long const liveBefore = TestSupport::liveObjects();
    conversionFailureOf([] { convert<Strings::string>("\xFF"); });
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
}

// --- the platform's part

template <class TTarget, class TSource>
void expectNoCallForTheEmpty() {
    CPlatformCalls const calls;
    EXPECT_TRUE((CConverter<TTarget, TSource>::convert(TSource()).empty()));
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CEncodingConverterTest, AnEmptyTextMakesNoPlatformCall) {
    expectNoCallForTheEmpty<stringUTF16, std::string>();
    expectNoCallForTheEmpty<std::string, stringUTF16>();
    expectNoCallForTheEmpty<stringUTF16, Strings::string>();
    expectNoCallForTheEmpty<Strings::string, stringUTF16>();
    expectNoCallForTheEmpty<stringUTF16, TBytes>();
    expectNoCallForTheEmpty<TBytes, stringUTF16>();
    expectNoCallForTheEmpty<std::string, Strings::string>();
    expectNoCallForTheEmpty<Strings::string, std::string>();
    expectNoCallForTheEmpty<TBytes, Strings::string>();

    CPlatformCalls const calls;
    long const madeBefore = TestSupport::objectsMade();
    EXPECT_TRUE(convert<Strings::string>("").empty());
    EXPECT_TRUE(convert<std::string>(L"").empty());
    // Not even an encoding that nobody serves is found out.
    auto const johab = Encoding::eseWinJohab;
    EXPECT_TRUE((CConverter<stringUTF16, TBytes>::convert(TBytes(), johab).empty()));
    EXPECT_TRUE(calls.all().empty());
    EXPECT_EQ(TestSupport::objectsMade(), madeBefore);
}

// The calls of one direction: the text in, its measure, one pass, the release.
std::vector<std::string> const callsOfOnePass = {"CFStringCreateWithBytes", "CFStringGetLength",
                                                 "CFStringGetBytes", "CFStringGetBytes",
                                                 "CFRelease"};

void expectReading(CPlatformCall const& call, CFTypeRef text, CFStringEncoding encoding,
                   CFIndex length) {
    EXPECT_EQ(call.object, text);
    EXPECT_EQ(call.encoding, encoding);
    EXPECT_EQ(call.lossByte, 63);
    EXPECT_FALSE(call.external);
    EXPECT_EQ(call.range.location, 0);
    EXPECT_EQ(call.range.length, length);
}

// One direction of a conversion: from what, into what, and what one pass reads.
struct CDirection {
    CFStringEncoding from;
    CFIndex inputBytes;
    CFStringEncoding to;
    CFIndex outputBytes;
};

// The sample of the following tests: 3 characters, 4 units.
std::u32string const shortSample = U"a\u00E9\U0001F600";
CDirection const utf8In = {0x08000100, 7, 256, 8};
CDirection const utf8Out = {256, 8, 0x08000100, 7};
CDirection const utf32In = {0x1c000100, 12, 256, 8};
CDirection const utf32Out = {256, 8, 0x1c000100, 12};
CDirection const utf16Out = {256, 8, 0x14000100, 8};

// One direction of the short sample, which one pass takes.
void expectOnePass(std::vector<CPlatformCall> const& calls, CDirection const& direction) {
    ASSERT_EQ(calls.size(), 5U);
    CPlatformCall const& make = calls[0];
    EXPECT_EQ(make.allocator, kCFAllocatorDefault);
    EXPECT_EQ(make.inputCount, direction.inputBytes);
    EXPECT_EQ(make.encoding, direction.from);
    EXPECT_FALSE(make.external);

    CFTypeRef const text = make.object;
    EXPECT_EQ(calls[1].object, text);
    expectReading(calls[2], text, direction.to, 4);
    EXPECT_EQ(calls[2].buffer, nullptr);
    expectReading(calls[3], text, direction.to, 4);
    EXPECT_NE(calls[3].buffer, nullptr);
    EXPECT_EQ(calls[3].room, direction.outputBytes);
    EXPECT_EQ(calls[4].object, text);
}

// Runs a conversion that takes one step, and one that goes through UTF-16.
template <class TSource, class TConversion>
void expectOneStep(TSource const& source, TConversion const& conversion, CDirection const& step) {
    CPlatformCalls const calls;
    conversion(source);
    EXPECT_EQ(calls.names(), callsOfOnePass);
    expectOnePass(calls.all(), step);
    EXPECT_EQ(calls.all().front().input, source.data());
}

template <class TTarget, class TSource>
void expectTwoSteps(TSource const& source, CDirection const& in, CDirection const& out) {
    CPlatformCalls const calls;
    convert<TTarget>(source);
    std::vector<CPlatformCall> const& all = calls.all();
    ASSERT_EQ(all.size(), 10U);
    expectOnePass({all.begin(), all.begin() + 5}, in);
    expectOnePass({all.begin() + 5, all.end()}, out);
    EXPECT_EQ(all.front().input, source.data());
}

TEST_F(CEncodingConverterTest, ThePlatformIsCalledInOrderWithTheRightArguments) {
    std::string const utf8 = utf8Of(shortSample);
    stringUTF16 const utf16 = utf16Of(shortSample);
    expectOneStep(utf8, convert<stringUTF16, std::string>, utf8In);
    expectOneStep(utf16, convert<std::string, stringUTF16>, utf8Out);
    expectOneStep(wideOf(shortSample), convert<stringUTF16, Strings::string>, utf32In);
    expectOneStep(utf16, convert<Strings::string, stringUTF16>, utf32Out);
    auto const readUTF8 = [](TBytes const& bytes) {
        CConverter<stringUTF16, TBytes>::convert(bytes, Encoding::eseUTF8);
    };
    auto const writeUTF16 = [](stringUTF16 const& units) {
        CConverter<TBytes, stringUTF16>::convert(units, Encoding::eseUTF16);
    };
    expectOneStep(bytesOf(utf8), readUTF8, utf8In);
    expectOneStep(utf16, writeUTF16, utf16Out);
}

TEST_F(CEncodingConverterTest, NarrowAndWideTextGoThroughUTF16) {
    expectTwoSteps<Strings::string>(utf8Of(shortSample), utf8In, utf32Out);
    expectTwoSteps<std::string>(wideOf(shortSample), utf32In, utf8Out);
}

TEST_F(CEncodingConverterTest, ConversionsRunOnSeveralThreadsAtOnce) {
    std::u32string text;
    for (int i = 0; i < 3000; ++i)
        text += sample;
    std::string const utf8 = utf8Of(text);
    stringUTF16 const utf16 = utf16Of(text);
    Strings::string const wide = wideOf(text);
    std::atomic<int> right{0};
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([&] {
            for (int round = 0; round < 5; ++round) {
                if (convert<Strings::string>(utf8) == wide && convert<std::string>(utf16) == utf8)
                    ++right;
            }
        });
    }
    for (std::thread& thread : threads)
        thread.join();
    EXPECT_EQ(right, 20);
}

} // namespace
