#include "1Base/Encoding/EncodingNormalize.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <string>
#include <vector>

namespace {

using CEncodingNormalizeTest = TestSupport::CObjectCountTest;

using Encoding::EUTF16NormalizationForm;
using Encoding::normalize;
using Strings::stringUTF16;
using TestSupport::CPlatformCall;
using TestSupport::CPlatformCalls;
using TestSupport::utf16Of;

std::vector<std::string> const allCalls = {"CFStringCreateWithCharacters",
                                           "CFStringCreateMutableCopy",
                                           "CFRelease",
                                           "CFStringNormalize",
                                           "CFStringGetLength",
                                           "CFStringGetCharacters",
                                           "CFRelease"};

TEST_F(CEncodingNormalizeTest, EachFormHasItsOwnText) {
    // A long s with a dot above, and a dot below.
    stringUTF16 const text = utf16Of(u"\u1E9B\u0323");
    EXPECT_EQ(normalize(text, Encoding::enfD), utf16Of(u"\u017F\u0323\u0307"));
    EXPECT_EQ(normalize(text, Encoding::enfKD), utf16Of(u"s\u0323\u0307"));
    EXPECT_EQ(normalize(text, Encoding::enfC), utf16Of(u"\u1E9B\u0323"));
    EXPECT_EQ(normalize(text, Encoding::enfKC), utf16Of(u"\u1E69"));
}

TEST_F(CEncodingNormalizeTest, AnyOtherFormIsCanonicalComposition) {
    for (unsigned int const form : {4U, 5U, 7U, 0x80000002U, 0xFFFFFFFFU}) {
        CPlatformCalls const calls;
        EXPECT_EQ(normalize(utf16Of(u"e\u0301\uFB01"), static_cast<EUTF16NormalizationForm>(form)),
                  utf16Of(u"\u00E9\uFB01"));
        EXPECT_EQ(calls.of("CFStringNormalize").at(0).form, kCFStringNormalizationFormC) << form;
    }
}

TEST_F(CEncodingNormalizeTest, TheTextEndsAtItsFirstZeroUnit) {
    using namespace std::string_literals;
    EXPECT_EQ(normalize(utf16Of(u"e\u0301\0e\u0301"s), Encoding::enfC), utf16Of(u"\u00E9"));
    EXPECT_EQ(normalize(utf16Of(u"abc\0"s), Encoding::enfD), utf16Of(u"abc"));
    EXPECT_EQ(normalize(utf16Of(u"\0abc"s), Encoding::enfKC), stringUTF16());
}

TEST_F(CEncodingNormalizeTest, UnpairedSurrogatesStay) {
    std::u16string const units = {0xDC00, u'e', 0x0301, 0xD800};
    EXPECT_EQ(normalize(utf16Of(units), Encoding::enfC),
              utf16Of(std::u16string{0xDC00, 0xE9, 0xD800}));
}

TEST_F(CEncodingNormalizeTest, ALongTextMayGrowAndShrink) {
    std::u16string apart;
    std::u16string together;
    for (int i = 0; i < 20000; ++i) {
        apart += u"xe\u0301";
        together += u"x\u00E9";
    }
    EXPECT_EQ(normalize(utf16Of(apart), Encoding::enfC), utf16Of(together));
    EXPECT_EQ(normalize(utf16Of(together), Encoding::enfD), utf16Of(apart));
}

TEST_F(CEncodingNormalizeTest, ThePlatformIsCalledInOrderWithTheRightArguments) {
    stringUTF16 const text = utf16Of(u"e\u0301x");
    for (CFIndex form = 0; form < 4; ++form) {
        CPlatformCalls const calls;
        stringUTF16 const result = normalize(text, static_cast<EUTF16NormalizationForm>(form));
        ASSERT_EQ(calls.names(), allCalls);
        std::vector<CPlatformCall> const& all = calls.all();
        EXPECT_EQ(all[0].allocator, kCFAllocatorDefault);
        EXPECT_EQ(all[0].input, text.data());
        EXPECT_EQ(all[0].inputCount, 3);
        EXPECT_EQ(all[1].allocator, kCFAllocatorDefault);
        EXPECT_EQ(all[1].capacity, 0);
        EXPECT_EQ(all[1].source, all[0].object);
        EXPECT_EQ(all[2].object, all[0].object);
        EXPECT_EQ(all[3].object, all[1].object);
        EXPECT_EQ(all[3].form, form);
        EXPECT_EQ(all[4].object, all[1].object);
        EXPECT_EQ(all[5].object, all[1].object);
        EXPECT_EQ(all[5].range.location, 0);
        EXPECT_EQ(all[5].range.length, static_cast<CFIndex>(result.size()));
        EXPECT_EQ(all[6].object, all[1].object);
    }
}

TEST_F(CEncodingNormalizeTest, AnEmptyTextGoesTheWholeWay) {
    CPlatformCalls const calls;
    EXPECT_TRUE(normalize(stringUTF16(), Encoding::enfC).empty());
    EXPECT_EQ(calls.names(), allCalls);
    EXPECT_EQ(calls.all().at(0).inputCount, 0);
    EXPECT_EQ(calls.all().at(5).range.length, 0);
}

TEST_F(CEncodingNormalizeTest, AStringThatCanNotBeMadeFailsACheck) {
    CPlatformCalls calls;
    calls.fail("CFStringCreateWithCharacters");
    EXPECT_EQ(TestSupport::failedCheckOf([] { normalize(utf16Of(u"a"), Encoding::enfC); }), "ref");
    EXPECT_EQ(calls.names(), std::vector<std::string>{"CFStringCreateWithCharacters"});
}

TEST_F(CEncodingNormalizeTest, ACopyThatCanNotBeMadeFailsACheckBehindTheRelease) {
    CPlatformCalls calls;
    calls.fail("CFStringCreateMutableCopy");
    EXPECT_EQ(TestSupport::failedCheckOf([] { normalize(utf16Of(u"a"), Encoding::enfC); }), "mref");
    EXPECT_EQ(calls.names(), (std::vector<std::string>{"CFStringCreateWithCharacters",
                                                       "CFStringCreateMutableCopy", "CFRelease"}));
    EXPECT_EQ(calls.all().at(2).object, calls.all().at(0).object);
}

} // namespace
