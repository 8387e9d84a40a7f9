#include "support/LegacyEncodings.h"
#include "support/PlatformString.h"
#include "support/TableFile.h"

#include <gtest/gtest.h>

#include <map>
#include <memory>

namespace TestSupport {
namespace {

CEncoded encodeInto(UInt8* buffer, CFIndex limit, CPlatformString const& text, CFRange range,
                    CFStringEncoding encoding, UInt8 lossByte) {
    CFIndex used = -1;
    CFIndex const units =
        CFStringGetBytes(text.get(), range, encoding, lossByte, false, buffer, limit, &used);
    EXPECT_LE(used, limit);
    return {units, std::string(reinterpret_cast<char const*>(buffer),
                               static_cast<std::size_t>(used < 0 ? 0 : used))};
}

std::string hexDigits(unsigned value, unsigned count) {
    std::string digits;
    for (unsigned i = count; i > 0; --i)
        digits += "0123456789abcdef"[value >> (4 * (i - 1)) & 0xFU];
    return digits;
}

} // namespace

std::vector<CLegacyEncoding> const& legacyEncodings() {
    static std::vector<CLegacyEncoding> const encodings = {
        {"MacRoman", kCFStringEncodingMacRoman, false},
        {"MacJapanese", kCFStringEncodingMacJapanese, true},
        {"MacChineseTrad", kCFStringEncodingMacChineseTrad, true},
        {"MacKorean", kCFStringEncodingMacKorean, true},
        {"MacArabic", kCFStringEncodingMacArabic, false},
        {"MacHebrew", kCFStringEncodingMacHebrew, false},
        {"MacGreek", kCFStringEncodingMacGreek, false},
        {"MacCyrillic", kCFStringEncodingMacCyrillic, false},
        {"MacThai", kCFStringEncodingMacThai, false},
        {"MacChineseSimp", kCFStringEncodingMacChineseSimp, true},
        {"ISOLatin1", kCFStringEncodingISOLatin1, false},
        {"DOSHebrew", kCFStringEncodingDOSHebrew, false},
        {"DOSArabic", kCFStringEncodingDOSArabic, false},
        {"DOSJapanese", kCFStringEncodingDOSJapanese, true},
        {"DOSChineseSimplif", kCFStringEncodingDOSChineseSimplif, true},
        {"DOSKorean", kCFStringEncodingDOSKorean, true},
        {"DOSChineseTrad", kCFStringEncodingDOSChineseTrad, true},
        {"WindowsLatin1", kCFStringEncodingWindowsLatin1, false},
        {"WindowsKoreanJohab", kCFStringEncodingWindowsKoreanJohab, true}};
    return encodings;
}

std::vector<CLegacyCode> const& legacyCodes() {
    static std::vector<CLegacyCode> const codes = [] {
        // The table's numbers are those of the conversion code's list, one floor up.
        std::map<std::string, CFStringEncoding> const values = {
            {"2", kCFStringEncodingMacJapanese},    {"3", kCFStringEncodingMacChineseSimp},
            {"4", kCFStringEncodingMacChineseTrad}, {"5", kCFStringEncodingMacKorean},
            {"6", kCFStringEncodingMacArabic},      {"7", kCFStringEncodingMacHebrew},
            {"23", kCFStringEncodingMacThai},       {"45", kCFStringEncodingWindowsKoreanJohab}};
        std::vector<CLegacyCode> read;
        for (std::vector<std::string> const& row :
             readTable("../../src/0Platform/CoreFoundation/_Imp/Tables/legacy_tables.tsv"))
            read.push_back({values.at(row.at(0)), bytesOfHex(row.at(2)), unitsOfHex(row.at(3))});
        return read;
    }();
    return codes;
}

std::optional<std::u16string> decode(std::string const& bytes, CFStringEncoding encoding) {
    // An allocation of just these bytes, so that a checker of memory sees a read beyond them.
    std::unique_ptr<UInt8[]> const exact(new UInt8[bytes.size()]);
    bytes.copy(reinterpret_cast<char*>(exact.get()), bytes.size());
    CPlatformString const text(CFStringCreateWithBytes(
        kCFAllocatorDefault, exact.get(), static_cast<CFIndex>(bytes.size()), encoding, false));
    if (text.get() == nullptr)
        return std::nullopt;
    return text.units();
}

CEncoded encode(std::u16string const& units, CFStringEncoding encoding, UInt8 lossByte) {
    CPlatformString const text(units);
    std::vector<UInt8> buffer(units.size() * 6 + 16);
    return encodeInto(buffer.data(), static_cast<CFIndex>(buffer.size()), text,
                      CFRangeMake(0, static_cast<CFIndex>(units.size())), encoding, lossByte);
}

CEncoded encodeWithin(CFIndex limit, std::u16string const& units, CFStringEncoding encoding,
                      CFIndex from) {
    CPlatformString const text(units);
    std::unique_ptr<UInt8[]> const buffer(new UInt8[static_cast<std::size_t>(limit)]);
    return encodeInto(buffer.get(), limit, text,
                      CFRangeMake(from, static_cast<CFIndex>(units.size()) - from), encoding, '?');
}

CFIndex measure(std::u16string const& units, CFStringEncoding encoding) {
    CPlatformString const text(units);
    CFIndex used = -1;
    CFIndex const length = static_cast<CFIndex>(units.size());
    EXPECT_EQ(CFStringGetBytes(text.get(), CFRangeMake(0, length), encoding, '?', false, nullptr, 0,
                               &used),
              length);
    return used;
}

std::string bytesOfHex(std::string const& text) {
    std::string bytes;
    if (text == "-")
        return bytes;
    EXPECT_EQ(text.size() % 2, 0U) << text;
    for (std::size_t i = 0; i + 2 <= text.size(); i += 2)
        bytes += static_cast<char>(std::stoul(text.substr(i, 2), nullptr, 16));
    return bytes;
}

std::string hexOf(std::string const& bytes) {
    std::string text;
    for (char const byte : bytes)
        text += hexDigits(static_cast<unsigned char>(byte), 2);
    return text.empty() ? "-" : text;
}

std::string hexOf(std::u16string const& units) {
    std::string text;
    for (char16_t const unit : units)
        text += hexDigits(unit, 4);
    return text.empty() ? "-" : text;
}

} // namespace TestSupport
