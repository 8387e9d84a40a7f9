// Memory that is short, and memory that is left: of the platform's objects and of ICU, whose
// allocator is replaced by a counting one.

#include "0Platform/CoreFoundation/CFDateSupport.h"

#include "support/PlatformString.h"

#include <unicode/uclean.h>

#include <cstdlib>
#include <string>

namespace {

bool isObjectMemoryShort = false;
long icuBlocks = 0;
long icuFailing = 0; // the allocation of ICU from now on that fails; 0 for none

bool failsForIcu() {
    return icuFailing > 0 && --icuFailing == 0;
}

void* allocateForIcu(void const*, std::size_t bytes) {
    if (failsForIcu())
        return nullptr;
    ++icuBlocks;
    return std::calloc(1, bytes);
}

void* reallocateForIcu(void const*, void* memory, std::size_t bytes) {
    if (failsForIcu())
        return nullptr;
    if (memory == nullptr)
        ++icuBlocks;
    return std::realloc(memory, bytes);
}

void freeForIcu(void const*, void* memory) {
    if (memory != nullptr)
        --icuBlocks;
    std::free(memory);
}

} // namespace

extern "C" {
// ICU 72 loses a block of its own where it fails in the middle. What of ICU's we would lose, the
// counts of this file tell.
__attribute__((visibility("default"))) char const* __lsan_default_suppressions();
char const* __lsan_default_suppressions() {
    return "leak:libicu";
}

void* __real_malloc(std::size_t bytes);

void* __wrap_malloc(std::size_t bytes) {
    return isObjectMemoryShort ? nullptr : __real_malloc(bytes);
}
}

namespace {

using namespace TestSupport;

class CFDateMemoryTest : public CDateTest {
  protected:
    static void SetUpTestSuite() {
        UErrorCode status = U_ZERO_ERROR;
        u_setMemoryFunctions(nullptr, allocateForIcu, reallocateForIcu, freeForIcu, &status);
        ASSERT_TRUE(U_SUCCESS(status)) << "ICU is in use already";
    }

    void SetUp() override {
        CDateTest::SetUp();
        setLocale("de_DE");
        setZone("Europe/Dublin");
    }

    static CFCalendarRef createCalendar() {
        return CFCalendarCreateWithIdentifier(kCFAllocatorDefault, kCFGregorianCalendar);
    }

    static CFDateFormatterRef createFormatter(CFDateFormatterStyle style) {
        CFLocaleRef const locale = CFLocaleCopyCurrent();
        CFDateFormatterRef const formatter =
            CFDateFormatterCreate(kCFAllocatorDefault, locale, style, style);
        CFRelease(locale);
        return formatter;
    }

    static CFStringRef createText(CFDateFormatterRef formatter, CFDateRef date) {
        return CFDateFormatterCreateStringWithDate(kCFAllocatorDefault, formatter, date);
    }

    // Calls `create` with each of ICU's allocations failing in turn, until a call needs no more,
    // and returns how often it was null.
    template <class TCreate>
    static int failEach(TCreate const& create) {
        int nulls = 0;
        for (long nth = 1;; ++nth) {
            icuFailing = nth;
            CFTypeRef const object = create();
            bool const isOver = icuFailing != 0;
            icuFailing = 0;
            if (object != nullptr)
                CFRelease(object);
            else
                ++nulls;
            if (isOver) {
                EXPECT_NE(object, nullptr);
                return nulls;
            }
        }
    }
};

TEST_F(CFDateMemoryTest, WithoutMemoryForAnObjectTheAnswerIsNull) {
    for (char const* const zone : {"Europe/Dublin", zoneRule}) {
        setZone(zone);
        for (CFDateFormatterStyle const style :
             {kCFDateFormatterNoStyle, kCFDateFormatterFullStyle}) {
            CFRelease(createCalendar());
            textOf(0, style, style); // fills ICU's caches
            long const blocks = icuBlocks;
            CFDateFormatterRef const formatter = createFormatter(style);
            CFDateRef const date = CFDateCreate(kCFAllocatorDefault, 0);
            CFLocaleRef const locale = CFLocaleCopyCurrent();
            isObjectMemoryShort = true;
            EXPECT_EQ(CFLocaleCopyCurrent(), nullptr);
            EXPECT_EQ(createCalendar(), nullptr);
            EXPECT_EQ(CFDateCreate(kCFAllocatorDefault, 0), nullptr);
            EXPECT_EQ(CFDateFormatterCreate(kCFAllocatorDefault, locale, style, style), nullptr);
            EXPECT_EQ(createText(formatter, date), nullptr);
            isObjectMemoryShort = false;
            CFRelease(locale);
            CFRelease(date);
            CFRelease(formatter);
            EXPECT_EQ(icuBlocks, blocks) << zone << " " << style;
        }
    }
}

TEST_F(CFDateMemoryTest, NothingOfIcuIsLeftBehind) {
    long blocks = 0;
    for (int round = 0; round < 20; ++round) {
        // The first round fills ICU's caches.
        if (round == 1)
            blocks = icuBlocks;
        for (char const* const zone : zonesToTry) {
            setZone(zone);
            for (char const* const locale : {"de_DE", "fa_IR", "th_TH", "C", "xx_YY", ""}) {
                setLocale(locale);
                textOf(composed({2021, 3, 5, 8, 5, 9}), kCFDateFormatterFullStyle,
                       kCFDateFormatterFullStyle);
            }
        }
    }
    EXPECT_GT(blocks, 0);
    EXPECT_EQ(icuBlocks, blocks);
}

TEST_F(CFDateMemoryTest, ACalendarWithoutMemoryForANamedZoneAsksTheCLibrary) {
    CFAbsoluteTime const at = composed({2020, 7, 14, 13, 7, 45});
    int const nulls = failEach([&] {
        CFCalendarRef const calendar = createCalendar();
        if (calendar != nullptr) {
            EXPECT_EQ(composedBy(calendar, {2020, 7, 14, 13, 7, 45}), at);
        }
        return calendar;
    });
    EXPECT_EQ(nulls, 0);
}

TEST_F(CFDateMemoryTest, ACalendarWithoutMemoryForThatZoneIsNull) {
    setZone(zoneRule);
    CFRelease(createCalendar());
    EXPECT_GT(failEach(createCalendar), 0);
}

// The first allocation alone: ICU 72 does not survive each of the later failures.
TEST_F(CFDateMemoryTest, ATextWithoutMemoryForIcusCalendarIsNull) {
    CFDateFormatterRef const formatter = createFormatter(kCFDateFormatterShortStyle);
    CFDateRef const date = CFDateCreate(kCFAllocatorDefault, 0);
    CFRelease(createText(formatter, date));
    icuFailing = 1;
    EXPECT_EQ(createText(formatter, date), nullptr);
    EXPECT_EQ(icuFailing, 0);
    CFRelease(createText(formatter, date));
    CFRelease(date);
    CFRelease(formatter);
}

} // namespace
