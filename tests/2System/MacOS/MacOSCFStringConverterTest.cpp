#include "2System/MacOS/MacOS.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/PlatformString.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <string>
#include <vector>

namespace {

using CMacOSCFStringConverterTest = TestSupport::CObjectCountTest;

using MacOS::GetCFString;
using MacOS::GetStringFromCFString;
using MacOS::GetStringUTF16FromCFString;
using TestSupport::CPlatformCall;
using TestSupport::CPlatformCalls;
using TestSupport::CPlatformString;
using TestSupport::utf16Of;

// Pairs, lone surrogates, marks and a zero.
std::u16string const oddUnits = {u'a', 0, 0xDC00, 0xD83D, 0xDE00, 0xFEFF, 0xFFFF, 0xD800};

// --- out of the platform's type

TEST_F(CMacOSCFStringConverterTest, TheUnitsComeFromTheStringsOwnStorage) {
    CPlatformString const text(oddUnits);
    CPlatformCalls const calls;
    EXPECT_EQ(GetStringUTF16FromCFString(text.get()), utf16Of(oddUnits));
    EXPECT_EQ(calls.of("CFStringGetCharactersPtr").size(), 1U);
    EXPECT_TRUE(calls.of("CFStringGetBytes").empty());
}

TEST_F(CMacOSCFStringConverterTest, AStringThatShowsNoUnitsIsReadAsBytes) {
    CPlatformString const text(oddUnits);
    CPlatformCalls calls;
    calls.fail("CFStringGetCharactersPtr");
    EXPECT_EQ(GetStringUTF16FromCFString(text.get()), utf16Of(oddUnits));

    std::vector<CPlatformCall> const readings = calls.of("CFStringGetBytes");
    ASSERT_EQ(readings.size(), 2U);
    for (CPlatformCall const& reading : readings) {
        EXPECT_EQ(reading.object, text.get());
        EXPECT_EQ(reading.encoding, 256U);
        EXPECT_EQ(reading.lossByte, 32);
        EXPECT_FALSE(reading.external);
        EXPECT_EQ(reading.range.location, 0);
        EXPECT_EQ(reading.range.length, static_cast<CFIndex>(oddUnits.size()));
    }
    EXPECT_EQ(readings[0].buffer, nullptr);
    EXPECT_NE(readings[1].buffer, nullptr);
    EXPECT_EQ(readings[1].room, static_cast<CFIndex>(oddUnits.size() * 2));
}

TEST_F(CMacOSCFStringConverterTest, ALongStringIsReadAsBytesAtOnce) {
    std::u16string const units(100000, u'\u4E16');
    CPlatformString const text(units);
    CPlatformCalls calls;
    calls.fail("CFStringGetCharactersPtr");
    EXPECT_EQ(GetStringUTF16FromCFString(text.get()), utf16Of(units));
    EXPECT_EQ(calls.of("CFStringGetBytes").size(), 2U);
}

TEST_F(CMacOSCFStringConverterTest, AnEmptyStringIsReadAsBytesToo) {
    CPlatformString const text(u"");
    CPlatformCalls const calls;
    EXPECT_TRUE(GetStringUTF16FromCFString(text.get()).empty());
    EXPECT_EQ(calls.of("CFStringGetBytes").size(), 2U);
}

TEST_F(CMacOSCFStringConverterTest, AnEmptyStringThatShowsNoUnitsIsEmpty) {
    CPlatformString const text(u"");
    CPlatformCalls calls;
    calls.fail("CFStringGetCharactersPtr");
    EXPECT_TRUE(GetStringUTF16FromCFString(text.get()).empty());
}

TEST_F(CMacOSCFStringConverterTest, ReadingTakesNoOwnershipAway) {
    CPlatformString const text(u"abc");
    CPlatformCalls calls;
    GetStringUTF16FromCFString(text.get());
    calls.fail("CFStringGetCharactersPtr");
    GetStringUTF16FromCFString(text.get());
    EXPECT_TRUE(calls.of("CFRelease").empty());
    EXPECT_TRUE(calls.of("CFRetain").empty());
    EXPECT_EQ(CFGetRetainCount(text.get()), 1);
}

TEST_F(CMacOSCFStringConverterTest, ANullStringFailsACheck) {
    CPlatformCalls const calls;
    EXPECT_EQ(TestSupport::failedCheckOf([] { GetStringUTF16FromCFString(nullptr); }), "ref");
    EXPECT_EQ(TestSupport::failedCheckOf([] { GetStringFromCFString(nullptr); }), "ref");
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CMacOSCFStringConverterTest, TheTextIsTheUnitsConverted) {
    EXPECT_EQ(GetStringFromCFString(CPlatformString(u"caf\u00E9 \U0001F600").get()),
              L"caf\u00E9 \U0001F600");
    EXPECT_EQ(GetStringFromCFString(CPlatformString(u"").get()), L"");
    // A lone surrogate passes as a unit, and is a question mark as text.
    EXPECT_EQ(GetStringFromCFString(CPlatformString(u"a\xD800"
                                                    u"b")
                                        .get()),
              L"a?b");
    std::u16string const zeros = {0, u'a', 0};
    EXPECT_EQ(GetStringFromCFString(CPlatformString(zeros).get()),
              (Strings::string{L'\0', L'a', L'\0'}));
}

// --- into the platform's type

TEST_F(CMacOSCFStringConverterTest, NarrowTextIsHandedOverAsUTF8) {
    std::string const text = "caf\xC3\xA9";
    CPlatformCalls const calls;
    CPlatformString const made(GetCFString(text));
    ASSERT_EQ(calls.names(), std::vector<std::string>{"CFStringCreateWithBytes"});
    CPlatformCall const& call = calls.all().front();
    EXPECT_EQ(call.allocator, kCFAllocatorDefault);
    EXPECT_EQ(call.input, text.data());
    EXPECT_EQ(call.inputCount, 5);
    EXPECT_EQ(call.encoding, 0x08000100U);
    EXPECT_FALSE(call.external);
    EXPECT_EQ(made.units(), u"caf\u00E9");
    EXPECT_EQ(CFGetRetainCount(made.get()), 1);
}

TEST_F(CMacOSCFStringConverterTest, MalformedNarrowTextGivesNull) {
    EXPECT_EQ(GetCFString(std::string("\xC3")), nullptr);
}

TEST_F(CMacOSCFStringConverterTest, EmptyTextGivesAnEmptyString) {
    CPlatformString const narrow(GetCFString(std::string()));
    CPlatformString const units(GetCFString(Strings::stringUTF16()));
    CPlatformString const wide(GetCFString(Strings::string()));
    EXPECT_EQ(narrow.units(), u"");
    EXPECT_EQ(units.units(), u"");
    EXPECT_EQ(wide.units(), u"");
}

TEST_F(CMacOSCFStringConverterTest, UnitsAreHandedOverAsTheyAre) {
    Strings::stringUTF16 const units = utf16Of(oddUnits);
    CPlatformCalls const calls;
    CPlatformString const made(GetCFString(units));
    ASSERT_EQ(calls.names(), std::vector<std::string>{"CFStringCreateWithCharacters"});
    EXPECT_EQ(calls.all().front().allocator, kCFAllocatorDefault);
    EXPECT_EQ(calls.all().front().input, units.data());
    EXPECT_EQ(calls.all().front().inputCount, static_cast<CFIndex>(units.size()));
    EXPECT_EQ(made.units(), oddUnits);
    EXPECT_EQ(CFGetRetainCount(made.get()), 1);
}

TEST_F(CMacOSCFStringConverterTest, APascalStringIsHandedOverAsMacRoman) {
    unsigned char const pascal[] = {3, 'a', 'b', 'c', 0};
    unsigned char const* const pointer = pascal;
    unsigned char variable[] = {3, 'a', 'b', 'c', 0};
    CPlatformCalls const calls;
    CPlatformString const fromArray(GetCFString(pascal));
    CPlatformString const fromPointer(GetCFString(pointer));
    CPlatformString const fromVariable(GetCFString(variable));
    ASSERT_EQ(calls.names(), (std::vector<std::string>(3, "CFStringCreateWithPascalString")));
    for (CPlatformCall const& call : calls.all()) {
        EXPECT_EQ(call.allocator, kCFAllocatorDefault);
        EXPECT_EQ(call.encoding, 0U);
    }
    EXPECT_EQ(calls.all()[0].input, pascal);
    EXPECT_EQ(calls.all()[1].input, pascal);
    EXPECT_EQ(calls.all()[2].input, variable);
}

TEST_F(CMacOSCFStringConverterTest, APascalStringIsReadAsMacRoman) {
    unsigned char const pascal[] = {5, 'c', 'a', 'f', 0x8E, 0xA5, 'x'};
    CPlatformString const text(GetCFString(pascal));
    ASSERT_NE(text.get(), nullptr);
    EXPECT_EQ(text.units(), u"caf\u00E9\u2022");
    EXPECT_EQ(CFGetRetainCount(text.get()), 1);

    unsigned char const empty[] = {0};
    CPlatformString const none(GetCFString(empty));
    ASSERT_NE(none.get(), nullptr);
    EXPECT_EQ(none.units(), u"");
}

TEST_F(CMacOSCFStringConverterTest, BytesAreReadAsLatin1) {
    CPlatformString const text(GetCFString(TestSupport::bytesOf("caf\xE9")));
    EXPECT_EQ(text.units(), u"caf\u00E9");
}

TEST_F(CMacOSCFStringConverterTest, EveryOtherKindGoesThroughUTF16) {
    CPlatformCalls const calls;
    CPlatformString const wide(GetCFString(Strings::string(L"caf\u00E9 \U0001F600")));
    EXPECT_EQ(calls.names().back(), "CFStringCreateWithCharacters");
    CPlatformString const wideLiteral(GetCFString(L"caf\u00E9"));
    EXPECT_EQ(calls.names().back(), "CFStringCreateWithCharacters");
    CPlatformString const narrowLiteral(GetCFString("caf\xC3\xA9"));
    EXPECT_EQ(calls.names().back(), "CFStringCreateWithCharacters");
    EXPECT_EQ(wide.units(), u"caf\u00E9 \U0001F600");
    EXPECT_EQ(wideLiteral.units(), u"caf\u00E9");
    EXPECT_EQ(narrowLiteral.units(), u"caf\u00E9");
}

TEST_F(CMacOSCFStringConverterTest, AnotherKindThatIsMalformedRaisesTheConversionFailure) {
    Strings::string const surrogate(1, static_cast<wchar_t>(0xD800));
    TestSupport::CConversionFailure const expected = {
        "CFStringCreateWithBytes", "Could not create string with encoding UTF32", 55};
    EXPECT_EQ(TestSupport::conversionFailureOf([&surrogate] { GetCFString(surrogate); }), expected);
}

TEST_F(CMacOSCFStringConverterTest, TheCallerOwnsWhatIsMade) {
    long const liveBefore = TestSupport::liveObjects();
    CFStringRef const refs[] = {GetCFString(std::string("a")), GetCFString(utf16Of(u"a")),
                                GetCFString(Strings::string(L"a"))};
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore + 3);
    for (CFStringRef const ref : refs)
        CFRelease(ref);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
}

} // namespace
