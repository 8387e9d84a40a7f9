// What a running framework answered, row by row. The rows whose answer is not ours on purpose are
// listed by name, with the reason and with the answer that we give.

#include "support/LegacyEncodings.h"
#include "support/ObjectCount.h"
#include "support/TableFile.h"

#include <set>
#include <string>
#include <vector>

namespace {

using namespace TestSupport;
using CFLegacyVectorsTest = CObjectCountTest;

constexpr char const* uncomposedMark =
    "a base that can't be composed with its mark stays itself, and the mark is one \"?\"; the "
    "framework loses one of the two";
constexpr char const* supplementary =
    "a character is one \"?\", also where it is a surrogate pair; the framework's own single-byte "
    "converters write two";
constexpr char const* ignorable =
    "a default-ignorable character is one like any other and \"?\" where it is missing; the "
    "framework's other converters drop it";
constexpr char const* asciiByte =
    "ASCII bytes are ASCII whatever stands beside them; the framework swaps control characters as "
    "soon as the text is not all ASCII";
constexpr char const* notServed =
    "an encoding that is not served fails for ASCII too; the framework takes a short cut for it";
constexpr char const* served =
    "served from a table of our own; that installation of the framework lacked it";
constexpr char const* strayByte =
    "a stray A9 is malformed like any other; the framework replaces it with U+FFFD";
constexpr char const* oddByte =
    "this is UTF-16, of which an odd byte is ignored; the framework does not serve it and takes "
    "its short cut for ASCII";

struct CDeviation {
    char const* kind;
    CFStringEncoding encoding;
    char const* input;
    char const* answer;
    char const* reason;
};

constexpr CDeviation deviations[] = {
    {"enc", 0, "00610328", "2/2/613f", uncomposedMark},
    {"enc", 0, "006103010302", "3/2/873f", uncomposedMark},
    {"enc", 0, "007803010079", "3/3/783f79", uncomposedMark},
    {"enc", 0, "4e000301", "2/2/3f3f", uncomposedMark},
    {"enc", 0, "00e90301", "2/2/8e3f", uncomposedMark},
    {"enc", 1280, "00610328", "2/2/613f", uncomposedMark},
    {"enc", 1280, "006103010302", "3/2/e13f", uncomposedMark},
    {"enc", 1280, "007803010079", "3/3/783f79", uncomposedMark},
    {"enc", 1280, "4e000301", "2/2/3f3f", uncomposedMark},

    {"enc", 0, "d840dc00", "2/1/3f", supplementary},
    {"enc", 0, "d840dc0b", "2/1/3f", supplementary},
    {"enc", 0, "d83dde00", "2/1/3f", supplementary},
    {"enc", 1280, "d840dc0b", "2/1/3f", supplementary},
    {"enc", 513, "d840dc0b", "2/1/3f", supplementary},

    {"enc", 6, "200b", "1/1/3f", ignorable},
    {"enc", 6, "200e", "1/1/3f", ignorable},
    {"enc", 6, "202a", "1/1/3f", ignorable},
    {"enc", 7, "200b", "1/1/3f", ignorable},
    {"enc", 7, "200d", "1/1/3f", ignorable},
    {"enc", 7, "00ad", "1/1/3f", ignorable},
    {"enc", 1047, "200b", "1/1/3f", ignorable},
    {"enc", 1047, "200e", "1/1/3f", ignorable},
    {"enc", 1047, "200f", "1/1/3f", ignorable},
    {"enc", 1047, "202a", "1/1/3f", ignorable},
    {"enc", 1049, "200d", "1/1/3f", ignorable},
    {"enc", 1049, "200e", "1/1/3f", ignorable},
    {"enc", 1049, "202a", "1/1/3f", ignorable},
    {"enc", 1056, "00ad", "1/1/3f", ignorable},
    {"enc", 1056, "200e", "1/1/3f", ignorable},
    {"enc", 1056, "200f", "1/1/3f", ignorable},
    {"enc", 1056, "202a", "1/1/3f", ignorable},
    {"enc", 1056, "feff", "1/1/3f", ignorable},
    {"enc", 1057, "00ad", "1/1/3f", ignorable},
    {"enc", 1057, "200b", "1/1/3f", ignorable},
    {"enc", 1057, "200d", "1/1/3f", ignorable},
    {"enc", 1057, "202a", "1/1/3f", ignorable},
    {"enc", 1057, "feff", "1/1/3f", ignorable},
    {"enc", 1058, "200f", "1/1/3f", ignorable},
    {"enc", 1059, "00ad", "1/1/3f", ignorable},
    {"enc", 1059, "200b", "1/1/3f", ignorable},
    {"enc", 1059, "200f", "1/1/3f", ignorable},
    {"enc", 1059, "202a", "1/1/3f", ignorable},
    {"enc", 1059, "feff", "1/1/3f", ignorable},

    {"dec", 1056, "c47f", "ff84007f", asciiByte},

    {"dec", 12, "41", "NULL", notServed},
    {"dec", 13, "41", "NULL", notServed},
    {"dec", 14, "41", "NULL", notServed},
    {"dec", 15, "41", "NULL", notServed},
    {"dec", 16, "41", "NULL", notServed},
    {"dec", 17, "41", "NULL", notServed},
    {"dec", 19, "41", "NULL", notServed},
    {"dec", 20, "41", "NULL", notServed},
    {"dec", 23, "41", "NULL", notServed},
    {"dec", 24, "41", "NULL", notServed},
    {"dec", 26, "41", "NULL", notServed},
    {"dec", 27, "41", "NULL", notServed},
    {"enc", 12, "0041", "0/0/-", notServed},
    {"enc", 13, "0041", "0/0/-", notServed},
    {"enc", 14, "0041", "0/0/-", notServed},
    {"enc", 15, "0041", "0/0/-", notServed},
    {"enc", 23, "0041", "0/0/-", notServed},
    {"enc", 26, "0041", "0/0/-", notServed},
    {"enc", 27, "0041", "0/0/-", notServed},
    {"enc", 30, "0041", "0/0/-", notServed},

    {"dec", 1, "41", "0041", served},
    {"enc", 1, "0041", "1/1/41", served},

    {"dec", 0x08000100, "41a9", "NULL", strayByte},
    {"dec", 0x08000100, "41a942", "NULL", strayByte},
    {"dec", 0x08000100, "c3a9a9", "NULL", strayByte},
    {"dec", 0x08000100, "e282aca9", "NULL", strayByte},

    {"dec", 255, "41", "-", oddByte},
};

CDeviation const* findDeviation(std::vector<std::string> const& row) {
    for (CDeviation const& deviation : deviations) {
        if (row[0] == deviation.kind && std::stoul(row[2]) == deviation.encoding &&
            row[3] == deviation.input)
            return &deviation;
    }
    return nullptr;
}

// Our answer to a row, in the words of the file.
std::string answerOf(std::vector<std::string> const& row) {
    auto const encoding = static_cast<CFStringEncoding>(std::stoul(row[2]));
    if (row[0] == "dec") {
        std::optional<std::u16string> const text = decode(bytesOfHex(row[3]), encoding);
        return text ? hexOf(*text) : "NULL";
    }
    CEncoded const encoded = encode(unitsOfHex(row[3]), encoding);
    return std::to_string(encoded.units) + "/" + std::to_string(encoded.bytes.size()) + "/" +
           hexOf(encoded.bytes);
}

TEST_F(CFLegacyVectorsTest, EachRowIsAnsweredAsTheFrameworkDoesOrAsListed) {
    std::set<CDeviation const*> met;
    std::size_t rows = 0;
    for (std::vector<std::string> const& row : readTable("encodings.tsv")) {
        ASSERT_GE(row.size(), 6U);
        SCOPED_TRACE(row[0] + " " + row[2] + " " + row[3]);
        ASSERT_TRUE(row[0] == "dec" || row[0] == "enc");
        ++rows;
        std::string const answer = answerOf(row);
        bool const agrees = answer == row[4] || (row[5] != "=" && answer == row[5]);
        CDeviation const* const deviation = findDeviation(row);
        if (deviation == nullptr) {
            EXPECT_TRUE(agrees) << "the framework says " << row[4] << ", we say " << answer;
            continue;
        }
        met.insert(deviation);
        EXPECT_FALSE(agrees) << "listed, but no longer different: " << deviation->reason;
        EXPECT_EQ(answer, deviation->answer) << deviation->reason;
    }
    EXPECT_EQ(rows, 5321U);
    for (CDeviation const& deviation : deviations)
        EXPECT_EQ(met.count(&deviation), 1U)
            << deviation.kind << " " << deviation.encoding << " " << deviation.input
            << " is listed, but no row of the file";
}

} // namespace
