// The codecs have fast roads for blocks of like characters. Here each is run against a slow twin
// that goes character by character, on random text at every alignment, length and room.

#include "support/ObjectCount.h"

#include <CoreFoundation/CoreFoundation.h>

#include <algorithm>
#include <cstddef>
#include <iostream>
#include <memory>
#include <optional>
#include <random>
#include <string>
#include <vector>

namespace {

using TBytes = std::vector<UInt8>;
using TUnits = std::vector<UniChar>;
using TCodePoints = std::vector<UInt32>;

// --- The slow twin ---------------------------------------------------------------------------

struct CByteRange {
    UInt8 first;
    UInt8 last;

    bool holds(UInt8 byte) const { return first <= byte && byte <= last; }
};

// The rows of the Unicode Standard's table of well-formed UTF-8 (table 3-7).
std::vector<std::vector<CByteRange>> const wellFormed = {
    {{0x00, 0x7F}},
    {{0xC2, 0xDF}, {0x80, 0xBF}},
    {{0xE0, 0xE0}, {0xA0, 0xBF}, {0x80, 0xBF}},
    {{0xE1, 0xEC}, {0x80, 0xBF}, {0x80, 0xBF}},
    {{0xED, 0xED}, {0x80, 0x9F}, {0x80, 0xBF}},
    {{0xEE, 0xEF}, {0x80, 0xBF}, {0x80, 0xBF}},
    {{0xF0, 0xF0}, {0x90, 0xBF}, {0x80, 0xBF}, {0x80, 0xBF}},
    {{0xF1, 0xF3}, {0x80, 0xBF}, {0x80, 0xBF}, {0x80, 0xBF}},
    {{0xF4, 0xF4}, {0x80, 0x8F}, {0x80, 0xBF}, {0x80, 0xBF}},
};

std::size_t wellFormedLengthAt(TBytes const& bytes, std::size_t index) {
    for (auto const& row : wellFormed) {
        std::size_t matched = 0;
        while (matched < row.size() && index + matched < bytes.size() &&
               row[matched].holds(bytes[index + matched]))
            ++matched;
        if (matched == row.size())
            return matched;
    }
    return 0;
}

void putSlowly(TUnits& units, UInt32 codePoint) {
    if (codePoint >= 0x10000) {
        units.push_back(static_cast<UniChar>(0xD800 + (codePoint - 0x10000) / 0x400));
        units.push_back(static_cast<UniChar>(0xDC00 + (codePoint - 0x10000) % 0x400));
    } else {
        units.push_back(static_cast<UniChar>(codePoint));
    }
}

std::optional<TUnits> decodeUTF8Slowly(TBytes const& bytes) {
    TUnits units;
    bool const hasMark =
        bytes.size() >= 3 && bytes[0] == 0xEF && bytes[1] == 0xBB && bytes[2] == 0xBF;
    for (std::size_t index = hasMark ? 3 : 0; index < bytes.size();) {
        std::size_t const length = wellFormedLengthAt(bytes, index);
        if (length == 0)
            return std::nullopt;
        static constexpr UInt32 payloads[] = {0, 0x7F, 0x1F, 0x0F, 0x07};
        UInt32 codePoint = bytes[index] & payloads[length];
        for (std::size_t i = 1; i < length; ++i)
            codePoint = codePoint * 64 + bytes[index + i] % 64;
        putSlowly(units, codePoint);
        index += length;
    }
    return units;
}

std::optional<TUnits> decodeUTF32Slowly(TBytes const& bytes) {
    if (bytes.size() > 0 && bytes.size() < 4)
        return std::nullopt;
    TUnits units;
    for (std::size_t i = 0; i + 4 <= bytes.size(); i += 4) {
        UInt32 const codePoint =
            bytes[i] + bytes[i + 1] * 0x100U + bytes[i + 2] * 0x10000U + bytes[i + 3] * 0x1000000U;
        if (codePoint > 0x10FFFF || (codePoint >= 0xD800 && codePoint <= 0xDFFF))
            return std::nullopt;
        putSlowly(units, codePoint);
    }
    return units;
}

bool isHigh(UniChar unit) {
    return unit >= 0xD800 && unit <= 0xDBFF;
}

bool isLow(UniChar unit) {
    return unit >= 0xDC00 && unit <= 0xDFFF;
}

TBytes utf8OfCodePoint(UInt32 codePoint) {
    auto const tail = [codePoint](int index) {
        return static_cast<UInt8>(0x80 + (codePoint >> (6 * index)) % 64);
    };
    if (codePoint < 0x80)
        return {static_cast<UInt8>(codePoint)};
    if (codePoint < 0x800)
        return {static_cast<UInt8>(0xC0 + codePoint / 64), tail(0)};
    if (codePoint < 0x10000)
        return {static_cast<UInt8>(0xE0 + codePoint / 4096), tail(1), tail(0)};
    return {static_cast<UInt8>(0xF0 + codePoint / 262144), tail(2), tail(1), tail(0)};
}

TBytes utf32OfCodePoint(UInt32 codePoint) {
    return {static_cast<UInt8>(codePoint), static_cast<UInt8>(codePoint >> 8),
            static_cast<UInt8>(codePoint >> 16), static_cast<UInt8>(codePoint >> 24)};
}

TBytes utf16OfUnit(UniChar unit) {
    return {static_cast<UInt8>(unit), static_cast<UInt8>(unit >> 8)};
}

// The bytes of one character, surrogate pair or unpaired surrogate; nothing where the encoding
// lacks it and there is no loss byte.
std::optional<TBytes> encodeCharacterSlowly(TUnits const& character, CFStringEncoding encoding,
                                            UInt8 lossByte) {
    if (encoding == kCFStringEncodingUTF16LE) {
        TBytes bytes;
        for (UniChar const unit : character)
            for (UInt8 const byte : utf16OfUnit(unit))
                bytes.push_back(byte);
        return bytes;
    }
    bool const pair = character.size() == 2;
    bool const unpaired = !pair && (isHigh(character[0]) || isLow(character[0]));
    if (unpaired && (encoding == kCFStringEncodingUTF8 || lossByte == 0))
        return std::nullopt;
    UInt32 const codePoint =
        unpaired ? lossByte
        : pair   ? 0x10000U + (character[0] - 0xD800U) * 0x400U + (character[1] - 0xDC00U)
                 : character[0];
    return encoding == kCFStringEncodingUTF8 ? utf8OfCodePoint(codePoint)
                                             : utf32OfCodePoint(codePoint);
}

struct CEncoded {
    CFIndex units = 0;
    TBytes bytes;
};

bool operator==(CEncoded const& left, CEncoded const& right) {
    return left.units == right.units && left.bytes == right.bytes;
}

CEncoded encodeSlowly(TUnits const& units, CFStringEncoding encoding, UInt8 lossByte,
                      std::size_t room) {
    CEncoded done;
    for (std::size_t i = 0; i < units.size();) {
        bool const pair = isHigh(units[i]) && i + 1 < units.size() && isLow(units[i + 1]);
        std::size_t const width = pair ? 2 : 1;
        auto const first = units.begin() + static_cast<std::ptrdiff_t>(i);
        auto const bytes = encodeCharacterSlowly(
            TUnits(first, first + static_cast<std::ptrdiff_t>(width)), encoding, lossByte);
        if (!bytes || bytes->size() > room - done.bytes.size())
            break;
        done.bytes.insert(done.bytes.end(), bytes->begin(), bytes->end());
        done.units += static_cast<CFIndex>(width);
        i += width;
    }
    return done;
}

// --- The platform ----------------------------------------------------------------------------

// A copy that ends where its memory ends and begins `offset` bytes into it, so that a sanitizer
// sees each byte read too many.
class CPlacedBytes {
  public:
    CPlacedBytes(TBytes const& bytes, std::size_t offset)
        : memory_(new UInt8[offset + bytes.size()]), offset_(offset), size_(bytes.size()) {
        std::copy(bytes.begin(), bytes.end(), memory_.get() + offset);
    }

