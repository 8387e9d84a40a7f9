#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"
#include "support/PlatformString.h"

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

using TestSupport::CPlatformString;

namespace {

long allocations = 0;
bool isMemoryShort = false;

} // namespace

extern "C" {
void* __real_malloc(std::size_t bytes);
void* __real_calloc(std::size_t count, std::size_t bytes);
void* __real_realloc(void* memory, std::size_t bytes);
void* __real__Znwm(std::size_t bytes);
void* __real__Znam(std::size_t bytes);

void* __wrap_malloc(std::size_t bytes) {
    ++allocations;
    return isMemoryShort ? nullptr : __real_malloc(bytes);
}

void* __wrap_calloc(std::size_t count, std::size_t bytes) {
    ++allocations;
    return __real_calloc(count, bytes);
}

void* __wrap_realloc(void* memory, std::size_t bytes) {
    ++allocations;
    return __real_realloc(memory, bytes);
}

// libc++ refers to these two, and a hidden function cannot be referred to by a library.
__attribute__((visibility("default"))) void* __wrap__Znwm(std::size_t bytes) {
    ++allocations;
    return __real__Znwm(bytes);
}

__attribute__((visibility("default"))) void* __wrap__Znam(std::size_t bytes) {
    ++allocations;
    return __real__Znam(bytes);
}
}

namespace {

using CFStringTest = TestSupport::CObjectCountTest;
using CFStringDeathTest = TestSupport::CObjectCountTest;

TEST_F(CFStringTest, BytesBecomeUnits) {
    CPlatformString const text("caf\xC3\xA9", kCFStringEncodingUTF8);
    ASSERT_NE(text.get(), nullptr);
    EXPECT_EQ(CFStringGetLength(text.get()), 4);
    EXPECT_EQ(text.units(), u"caf\u00E9");
}

TEST_F(CFStringTest, ASupplementaryCharacterHasTheLengthTwo) {
    CPlatformString const text("\xF0\x9F\x98\x80", kCFStringEncodingUTF8);
    EXPECT_EQ(CFStringGetLength(text.get()), 2);
    EXPECT_EQ(text.units(), (std::u16string{0xD83D, 0xDE00}));
}

TEST_F(CFStringTest, NoBytesAreTheEmptyString) {
    for (CFStringEncoding const encoding : {+kCFStringEncodingUTF8, +kCFStringEncodingUTF32LE,
                                            +kCFStringEncodingUTF16LE, +kCFStringEncodingUnicode}) {
        CPlatformString const text(
            CFStringCreateWithBytes(kCFAllocatorDefault, nullptr, 0, encoding, false));
        ASSERT_NE(text.get(), nullptr) << encoding;
        EXPECT_EQ(CFStringGetLength(text.get()), 0) << encoding;
    }
}

TEST_F(CFStringTest, AnEncodingThatIsNotServedGivesNull) {
    CFIndex const madeBefore = TestSupport::objectsMade();
    EXPECT_EQ(CPlatformString("abc", 0x0BAD).get(), nullptr);
    EXPECT_EQ(CPlatformString("", 0x0BAD).get(), nullptr);
    EXPECT_EQ(TestSupport::objectsMade(), madeBefore);
}

TEST_F(CFStringTest, CharactersAreCopiedAsTheyAre) {
    std::u16string units = {u'a', 0xDC00, 0xD800, 0xFEFF, 0xFFFE, 0, u'b'};
    CPlatformString const text(units);
    std::u16string const before = units;
    units[0] = u'z';
    EXPECT_EQ(text.units(), before);
}

TEST_F(CFStringTest, NoCharactersAreTheEmptyString) {
    CPlatformString const text(CFStringCreateWithCharacters(kCFAllocatorDefault, nullptr, 0));
    ASSERT_NE(text.get(), nullptr);
    EXPECT_EQ(CFStringGetLength(text.get()), 0);
}

TEST_F(CFStringTest, APascalStringHasItsLengthInFront) {
    unsigned char const pascal[] = {3, 'a', 'b', 'c', 'd'};
    CPlatformString const text(
        CFStringCreateWithPascalString(kCFAllocatorDefault, pascal, kCFStringEncodingUTF8));
    EXPECT_EQ(text.units(), u"abc");
}

TEST_F(CFStringTest, APascalStringMayBeEmptyOrFull) {
    unsigned char const empty[] = {0, 'x'};
    CPlatformString const none(
        CFStringCreateWithPascalString(kCFAllocatorDefault, empty, kCFStringEncodingUTF8));
    EXPECT_EQ(none.units(), u"");

    Str255 full;
    std::fill(std::begin(full), std::end(full), static_cast<unsigned char>('x'));
    full[0] = 255;
    CPlatformString const all(
        CFStringCreateWithPascalString(kCFAllocatorDefault, full, kCFStringEncodingUTF8));
    EXPECT_EQ(all.units(), std::u16string(255, u'x'));
}

TEST_F(CFStringTest, APascalStringMayBeMacRoman) {
    unsigned char const pascal[] = {5, 'c', 'a', 'f', 0x8E, 0xA5};
    CPlatformString const text(
        CFStringCreateWithPascalString(kCFAllocatorDefault, pascal, kCFStringEncodingMacRoman));
    ASSERT_NE(text.get(), nullptr);
    EXPECT_EQ(text.units(), u"caf\u00E9\u2022");
}

TEST_F(CFStringTest, AMalformedPascalStringGivesNull) {
    unsigned char const pascal[] = {2, 'a', 0xFF};
    EXPECT_EQ(CFStringCreateWithPascalString(kCFAllocatorDefault, pascal, kCFStringEncodingUTF8),
              nullptr);
}

TEST_F(CFStringTest, CharactersOfARangeAreCopiedAlone) {
    CPlatformString const text(u"abcdef");
    std::u16string buffer(5, u'-');
    CFStringGetCharacters(text.get(), CFRangeMake(2, 3), reinterpret_cast<UniChar*>(buffer.data()));
    EXPECT_EQ(buffer, u"cde--");
}

TEST_F(CFStringTest, AnEmptyRangeCopiesNothing) {
    CPlatformString const text(u"ab");
    UniChar unit = 0x55;
    CFStringGetCharacters(text.get(), CFRangeMake(2, 0), &unit);
    EXPECT_EQ(unit, 0x55);
}

TEST_F(CFStringTest, TheCharactersPointerShowsTheUnits) {
    CPlatformString const text(u"abc");
    UniChar const* const units = CFStringGetCharactersPtr(text.get());
    ASSERT_NE(units, nullptr);
    EXPECT_EQ(std::u16string(units, units + 3), u"abc");
}

TEST_F(CFStringTest, AMutableCopyIsAStringOfItsOwn) {
    CPlatformString const original(u"e\u0301");
    CFMutableStringRef const copy =
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, original.get());
    CPlatformString const owner(copy);
    EXPECT_EQ(owner.units(), u"e\u0301");

