#include "2System/MacOS/MacOSTempCFString.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/PlatformString.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <string>
#include <vector>

namespace {

using CMacOSTempCFStringTest = TestSupport::CObjectCountTest;

using MacOS::CTempCFString;
using TestSupport::CPlatformCall;
using TestSupport::CPlatformCalls;
using TestSupport::CPlatformString;

std::u16string unitsOf(CTempCFString const& text) {
    return CPlatformString::unitsOf(text.get());
}

TEST_F(CMacOSTempCFStringTest, ItIsBuiltFromAnyStringKind) {
    EXPECT_EQ(unitsOf(CTempCFString(Strings::string(L"caf\u00E9"))), u"caf\u00E9");
    EXPECT_EQ(unitsOf(CTempCFString(std::string("caf\xC3\xA9"))), u"caf\u00E9");
    EXPECT_EQ(unitsOf(CTempCFString(TestSupport::utf16Of(u"caf\u00E9"))), u"caf\u00E9");
    EXPECT_EQ(unitsOf(CTempCFString(L"caf\u00E9")), u"caf\u00E9");
    EXPECT_EQ(unitsOf(CTempCFString("caf\xC3\xA9")), u"caf\u00E9");
}

TEST_F(CMacOSTempCFStringTest, ItIsBuiltFromBytesAndFromAPascalString) {
    unsigned char const pascal[] = {4, 'c', 'a', 'f', 0x8E};
    EXPECT_EQ(unitsOf(CTempCFString(TestSupport::bytesOf("caf\xE9"))), u"caf\u00E9");
    EXPECT_EQ(unitsOf(CTempCFString(pascal)), u"caf\u00E9");
}

TEST_F(CMacOSTempCFStringTest, AWideTextComesBackUnchanged) {
    Strings::string const text = L"caf\u00E9 \U0001F600";
    CTempCFString const temp(text);
    EXPECT_EQ(MacOS::GetStringFromCFString(temp.get()), text);
}

TEST_F(CMacOSTempCFStringTest, ItTakesOverAStringWithoutTouchingIt) {
    CFStringRef const ref = MacOS::GetCFString(std::string("abc"));
    CPlatformCalls const calls;
    CTempCFString const text(ref);
    EXPECT_EQ(text.get(), ref);
    EXPECT_EQ(CFGetRetainCount(ref), 1);
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CMacOSTempCFStringTest, ItTakesOverAMutableStringToo) {
    CFMutableStringRef const ref =
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(u"abc").get());
    CPlatformCalls const calls;
    CTempCFString const text(ref);
    EXPECT_EQ(text.get(), ref);
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CMacOSTempCFStringTest, ItReleasesItsStringExactlyOnce) {
    long const liveBefore = TestSupport::liveObjects();
    CFStringRef const ref = MacOS::GetCFString(std::string("abc"));
    CPlatformCalls const calls;
    { CTempCFString const text(ref); }
    ASSERT_EQ(calls.names(), std::vector<std::string>{"CFRelease"});
    EXPECT_EQ(calls.all().front().object, ref);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
}

TEST_F(CMacOSTempCFStringTest, AnotherOwnerKeepsTheStringAlive) {
    CFStringRef const ref = MacOS::GetCFString(std::string("abc"));
    CFRetain(ref);
    { CTempCFString const text(ref); }
    EXPECT_EQ(CFGetRetainCount(ref), 1);
    CFRelease(ref);
}

TEST_F(CMacOSTempCFStringTest, NullIsNotTakenOver) {
    CPlatformCalls const calls;
    EXPECT_EQ(TestSupport::failedCheckOf([] { CTempCFString const text(CFStringRef{nullptr}); }),
              "ref");
    EXPECT_EQ(
        TestSupport::failedCheckOf([] { CTempCFString const text(CFMutableStringRef{nullptr}); }),
        "ref");
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CMacOSTempCFStringTest, AMalformedTextRaisesTheConversionFailure) {
    TestSupport::CConversionFailure const expected = {
        "CFStringCreateWithBytes", "Could not create string with encoding UTF8", 53};
    CPlatformCalls const calls;
    EXPECT_EQ(
        TestSupport::conversionFailureOf([] { CTempCFString const text(std::string("\xFF")); }),
        expected);
    EXPECT_EQ(TestSupport::conversionFailureOf([] { CTempCFString const text("\xFF"); }), expected);
    EXPECT_TRUE(calls.of("CFRelease").empty());
}

TEST_F(CMacOSTempCFStringTest, AnEmptyTextIsAnEmptyString) {
    EXPECT_EQ(unitsOf(CTempCFString(Strings::string())), u"");
    EXPECT_EQ(unitsOf(CTempCFString(std::string())), u"");
    EXPECT_EQ(MacOS::GetStringFromCFString(CTempCFString(L"").get()), L"");
}

} // namespace