    UInt8 const* data() const { return memory_.get() + offset_; }
    CFIndex size() const { return static_cast<CFIndex>(size_); }

  private:
    std::unique_ptr<UInt8[]> memory_;
    std::size_t offset_;
    std::size_t size_;
};

std::optional<TUnits> decode(TBytes const& bytes, CFStringEncoding encoding, std::size_t offset) {
    CPlacedBytes const placed(bytes, offset);
    CFStringRef const string =
        CFStringCreateWithBytes(kCFAllocatorDefault, placed.data(), placed.size(), encoding, false);
    if (string == nullptr)
        return std::nullopt;
    TUnits units(static_cast<std::size_t>(CFStringGetLength(string)));
    CFStringGetCharacters(string, CFRangeMake(0, CFStringGetLength(string)), units.data());
    CFRelease(string);
    return units;
}

class CPlatformString {
  public:
    explicit CPlatformString(TUnits const& units)
        : string_(CFStringCreateWithCharacters(kCFAllocatorDefault, units.data(),
                                               static_cast<CFIndex>(units.size()))) {}
    ~CPlatformString() { CFRelease(string_); }
    CPlatformString(CPlatformString const&) = delete;
    CPlatformString& operator=(CPlatformString const&) = delete;

    // Reads into a buffer of exactly `room` bytes, `offset` bytes into its memory. Past the bytes
    // that are told as used, but within the room, anything may stand.
    CEncoded encode(CFRange range, CFStringEncoding encoding, UInt8 lossByte, std::size_t room,
                    std::size_t offset) const {
        std::unique_ptr<UInt8[]> const memory(new UInt8[offset + room + 1]);
        UInt8* const buffer = memory.get() + offset;
        buffer[room] = 0xA5;
        CEncoded done;
        CFIndex used = -1;
        done.units = CFStringGetBytes(string_, range, encoding, lossByte, false, buffer,
                                      static_cast<CFIndex>(room), &used);
        EXPECT_EQ(buffer[room], 0xA5) << "written past the room of " << room;
        done.bytes.assign(buffer, buffer + used);
        return done;
    }

