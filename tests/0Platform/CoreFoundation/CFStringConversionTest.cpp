// What the Unicode encodings answer, in and out.

#include <CoreFoundation/CoreFoundation.h>

#include "support/NaiveUnicode.h"
#include "support/ObjectCount.h"
#include "support/PlatformString.h"

#include <algorithm>
#include <cstdio>
#include <optional>
#include <random>
#include <string>
#include <vector>

using TestSupport::CPlatformString;
using namespace std::string_literals;

namespace {

using CFStringConversionTest = TestSupport::CObjectCountTest;

constexpr UInt8 loss = '?';

std::string utf32Bytes(std::vector<UInt32> const& elements) {
    return std::string(reinterpret_cast<char const*>(elements.data()), elements.size() * 4);
}

std::string utf32Bytes(std::u32string const& text) {
    return utf32Bytes(std::vector<UInt32>(text.begin(), text.end()));
}

std::string utf16Bytes(std::u16string const& units) {
    return std::string(reinterpret_cast<char const*>(units.data()), units.size() * 2);
}

bool isMalformed(std::string const& bytes, CFStringEncoding encoding) {
    return CPlatformString(bytes, encoding).get() == nullptr;
}

// The text in places where a decoder may work in another way: alone, at each offset of a block of
// ASCII, and in a long text.
std::vector<std::string> placesOf(std::string const& bytes) {
    std::vector<std::string> places = {bytes, bytes + "z"};
    for (std::size_t offset = 1; offset <= 33; ++offset) {
        places.push_back(std::string(offset, 'a') + bytes);
        places.push_back(std::string(offset, 'a') + bytes + std::string(40, 'z'));
    }
    places.push_back("\xC3\xA9" + bytes + "\xC3\xA9");
    places.push_back(std::string(700, 'a') + bytes + std::string(700, 'z'));
    return places;
}

// What a call of CFStringGetBytes answered. The buffer ends in a guard that must stay untouched.
struct CReading {
    CFIndex converted;
    CFIndex used;
    std::string bytes;
};

CReading read(CFStringRef text, CFRange range, CFStringEncoding encoding, CFIndex room,
              UInt8 lossByte = loss) {
    constexpr UInt8 guard = 0xA5;
    std::vector<UInt8> buffer(static_cast<std::size_t>(room) + 64, guard);
    CReading reading = {0, -1, ""};
    reading.converted = CFStringGetBytes(text, range, encoding, lossByte, false, buffer.data(),
                                         room, &reading.used);
    EXPECT_LE(reading.used, room);
    EXPECT_TRUE(
        std::all_of(buffer.begin() + room, buffer.end(), [](UInt8 byte) { return byte == guard; }));
    reading.bytes.assign(buffer.begin(), buffer.begin() + reading.used);
    return reading;
}

CReading read(std::u16string const& units, CFStringEncoding encoding, CFIndex room = 4096,
              UInt8 lossByte = loss) {
    CPlatformString const text(units);
    return read(text.get(), CFRangeMake(0, CFStringGetLength(text.get())), encoding, room,
                lossByte);
}

// Form by form: how the reference writes a text.
std::string encoded(std::u32string const& text, CFStringEncoding encoding) {
    if (encoding == kCFStringEncodingUTF8)
        return TestSupport::naiveUTF8(text);
    if (encoding == kCFStringEncodingUTF32LE)
        return utf32Bytes(text);
    return utf16Bytes(TestSupport::naiveUTF16(text));
}

constexpr CFStringEncoding unicodeEncodings[] = {kCFStringEncodingUTF8, kCFStringEncodingUTF32LE,
                                                 kCFStringEncodingUTF16LE,
                                                 kCFStringEncodingUnicode};

// --- UTF-8 in

TEST_F(CFStringConversionTest, MalformedUTF8IsRefusedWhereverItStands) {
    std::string const cases[] = {
        // stray continuations and bytes that never occur
        "\x80", "\xBF", "\xA9", "\xC3\xA9\xA9", "\xFE", "\xFF",
        // overlong forms of two, three and four bytes
        "\xC0\x80", "\xC0\xAF", "\xC1\xBF", "\xE0\x80\x80", "\xE0\x80\xAF", "\xE0\x9F\xBF",
        "\xF0\x80\x80\x80", "\xF0\x80\x80\xAF", "\xF0\x8F\xBF\xBF",
        // surrogates, alone and as a pair
        "\xED\xA0\x80", "\xED\xAF\xBF", "\xED\xB0\x80", "\xED\xBF\xBF", "\xED\xA0\xBD\xED\xB8\x80",
        // above 10FFFF, and leads of forms that would be
        "\xF4\x90\x80\x80", "\xF4\xBF\xBF\xBF", "\xF5\x80\x80\x80", "\xF6\x80\x80\x80",
        "\xF7\xBF\xBF\xBF", "\xF8\x88\x80\x80\x80", "\xFB\xBF\xBF\xBF\xBF",
        "\xFC\x84\x80\x80\x80\x80", "\xFD\xBF\xBF\xBF\xBF\xBF",
        // cut off after each byte
        "\xC3", "\xE4", "\xE4\xB8", "\xF0", "\xF0\x9F", "\xF0\x9F\x98",
        // a wrong byte at each place
        "\xC3\x28", "\xC3\xC3", "\xE2\x82\x28", "\xE2\x28\xA1", "\xE4\xB8\xC3\xA9",
        "\xF0\x28\x8C\xBC", "\xF0\x90\x28\xBC", "\xF0\x9F\x98\x28", "\xF0\x9F\x98\xF0"};
    for (std::string const& bytes : cases) {
        for (std::string const& place : placesOf(bytes))
            ASSERT_TRUE(isMalformed(place, kCFStringEncodingUTF8))
                << testing::PrintToString(bytes) << " in " << place.size();
    }
}

TEST_F(CFStringConversionTest, TheFirstAndLastCharacterOfEachLengthAreRead) {
    std::u32string const text = {0x00,    0x01,    0x7F,    0x80,    0x7FF,    0x800,   0xFFF,
                                 0x1000,  0xCFFF,  0xD7FF,  0xE000,  0xFFFD,   0xFFFE,  0xFFFF,
                                 0x10000, 0x3FFFF, 0x40000, 0xFFFFF, 0x100000, 0x10FFFF};
    for (char32_t const character : text) {
        std::string const bytes = TestSupport::naiveUTF8({character});
        for (std::string const& place : placesOf(bytes)) {
            CPlatformString const string(place, kCFStringEncodingUTF8);
            ASSERT_NE(string.get(), nullptr) << std::hex << +character;
            ASSERT_EQ(string.units(), TestSupport::naiveUTF16(*TestSupport::naiveFromUTF8(place)));
        }
    }
}

TEST_F(CFStringConversionTest, EverySequenceOfTwoBytesIsJudgedAsTheReferenceDoes) {
    for (unsigned pair = 0; pair < 0x10000; ++pair) {
        std::string const bytes = {static_cast<char>(pair >> 8), static_cast<char>(pair & 0xFF)};
        std::optional<std::u32string> const expected = TestSupport::naiveFromUTF8(bytes);
        CPlatformString const text(bytes, kCFStringEncodingUTF8);
        ASSERT_EQ(text.get() != nullptr, expected.has_value()) << std::hex << pair;
        if (expected) {
            ASSERT_EQ(text.units(), TestSupport::naiveUTF16(*expected)) << std::hex << pair;
        }
    }
}

TEST_F(CFStringConversionTest, EverySecondByteOfALongSequenceIsJudgedAsTheReferenceDoes) {
    for (unsigned lead = 0xE0; lead <= 0xFF; ++lead) {
        for (unsigned second = 0; second <= 0xFF; ++second) {
            for (char const last : {'\x7F', '\x80', '\xBF', '\xC0'}) {
                // Behind a letter, where no byte order mark is looked for.
                std::string bytes = {'a', static_cast<char>(lead), static_cast<char>(second), last};
                if (lead >= 0xF0)
                    bytes += last;
                std::optional<std::u32string> const expected = TestSupport::naiveFromUTF8(bytes);
                CPlatformString const text(bytes, kCFStringEncodingUTF8);
                ASSERT_EQ(text.get() != nullptr, expected.has_value())
                    << testing::PrintToString(bytes);
                if (expected) {
                    ASSERT_EQ(text.units(), TestSupport::naiveUTF16(*expected));
                }
            }
        }
    }
}

TEST_F(CFStringConversionTest, RandomBytesAreJudgedAsTheReferenceDoes) {
    unsigned const seed = 20110614;
    RecordProperty("seed", static_cast<int>(seed));
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    // Bytes at the borders of the rules, so that many texts are nearly right.
    std::string const bytes = "aZ\x7F\x80\x8F\x90\x9F\xA0\xA9\xBF\xC0\xC1\xC2\xDF\xE0\xE1\xEC\xED"
                              "\xEE\xEF\xBB\xBF\xF0\xF1\xF3\xF4\xF5\xFF";
    int wellFormed = 0;
    for (int round = 0; round < 300000; ++round) {
        std::string text(random() % 20, 'a');
        for (std::size_t i = 1 + random() % 6; i > 0; --i)
            text += bytes[random() % bytes.size()];
        if (text.compare(0, 3, "\xEF\xBB\xBF") == 0)
            continue;
        std::optional<std::u32string> const expected = TestSupport::naiveFromUTF8(text);
        CPlatformString const string(text, kCFStringEncodingUTF8);
        ASSERT_EQ(string.get() != nullptr, expected.has_value()) << testing::PrintToString(text);
        if (!expected)
            continue;
        ++wellFormed;
        ASSERT_EQ(string.units(), TestSupport::naiveUTF16(*expected));
    }
    EXPECT_GT(wellFormed, 5000);
}

TEST_F(CFStringConversionTest, OneLeadingByteOrderMarkOfUTF8IsRemoved) {
    std::string const mark = "\xEF\xBB\xBF";
    for (bool const external : {false, true}) {
        EXPECT_EQ(CPlatformString(mark + "A", kCFStringEncodingUTF8, external).units(), u"A");
        EXPECT_EQ(CPlatformString(mark + mark + "A", kCFStringEncodingUTF8, external).units(),
                  u"\uFEFFA");
        EXPECT_EQ(CPlatformString("A" + mark, kCFStringEncodingUTF8, external).units(), u"A\uFEFF");
        std::string const longText(600, 'x');
        EXPECT_EQ(CPlatformString(mark + longText, kCFStringEncodingUTF8, external).units(),
                  std::u16string(600, u'x'));
    }
}

TEST_F(CFStringConversionTest, AByteOrderMarkAloneIsTheEmptyString) {
    CPlatformString const text("\xEF\xBB\xBF", kCFStringEncodingUTF8);
    ASSERT_NE(text.get(), nullptr);
    EXPECT_EQ(CFStringGetLength(text.get()), 0);
}

TEST_F(CFStringConversionTest, AByteOrderMarkExcusesNothingBehindIt) {
    EXPECT_TRUE(isMalformed("\xEF\xBB", kCFStringEncodingUTF8));
    EXPECT_TRUE(isMalformed("\xEF\xBB\xBF\xBF", kCFStringEncodingUTF8));
    EXPECT_TRUE(isMalformed("\xEF\xBB\xBF\xEF\xBB", kCFStringEncodingUTF8));
}

// --- UTF-32 in

TEST_F(CFStringConversionTest, MalformedUTF32IsRefusedWhereverItStands) {
    for (UInt32 const element :
         {0xD800U, 0xDBFFU, 0xDC00U, 0xDFFFU, 0x110000U, 0x7FFFFFFFU, 0x80000000U, 0x80000041U,
          0xFFFFD800U, 0xFFFFFFFFU, 0x1F0000U, 0x41000000U, 0x0001D800U << 16}) {
        for (std::size_t before = 0; before <= 33; ++before) {
            for (std::size_t const behind : {0U, 1U, 20U}) {
                std::vector<UInt32> elements(before, 'a');
                elements.push_back(element);
                elements.insert(elements.end(), behind, 'z');
                ASSERT_TRUE(isMalformed(utf32Bytes(elements), kCFStringEncodingUTF32LE))
                    << std::hex << element << " behind " << before;
            }
        }
    }
}

TEST_F(CFStringConversionTest, UTF32IsReadWhereverASupplementaryCharacterStands) {
    for (std::size_t before = 0; before <= 33; ++before) {
        std::u32string const text =
            std::u32string(before, U'a') + U"\U00010000\uFFFF\U0010FFFF" + std::u32string(20, U'z');
        ASSERT_EQ(CPlatformString(utf32Bytes(text), kCFStringEncodingUTF32LE).units(),
                  TestSupport::naiveUTF16(text));
    }
}

TEST_F(CFStringConversionTest, AByteOrderMarkOfUTF32Stays) {
    EXPECT_EQ(CPlatformString(utf32Bytes(U"\uFEFFA"), kCFStringEncodingUTF32LE).units(),
              u"\uFEFFA");
    EXPECT_EQ(CPlatformString(utf32Bytes(U"\uFEFF"), kCFStringEncodingUTF32LE).units(), u"\uFEFF");
}

TEST_F(CFStringConversionTest, UTF32OfLessThanOneElementIsRefused) {
    for (std::size_t const size : {1U, 2U, 3U})
        EXPECT_TRUE(isMalformed(std::string(size, '\0'), kCFStringEncodingUTF32LE)) << size;
}

TEST_F(CFStringConversionTest, BytesBehindTheLastElementOfUTF32AreIgnored) {
    for (std::size_t const size : {1U, 2U, 3U}) {
        for (std::size_t const elements : {1U, 15U, 16U, 17U}) {
            std::string const bytes =
                utf32Bytes(std::u32string(elements, U'A')) + std::string(size, '\xFF');
            CPlatformString const text(bytes, kCFStringEncodingUTF32LE);
            ASSERT_NE(text.get(), nullptr);
            EXPECT_EQ(text.units(), std::u16string(elements, u'A'));
        }
    }
}

// --- UTF-16 in

TEST_F(CFStringConversionTest, UTF16UnitsAreTakenAsTheyAre) {
    std::u16string const units = {0xFEFF, u'a',   0xFFFE, 0xDC00, 0xD800, u'b',
                                  0,      0xD83D, 0xDE00, 0xFFFF, 0xD800};
    for (CFStringEncoding const encoding : {+kCFStringEncodingUTF16LE, +kCFStringEncodingUnicode})
        EXPECT_EQ(CPlatformString(utf16Bytes(units), encoding).units(), units);
}

TEST_F(CFStringConversionTest, AnOddByteOfUTF16IsIgnored) {
    for (CFStringEncoding const encoding : {+kCFStringEncodingUTF16LE, +kCFStringEncodingUnicode}) {
        EXPECT_EQ(CPlatformString(std::string("A\0B", 3), encoding).units(), u"A");
        CPlatformString const text("A", encoding);
        ASSERT_NE(text.get(), nullptr);
        EXPECT_EQ(CFStringGetLength(text.get()), 0);
    }
}

// --- out

TEST_F(CFStringConversionTest, EveryFormIsWrittenAsTheReferenceDoes) {
    std::u32string const text = U"a\0\u007F\u0080\u07FF\u0800\uFEFF\uFFFE\U00010000\U0010FFFFz"s;
    for (CFStringEncoding const encoding : unicodeEncodings) {
        std::u16string const units = TestSupport::naiveUTF16(text);
        CReading const reading = read(units, encoding);
        EXPECT_EQ(reading.converted, static_cast<CFIndex>(units.size())) << encoding;
        EXPECT_EQ(reading.bytes, encoded(text, encoding)) << encoding;
    }
}

TEST_F(CFStringConversionTest, UTF8StopsBeforeAnUnpairedSurrogateWhateverTheLossByte) {
    for (char16_t const surrogate : {u'\xD800', u'\xDBFF', u'\xDC00', u'\xDFFF'}) {
        for (UInt8 const lossByte : {UInt8{0}, UInt8{' '}, UInt8{'?'}}) {
            CReading const first =
                read(std::u16string{surrogate}, kCFStringEncodingUTF8, 64, lossByte);
            EXPECT_EQ(first.converted, 0);
            EXPECT_EQ(first.used, 0);
            CReading const later = read(std::u16string{u'\u00E9', surrogate, u'b'},
                                        kCFStringEncodingUTF8, 64, lossByte);
            EXPECT_EQ(later.converted, 1);
            EXPECT_EQ(later.bytes, "\xC3\xA9");
        }
    }
}

TEST_F(CFStringConversionTest, UTF32WritesTheLossByteForEachUnpairedSurrogate) {
    std::u16string const units = {0xDC00, 0xD800, u'a', 0xD800, 0xD83D, 0xDE00, 0xDE00, 0xD800};
    std::vector<UInt32> const expected = {'?', '?', 'a', '?', 0x1F600, '?', '?'};
    CReading const reading = read(units, kCFStringEncodingUTF32LE);
    EXPECT_EQ(reading.converted, 8);
    EXPECT_EQ(reading.bytes, utf32Bytes(expected));

    CReading const blank = read(u"\xD800", kCFStringEncodingUTF32LE, 64, ' ');
    EXPECT_EQ(blank.bytes, utf32Bytes(std::vector<UInt32>{' '}));
}

TEST_F(CFStringConversionTest, WithoutALossByteUTF32StopsBeforeAnUnpairedSurrogate) {
    CReading const reading = read(u"ab\xD800z", kCFStringEncodingUTF32LE, 64, 0);
    EXPECT_EQ(reading.converted, 2);
    EXPECT_EQ(reading.bytes, utf32Bytes(U"ab"));
}

TEST_F(CFStringConversionTest, UTF16CopiesUnpairedSurrogates) {
    std::u16string const units = {0xDC00, u'a', 0xD800, 0xFEFF, 0xD800};
    for (CFStringEncoding const encoding : {+kCFStringEncodingUTF16LE, +kCFStringEncodingUnicode}) {
        CReading const reading = read(units, encoding);
        EXPECT_EQ(reading.converted, 5);
        EXPECT_EQ(reading.bytes, utf16Bytes(units));
    }
}

// --- limits

TEST_F(CFStringConversionTest, EveryLimitTakesTheWholeCharactersThatFit) {
    std::u32string const texts[] = {U"a\u00E9\u4E16\U0001F600b",
                                    U"\U0001F600\U0001F601",
                                    U"\u4E16\u754C",
                                    std::u32string(40, U'x'),
                                    std::u32string(15, U'x') + U"\U0001F600\u00E9" +
                                        std::u32string(17, U'y'),
                                    U""};
    for (CFStringEncoding const encoding : unicodeEncodings) {
        for (std::u32string const& text : texts) {
            CFIndex const all = static_cast<CFIndex>(encoded(text, encoding).size());
            for (CFIndex room = 0; room <= all + 5; ++room) {
                std::u32string fitting = text;
                while (static_cast<CFIndex>(encoded(fitting, encoding).size()) > room)
                    fitting.pop_back();
                CReading const reading = read(TestSupport::naiveUTF16(text), encoding, room);
                ASSERT_EQ(reading.bytes, encoded(fitting, encoding)) << encoding << " in " << room;
                ASSERT_EQ(reading.converted,
                          static_cast<CFIndex>(TestSupport::naiveUTF16(fitting).size()))
                    << encoding << " in " << room;
            }
        }
    }
}

TEST_F(CFStringConversionTest, AnOddLimitOfUTF16RoundsDown) {
    CReading const reading = read(u"abc", kCFStringEncodingUnicode, 5);
    EXPECT_EQ(reading.converted, 2);
    EXPECT_EQ(reading.used, 4);
}

TEST_F(CFStringConversionTest, AnUnpairedSurrogateAtTheLimitIsWrittenAlone) {
    CReading const reading = read(u"a\xD800z", kCFStringEncodingUnicode, 4);
    EXPECT_EQ(reading.bytes, utf16Bytes(u"a\xD800"));
}

TEST_F(CFStringConversionTest, OnlyTheRangeIsConverted) {
    CPlatformString const text(u"ab\u4E16\u754Cyz");
    for (CFStringEncoding const encoding : unicodeEncodings) {
        CReading const reading = read(text.get(), CFRangeMake(1, 3), encoding, 64);
        EXPECT_EQ(reading.converted, 3);
        EXPECT_EQ(reading.bytes, encoded(U"b\u4E16\u754C", encoding));
        CReading const nothing = read(text.get(), CFRangeMake(3, 0), encoding, 64);
        EXPECT_EQ(nothing.converted, 0);
        EXPECT_EQ(nothing.used, 0);
    }
}

TEST_F(CFStringConversionTest, APairThatTheRangeCutsIsUnpaired) {
    CPlatformString const text(u"a\U0001F600b");
    CFRange const front = CFRangeMake(0, 2);
    CFRange const back = CFRangeMake(2, 2);
    EXPECT_EQ(read(text.get(), front, kCFStringEncodingUTF8, 64).bytes, "a");
    EXPECT_EQ(read(text.get(), back, kCFStringEncodingUTF8, 64).converted, 0);
    EXPECT_EQ(read(text.get(), front, kCFStringEncodingUTF32LE, 64).bytes, utf32Bytes(U"a?"));
    EXPECT_EQ(read(text.get(), back, kCFStringEncodingUTF32LE, 64).bytes, utf32Bytes(U"?b"));
    EXPECT_EQ(read(text.get(), front, kCFStringEncodingUnicode, 64).bytes, utf16Bytes(u"a\xD83D"));
    EXPECT_EQ(read(text.get(), front, kCFStringEncodingUnicode, 4).bytes, utf16Bytes(u"a\xD83D"));
}

TEST_F(CFStringConversionTest, WithoutABufferTheWholeIsMeasured) {
    std::u32string const text = std::u32string(20, U'x') + U"\u00E9\u4E16\U0001F600";
    CPlatformString const string(TestSupport::naiveUTF16(text));
    CFRange const whole = CFRangeMake(0, CFStringGetLength(string.get()));
    for (CFStringEncoding const encoding : unicodeEncodings) {
        for (CFIndex const room : {0L, 1L, 8192L}) {
            CFIndex used = -1;
            EXPECT_EQ(
                CFStringGetBytes(string.get(), whole, encoding, loss, false, nullptr, room, &used),
                whole.length);
            EXPECT_EQ(used, static_cast<CFIndex>(encoded(text, encoding).size()));
        }
    }
}

TEST_F(CFStringConversionTest, MeasuringStopsWhereReadingDoes) {
    CPlatformString const string(u"\u00E9\xD800z");
    CFIndex used = -1;
    EXPECT_EQ(CFStringGetBytes(string.get(), CFRangeMake(0, 3), kCFStringEncodingUTF8, loss, false,
                               nullptr, 0, &used),
              1);
    EXPECT_EQ(used, 2);
}

TEST_F(CFStringConversionTest, TheUsedCountMayBeLeftOut) {
    CPlatformString const string(u"ab");
    for (CFStringEncoding const encoding : unicodeEncodings) {
        UInt8 buffer[8] = {};
        EXPECT_EQ(CFStringGetBytes(string.get(), CFRangeMake(0, 2), encoding, loss, false, buffer,
                                   sizeof(buffer), nullptr),
                  2);
        EXPECT_EQ(buffer[0], 'a');
        EXPECT_EQ(CFStringGetBytes(string.get(), CFRangeMake(0, 2), encoding, loss, false, nullptr,
                                   0, nullptr),
                  2);
    }
    EXPECT_EQ(
        CFStringGetBytes(string.get(), CFRangeMake(0, 2), 0x0BAD, loss, false, nullptr, 0, nullptr),
        0);
}

TEST_F(CFStringConversionTest, AnEncodingThatIsNotServedConvertsNothing) {
    CReading const reading = read(u"abc", 0x0BAD);
    EXPECT_EQ(reading.converted, 0);
    EXPECT_EQ(reading.used, 0);
}

TEST_F(CFStringConversionTest, AMutableStringIsReadLikeAnyOther) {
    CPlatformString const text(
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(u"caf\u00E9").get()));
    EXPECT_EQ(read(text.get(), CFRangeMake(0, 4), kCFStringEncodingUTF8, 64).bytes, "caf\xC3\xA9");
}

} // namespace