    CFStringNormalize(copy, kCFStringNormalizationFormC);
    EXPECT_EQ(owner.units(), u"\u00E9");
    EXPECT_EQ(original.units(), u"e\u0301");
}

TEST_F(CFStringTest, AMutableCopyOutlivesItsOriginal) {
    CFStringRef const original = CFStringCreateWithCharacters(kCFAllocatorDefault, nullptr, 0);
    CPlatformString const empty(CFStringCreateMutableCopy(kCFAllocatorDefault, 0, original));
    CFRelease(original);
    EXPECT_EQ(CFStringGetLength(empty.get()), 0);

    std::u16string const units(3000, u'x');
    CPlatformString const copy(
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(units).get()));
    CPlatformString const second(CFStringCreateMutableCopy(kCFAllocatorDefault, 0, copy.get()));
    EXPECT_EQ(copy.units(), units);
    EXPECT_EQ(second.units(), units);
}

TEST_F(CFStringTest, AnObjectLivesAsLongAsItHasAnOwner) {
    long const liveBefore = TestSupport::liveObjects();
    CFStringRef const text = CFStringCreateWithCharacters(kCFAllocatorDefault, nullptr, 0);
    EXPECT_EQ(CFGetRetainCount(text), 1);
    EXPECT_EQ(CFRetain(text), text);
    EXPECT_EQ(CFGetRetainCount(text), 2);
    CFRelease(text);
    EXPECT_EQ(CFGetRetainCount(text), 1);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore + 1);
    CFRelease(text);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
}