    CEncoded measure(CFRange range, CFStringEncoding encoding, UInt8 lossByte) const {
        CEncoded done;
        CFIndex used = -1;
        done.units = CFStringGetBytes(string_, range, encoding, lossByte, false, nullptr, 0, &used);
        done.bytes.resize(static_cast<std::size_t>(used));
        return done;
    }

  private:
    CFStringRef string_;
};

// --- Random text -----------------------------------------------------------------------------

class CRandomText {
  public:
    explicit CRandomText(unsigned int seed) : random_(seed) {}

    std::size_t below(std::size_t bound) { return random_() % bound; }

    // Runs of like characters, as blocks need them, with a border case now and then.
    TCodePoints codePoints(std::size_t count) {
        TCodePoints text;
        while (text.size() < count) {
            std::size_t const kind = below(kinds.size());
            for (std::size_t run = 1 + below(below(4) == 0 ? 40 : 6); run > 0; --run)
                text.push_back(codePoint(kinds[kind]));
        }
        text.resize(count);
        return text;
    }

    // One byte changed, dropped, doubled, or the tail cut off.
    void damage(TBytes& bytes) {
        if (bytes.empty())
            return;
        auto const at = bytes.begin() + static_cast<std::ptrdiff_t>(below(bytes.size()));
        switch (below(5)) {
        case 0:
            *at = static_cast<UInt8>(random_());
            break;
        case 1:
            *at = static_cast<UInt8>(*at ^ (1U << below(8)));
            break;
        case 2:
            bytes.erase(at);
            break;
        case 3:
            bytes.insert(at, *at);
            break;
        default:
            bytes.erase(at, bytes.end());
        }
    }

    // An unpaired surrogate in the place of some unit.
    void damage(TUnits& units) {
        if (!units.empty())
            units[below(units.size())] = static_cast<UniChar>(0xD800 + below(0x800));
    }

  private:
    struct CKind {
        UInt32 first;
        UInt32 last;
    };

    UInt32 codePoint(CKind kind) {
        if (below(16) == 0)
            return below(2) == 0 ? kind.first : kind.last;
        return kind.first + static_cast<UInt32>(below(kind.last - kind.first + 1));
    }

    std::vector<CKind> const kinds = {{0x00, 0x7F},     {' ', '~'},         {0x80, 0x7FF},
                                      {0xC0, 0xFF},     {0x800, 0xD7FF},    {0xE000, 0xFFFF},
                                      {0x4E00, 0x9FFF}, {0x10000, 0x10FFFF}};
    std::mt19937 random_;
};

TBytes bytesOf(TCodePoints const& text, TBytes (*bytesOfCodePoint)(UInt32)) {
    TBytes bytes;
    for (UInt32 const codePoint : text)
        for (UInt8 const byte : bytesOfCodePoint(codePoint))
            bytes.push_back(byte);
    return bytes;
}

TBytes utf8Of(TCodePoints const& text) {
    return bytesOf(text, utf8OfCodePoint);
}

TBytes utf32Of(TCodePoints const& text) {
    return bytesOf(text, utf32OfCodePoint);
}

TUnits utf16Of(TCodePoints const& text) {
    TUnits units;
    for (UInt32 const codePoint : text)
        putSlowly(units, codePoint);
    return units;
}

constexpr std::size_t alignments = 16;
constexpr std::size_t shortLengths = 80;

CFRange wholeOf(TUnits const& units) {
    return CFRangeMake(0, static_cast<CFIndex>(units.size()));
}

// --- The tests -------------------------------------------------------------------------------

class CFCodecTest : public TestSupport::CObjectCountTest {
  protected:
    CFCodecTest() { std::cout << "seed " << seed << "\n"; }

