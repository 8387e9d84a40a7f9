#include "support/NaiveUnicode.h"

#include <cstddef>

namespace TestSupport {
namespace {

std::string bitsOfByte(char byte) {
    return toBits(static_cast<unsigned char>(byte), 8);
}

char byteOfBits(std::string const& bits) {
    return static_cast<char>(fromBits(bits));
}

std::string naiveSequence(unsigned long value) {
    if (value < 128)
        return {byteOfBits("0" + toBits(value, 7))};
    std::string bits;
    std::string lead;
    if (value < 2048) {
        bits = toBits(value, 11);
        lead = "110";
    } else if (value < 65536) {
        bits = toBits(value, 16);
        lead = "1110";
    } else {
        bits = toBits(value, 21);
        lead = "11110";
    }
    std::size_t position = 8 - lead.size();
    std::string sequence(1, byteOfBits(lead + bits.substr(0, position)));
    for (; position < bits.size(); position += 6)
        sequence += byteOfBits("10" + bits.substr(position, 6));
    return sequence;
}

} // namespace

std::string toBits(unsigned long value, unsigned digits) {
    std::string bits(digits, '0');
    for (std::size_t i = digits; i > 0; --i, value /= 2)
        bits[i - 1] = value % 2 == 0 ? '0' : '1';
    return bits;
}

unsigned long fromBits(std::string const& bits) {
    unsigned long value = 0;
    for (char const bit : bits)
        value = value * 2 + (bit == '1' ? 1 : 0);
    return value;
}

bool isScalarValue(unsigned long value) {
    return value < 0xD800 || (value > 0xDFFF && value < 0x110000);
}

std::string naiveUTF8(std::u32string const& text) {
    std::string bytes;
    for (char32_t const character : text)
        bytes += naiveSequence(character);
    return bytes;
}

std::u16string naiveUTF16(std::u32string const& text) {
    std::u16string units;
    for (char32_t const character : text) {
        if (character < 65536) {
            units += static_cast<char16_t>(character);
            continue;
        }
        std::string const bits = toBits(character - 65536, 20);
        units += static_cast<char16_t>(fromBits("110110" + bits.substr(0, 10)));
        units += static_cast<char16_t>(fromBits("110111" + bits.substr(10)));
    }
    return units;
}

std::optional<std::u32string> naiveFromUTF8(std::string const& bytes) {
    std::u32string text;
    for (std::size_t position = 0; position < bytes.size();) {
        std::size_t const ones = bitsOfByte(bytes[position]).find('0');
        std::size_t const length = ones == 0 ? 1 : ones;
        if (ones == 1 || ones > 4 || position + length > bytes.size())
            return std::nullopt;
        std::string bits = bitsOfByte(bytes[position]).substr(ones);
        for (std::size_t i = position + 1; i < position + length; ++i) {
            std::string const next = bitsOfByte(bytes[i]);
            if (next.substr(0, 2) != "10")
                return std::nullopt;
            bits += next.substr(2);
        }
        unsigned long const value = fromBits(bits);
        // What does not come out the same way again was longer than it had to be.
        if (!isScalarValue(value) || naiveSequence(value) != bytes.substr(position, length))
            return std::nullopt;
        text += static_cast<char32_t>(value);
        position += length;
    }
    return text;
}

std::optional<std::u32string> naiveFromUTF16(std::u16string const& units) {
    std::u32string text;
    for (std::size_t position = 0; position < units.size(); ++position) {
        std::string const bits = toBits(units[position], 16);
        if (bits.substr(0, 5) != "11011") {
            text += units[position];
            continue;
        }
        if (bits[5] == '1' || position + 1 == units.size())
            return std::nullopt;
        std::string const next = toBits(units[++position], 16);
        if (next.substr(0, 6) != "110111")
            return std::nullopt;
        text += static_cast<char32_t>(65536 + fromBits(bits.substr(6) + next.substr(6)));
    }
    return text;
}

} // namespace TestSupport