TEST_F(CFStringTest, OwnersMayBeOnSeveralThreads) {
    long const liveBefore = TestSupport::liveObjects();
    CFStringRef const text = CFStringCreateWithCharacters(kCFAllocatorDefault, nullptr, 0);
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        CFRetain(text);
        threads.emplace_back([text] {
            for (int round = 0; round < 10000; ++round)
                CFRelease(CFRetain(text));
            CFRelease(text);
        });
    }
    for (std::thread& thread : threads)
        thread.join();
    EXPECT_EQ(CFGetRetainCount(text), 1);
    CFRelease(text);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
}

TEST_F(CFStringTest, AShortStringIsOneAllocation) {
    UInt8 const bytes[] = "/home/ada/letter.odt";
    UniChar const units[] = {'a', 'b', 'c'};
    wchar_t const wide[] = L"/home/ada/letter.odt";
    long const madeBefore = TestSupport::objectsMade();

    allocations = 0;
    CFStringRef const fromBytes = CFStringCreateWithBytes(
        kCFAllocatorDefault, bytes, sizeof(bytes) - 1, kCFStringEncodingUTF8, false);
    EXPECT_EQ(allocations, 1);
    EXPECT_EQ(TestSupport::objectsMade(), madeBefore + 1);

    allocations = 0;
    CFStringRef const fromUnits = CFStringCreateWithCharacters(kCFAllocatorDefault, units, 3);
    EXPECT_EQ(allocations, 1);
    EXPECT_EQ(TestSupport::objectsMade(), madeBefore + 2);

    allocations = 0;
    CFStringRef const fromWide =
        CFStringCreateWithBytes(kCFAllocatorDefault, reinterpret_cast<UInt8 const*>(wide),
                                sizeof(wide) - sizeof(wchar_t), kCFStringEncodingUTF32LE, false);
    EXPECT_EQ(allocations, 1);
    EXPECT_EQ(TestSupport::objectsMade(), madeBefore + 3);

    CFRelease(fromBytes);
    CFRelease(fromUnits);
    CFRelease(fromWide);
}

TEST_F(CFStringTest, ReadingAStringAllocatesNothing) {
    CPlatformString const text(u"/home/ada/caf\u00E9");
    UInt8 buffer[256];
    CFRange const whole = CFRangeMake(0, CFStringGetLength(text.get()));
    allocations = 0;
    for (CFStringEncoding const encoding : {+kCFStringEncodingUTF8, +kCFStringEncodingUTF32LE,
                                            +kCFStringEncodingUTF16LE, +kCFStringEncodingUnicode})
        EXPECT_EQ(CFStringGetBytes(text.get(), whole, encoding, '?', false, buffer, sizeof(buffer),
                                   nullptr),
                  whole.length);
    EXPECT_EQ(allocations, 0);
}

TEST_F(CFStringTest, AMalformedTextLeavesNothingBehind) {
    long const liveBefore = TestSupport::liveObjects();
    EXPECT_EQ(CPlatformString("\xFF", kCFStringEncodingUTF8).get(), nullptr);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
}

TEST_F(CFStringTest, WithoutMemoryForAStringTheAnswerIsNull) {
    CPlatformString const whole(u"text");
    long const liveBefore = TestSupport::liveObjects();
    UInt8 const bytes[] = {4, 't', 'e', 'x', 't'};
    UniChar const units[] = {'t', 'e', 'x', 't'};
    isMemoryShort = true;
    CFTypeRef const strings[] = {
        CFStringCreateWithBytes(kCFAllocatorDefault, bytes + 1, 4, kCFStringEncodingUTF8, false),
        CFStringCreateWithCharacters(kCFAllocatorDefault, units, 4),
        CFStringCreateWithPascalString(kCFAllocatorDefault, bytes, kCFStringEncodingUTF8),
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, whole.get())};
    isMemoryShort = false;
    for (CFTypeRef const string : strings)
        EXPECT_EQ(string, nullptr);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
}

TEST_F(CFStringDeathTest, ReleasingNullEndsTheProcess) {
    EXPECT_DEATH(CFRelease(nullptr), "");
}

TEST_F(CFStringDeathTest, RetainingNullEndsTheProcess) {
    EXPECT_DEATH(CFRetain(nullptr), "");
}

} // namespace