    static constexpr unsigned int seed = 20090713;
    CRandomText random_{seed};
};

std::string hexOf(TBytes const& bytes) {
    std::string text;
    for (UInt8 const byte : bytes) {
        text.push_back("0123456789ABCDEF"[byte / 16]);
        text.push_back("0123456789ABCDEF"[byte % 16]);
        text.push_back(' ');
    }
    return text;
}

void expectSameDecoding(TBytes const& bytes, std::size_t offset) {
    ASSERT_EQ(decode(bytes, kCFStringEncodingUTF8, offset), decodeUTF8Slowly(bytes))
        << hexOf(bytes) << "at offset " << offset;
}

TEST_F(CFCodecTest, TheTwinsReadValidUTF8Alike) {
    for (std::size_t length = 0; length <= shortLengths; ++length)
        for (std::size_t offset = 0; offset < alignments; ++offset)
            for (int round = 0; round < 20; ++round)
                ASSERT_NO_FATAL_FAILURE(
                    expectSameDecoding(utf8Of(random_.codePoints(length)), offset));
}

TEST_F(CFCodecTest, TheTwinsReadDamagedUTF8Alike) {
    for (std::size_t length = 0; length <= shortLengths; ++length) {
        for (std::size_t offset = 0; offset < alignments; ++offset) {
            for (int round = 0; round < 40; ++round) {
                TBytes bytes = utf8Of(random_.codePoints(length));
                for (std::size_t damages = 1 + random_.below(2); damages > 0; --damages)
                    random_.damage(bytes);
                ASSERT_NO_FATAL_FAILURE(expectSameDecoding(bytes, offset));
            }
        }
    }
}

TEST_F(CFCodecTest, TheTwinsReadRandomBytesAlike) {
    for (int round = 0; round < 100000; ++round) {
        TBytes bytes(random_.below(12));
        for (UInt8& byte : bytes)
            byte = static_cast<UInt8>(random_.below(256));
        ASSERT_NO_FATAL_FAILURE(expectSameDecoding(bytes, 0));
    }
}

TEST_F(CFCodecTest, TheTwinsReadLongUTF8Alike) {
    for (int round = 0; round < 300; ++round) {
        TBytes bytes = utf8Of(random_.codePoints(random_.below(3000)));
        ASSERT_NO_FATAL_FAILURE(expectSameDecoding(bytes, random_.below(alignments)));
        random_.damage(bytes);
        ASSERT_NO_FATAL_FAILURE(expectSameDecoding(bytes, random_.below(alignments)));
    }
}

// Each malformed sequence at each place within and between blocks of each kind of text.
TEST_F(CFCodecTest, AMalformedSequenceIsFoundAtEveryPlace) {
    std::vector<TBytes> const malformed = {
        {0x80},                   // a stray continuation
        {0xC0, 0x80},             // overlong, two bytes
        {0xC1, 0xBF},             //
        {0xE0, 0x9F, 0xBF},       // overlong, three bytes
        {0xED, 0xA0, 0x80},       // the first surrogate
        {0xED, 0xBF, 0xBF},       // the last surrogate
        {0xF0, 0x8F, 0xBF, 0xBF}, // overlong, four bytes
        {0xF4, 0x90, 0x80, 0x80}, // 110000
        {0xF5, 0x80, 0x80, 0x80}, // a lead above the last
        {0xFF},                   //
        {0xC3},                   // cut off after the lead
        {0xE4, 0xB8},             // cut off, three bytes
        {0xF0, 0x9F, 0x98},       // cut off, four bytes
        {0xE4, 0xB8, 0x41},       // a letter for a continuation
        {0xF0, 0x9F, 0x98, 0xC0}, // a lead for a continuation
    };
    for (UInt32 const filler : {0x41U, 0xE9U, 0x4E2DU, 0x1F600U}) {
        for (TBytes const& wrong : malformed) {
            for (std::size_t place = 0; place <= 40; ++place) {
                TBytes bytes = utf8Of(TCodePoints(40, filler));
                std::size_t const width = bytes.size() / 40;
                bytes.insert(bytes.begin() + static_cast<std::ptrdiff_t>(place * width),
                             wrong.begin(), wrong.end());
                EXPECT_EQ(decode(bytes, kCFStringEncodingUTF8, 0), std::nullopt) << hexOf(bytes);
            }
        }
    }
}

TEST_F(CFCodecTest, AMarkIsRemovedOnceAndOnlyInFront) {
    TBytes const mark = {0xEF, 0xBB, 0xBF};
    for (std::size_t length = 0; length <= shortLengths; ++length) {
        TBytes bytes = utf8Of(random_.codePoints(length));
        TUnits const units = *decodeUTF8Slowly(bytes);
        bytes.insert(bytes.begin(), mark.begin(), mark.end());
        EXPECT_EQ(decode(bytes, kCFStringEncodingUTF8, 0), units);
        bytes.insert(bytes.begin(), mark.begin(), mark.end());
        ASSERT_NO_FATAL_FAILURE(expectSameDecoding(bytes, 0));
    }
}

TEST_F(CFCodecTest, TheTwinsReadUTF32Alike) {
    for (std::size_t length = 0; length <= shortLengths; ++length) {
        for (std::size_t offset = 0; offset < alignments; ++offset) {
            for (int round = 0; round < 20; ++round) {
                TCodePoints text = random_.codePoints(length);
                TBytes bytes = utf32Of(text);
                ASSERT_EQ(decode(bytes, kCFStringEncodingUTF32LE, offset), utf16Of(text));
                random_.damage(bytes);
                ASSERT_EQ(decode(bytes, kCFStringEncodingUTF32LE, offset), decodeUTF32Slowly(bytes))
                    << hexOf(bytes);
            }
        }
    }
}

TEST_F(CFCodecTest, AWrongElementIsFoundAtEveryPlace) {
    for (UInt32 const filler : {0x41U, 0x4E2DU, 0x1F600U})
        for (UInt32 const wrong : {0xD800U, 0xDBFFU, 0xDC00U, 0xDFFFU, 0x110000U, 0x80000041U})
            for (std::size_t place = 0; place < 40; ++place) {
                TCodePoints text(40, filler);
                text[place] = wrong;
                EXPECT_EQ(decode(utf32Of(text), kCFStringEncodingUTF32LE, 0), std::nullopt)
                    << wrong << " at " << place;
            }
}

class CFEncoderTest : public CFCodecTest, public testing::WithParamInterface<CFStringEncoding> {
  protected:
    // Texts of `length` characters: as they are, and with unpaired surrogates in them.
    template <class TCheck>
    void forTextsOf(std::size_t length, int rounds, TCheck const& check) {
        for (int round = 0; round < rounds; ++round) {
            TUnits units = utf16Of(random_.codePoints(length));
            ASSERT_NO_FATAL_FAILURE(check(units));
            random_.damage(units);
            ASSERT_NO_FATAL_FAILURE(check(units));
        }
    }
};

INSTANTIATE_TEST_SUITE_P(AllForms, CFEncoderTest,
                         testing::Values(kCFStringEncodingUTF8, kCFStringEncodingUTF16LE,
                                         kCFStringEncodingUTF32LE),
                         [](testing::TestParamInfo<CFStringEncoding> const& form) {
                             return form.param == kCFStringEncodingUTF8      ? "UTF8"
                                    : form.param == kCFStringEncodingUTF16LE ? "UTF16"
                                                                             : "UTF32";
                         });

TEST_P(CFEncoderTest, TheTwinsWriteAlikeIntoEveryRoom) {
    for (std::size_t length = 1; length <= shortLengths; ++length)
        forTextsOf(length, 4, [&](TUnits const& units) {
            CPlatformString const string(units);
            std::size_t const limit = units.size() * 4 + 4;
            for (std::size_t room = 0; room <= limit; ++room)
                for (UInt8 const lossByte : {UInt8{'?'}, UInt8{0}}) {
                    CEncoded const expected = encodeSlowly(units, GetParam(), lossByte, room);
                    CEncoded const done = string.encode(wholeOf(units), GetParam(), lossByte, room,
                                                        room % alignments);
                    ASSERT_EQ(done.units, expected.units) << "room " << room;
                    ASSERT_EQ(done.bytes, expected.bytes) << "room " << room;
                }
        });
}

TEST_P(CFEncoderTest, TheTwinsMeasureAlike) {
    for (std::size_t length = 1; length <= 3 * shortLengths; ++length)
        forTextsOf(length, 10, [&](TUnits const& units) {
            CPlatformString const string(units);
            for (UInt8 const lossByte : {UInt8{'?'}, UInt8{0}}) {
                CEncoded const expected =
                    encodeSlowly(units, GetParam(), lossByte, units.size() * 4);
                CEncoded const done = string.measure(wholeOf(units), GetParam(), lossByte);
                ASSERT_EQ(done.units, expected.units);
                ASSERT_EQ(done.bytes.size(), expected.bytes.size());
            }
        });
}

// Long stretches of letters, which are measured faster, with other text at every place around them.
TEST_P(CFEncoderTest, TheTwinsMeasureLongTextAlike) {
    for (std::size_t length = 1; length < 2000; length += 1 + random_.below(3)) {
        TUnits units = utf16Of(random_.codePoints(random_.below(8)));
        units.resize(units.size() + length, 'a');
        TUnits const end = utf16Of(random_.codePoints(random_.below(40)));
        units.insert(units.end(), end.begin(), end.end());
        if (random_.below(2) == 0)
            random_.damage(units);
        CPlatformString const string(units);
        CEncoded const expected = encodeSlowly(units, GetParam(), '?', units.size() * 4);
        CEncoded const done = string.measure(wholeOf(units), GetParam(), '?');
        ASSERT_EQ(done.units, expected.units);
        ASSERT_EQ(done.bytes.size(), expected.bytes.size());
    }
}

TEST_P(CFEncoderTest, AnUnpairedSurrogateIsMeasuredAtEveryPlace) {
    for (UniChar const filler : {u'a', u'\u4E2D'}) {
        for (UniChar const surrogate : {u'\xD83D', u'\xDE00'}) {
            for (std::size_t place = 0; place < 1200; ++place) {
                TUnits units(1200, filler);
                units[place] = surrogate;
                CEncoded const done =
                    CPlatformString(units).measure(wholeOf(units), GetParam(), '\0');
                CEncoded const expected = encodeSlowly(units, GetParam(), '\0', units.size() * 4);
                ASSERT_EQ(done.units, expected.units) << "place " << place;
                ASSERT_EQ(done.bytes.size(), expected.bytes.size()) << "place " << place;
            }
        }
    }
}

// A range that begins or ends inside a pair sees half of it, whatever stands beyond.
TEST_P(CFEncoderTest, TheTwinsAgreeOnBothSidesOfEverySplit) {
    for (std::size_t length = 1; length <= shortLengths; ++length)
        forTextsOf(length, 2, [&](TUnits const& units) {
            CPlatformString const string(units);
            for (std::size_t split = 0; split <= units.size(); ++split) {
                auto const middle = units.begin() + static_cast<std::ptrdiff_t>(split);
                std::size_t const room = units.size() * 4;
                ASSERT_EQ(string.encode(CFRangeMake(0, static_cast<CFIndex>(split)), GetParam(),
                                        '?', room, 0),
                          encodeSlowly(TUnits(units.begin(), middle), GetParam(), '?', room));
                TUnits const tail(middle, units.end());
                CFRange const rest =
                    CFRangeMake(static_cast<CFIndex>(split), static_cast<CFIndex>(tail.size()));
                ASSERT_EQ(string.encode(rest, GetParam(), '?', room, 0),
                          encodeSlowly(tail, GetParam(), '?', room));
                ASSERT_EQ(string.measure(rest, GetParam(), '?').units,
                          encodeSlowly(tail, GetParam(), '?', room).units);
            }
        });
}

TEST_P(CFEncoderTest, ALongTextIsWrittenInPassesLikeInOne) {
    for (int round = 0; round < 30; ++round) {
        TUnits const units = utf16Of(random_.codePoints(3000));
        CPlatformString const string(units);
        TBytes bytes;
        CFRange rest = wholeOf(units);
        while (rest.length > 0) {
            std::size_t const room = 4 + random_.below(200);
            CEncoded const pass = string.encode(rest, GetParam(), '?', room, 0);
            ASSERT_GT(pass.units, 0);
            bytes.insert(bytes.end(), pass.bytes.begin(), pass.bytes.end());
            rest = CFRangeMake(rest.location + pass.units, rest.length - pass.units);
        }
        EXPECT_EQ(bytes, encodeSlowly(units, GetParam(), '?', units.size() * 4).bytes);
    }
}

} // namespace
