#include "0Platform/CoreFoundation/CFLegacyTwin.h"

#include <gtest/gtest.h>

#include <unicode/ucnv.h>
#include <unicode/unorm2.h>
#include <unicode/utf16.h>

#include <memory>

namespace TestSupport {
namespace {

char const* converterOf(CFStringEncoding encoding) {
    switch (encoding) {
    case kCFStringEncodingMacRoman:
        return "macos-0_2-10.2";
    case kCFStringEncodingMacGreek:
        return "macos-6_2-10.4";
    case kCFStringEncodingMacCyrillic:
        return "macos-7_3-10.2";
    case kCFStringEncodingDOSJapanese:
        return "ibm-943_P15A-2003";
    case kCFStringEncodingDOSChineseSimplif:
        return "windows-936-2000";
    case kCFStringEncodingDOSChineseTrad:
        return "windows-950-2000";
    case kCFStringEncodingDOSKorean:
        return "windows-949-2000";
    case kCFStringEncodingDOSHebrew:
        return "ibm-862_P100-1995";
    case kCFStringEncodingDOSArabic:
        return "ibm-864_X110-1999";
    case kCFStringEncodingWindowsLatin1:
        return "ibm-5348_P100-1997";
    default:
        return nullptr;
    }
}

bool isAscii(std::string const& bytes) {
    return static_cast<unsigned char>(bytes[0]) < 0x80;
}

std::string byteText(unsigned byte) {
    return std::string(1, static_cast<char>(byte));
}

} // namespace

CLegacyTwin::CLegacyTwin(CLegacyEncoding const& encoding) {
    char const* const converter = converterOf(encoding.value);
    if (converter != nullptr) {
        readConverter(converter);
    } else if (encoding.value == kCFStringEncodingISOLatin1) {
        for (unsigned byte = 0x80; byte < 0x100; ++byte) {
            codes_[byteText(byte)] = std::u16string(1, static_cast<char16_t>(byte));
            written_[codes_[byteText(byte)]] = byteText(byte);
        }
    } else {
        for (CLegacyCode const& code : legacyCodes()) {
            if (code.encoding == encoding.value && !isAscii(code.bytes)) {
                codes_[code.bytes] = code.units;
                written_[code.units] = code.bytes;
            }
        }
    }
    if (encoding.value == kCFStringEncodingWindowsLatin1) {
        for (char const* const hole : {"\x81", "\x8D", "\x8F", "\x90", "\x9D"})
            codes_.erase(hole);
        for (char16_t control = 0x80; control < 0xA0; ++control)
            written_.erase(std::u16string(1, control));
    }
    for (unsigned byte = 0; byte < 0x80; ++byte) {
        codes_[byteText(byte)] = std::u16string(1, static_cast<char16_t>(byte));
        written_[codes_[byteText(byte)]] = byteText(byte);
    }
    composes_ = encoding.value == kCFStringEncodingMacRoman ||
                encoding.value == kCFStringEncodingISOLatin1 ||
                encoding.value == kCFStringEncodingWindowsLatin1;
    for (auto const& code : codes_)
        drawable_.push_back(code.first);
}

void CLegacyTwin::readConverter(char const* name) {
    UErrorCode status = U_ZERO_ERROR;
    std::unique_ptr<UConverter, void (*)(UConverter*)> const converter(ucnv_open(name, &status),
                                                                       ucnv_close);
    ASSERT_TRUE(U_SUCCESS(status)) << name;
    ucnv_setToUCallBack(converter.get(), UCNV_TO_U_CALLBACK_STOP, nullptr, nullptr, nullptr,
                        &status);
    ucnv_setFromUCallBack(converter.get(), UCNV_FROM_U_CALLBACK_STOP, nullptr, nullptr, nullptr,
                          &status);
    ASSERT_TRUE(U_SUCCESS(status)) << name;
    auto const read = [&](std::string const& bytes) {
        UChar units[8];
        UErrorCode failure = U_ZERO_ERROR;
        int32_t const length = ucnv_toUChars(converter.get(), units, 8, bytes.data(),
                                             static_cast<int32_t>(bytes.size()), &failure);
        if (U_SUCCESS(failure))
            codes_[bytes] = std::u16string(units, static_cast<std::size_t>(length));
        return failure;
    };
    for (unsigned first = 0x80; first < 0x100; ++first) {
        if (read(byteText(first)) != U_TRUNCATED_CHAR_FOUND)
            continue;
        for (unsigned second = 0; second < 0x100; ++second)
            read(byteText(first) + byteText(second));
    }
    for (unsigned unit = 0x80; unit < 0x10000; ++unit) {
        UChar const source = static_cast<UChar>(unit);
        char bytes[8];
        UErrorCode failure = U_ZERO_ERROR;
        int32_t const length =
            ucnv_fromUChars(converter.get(), bytes, sizeof(bytes), &source, 1, &failure);
        std::string const code(bytes, static_cast<std::size_t>(U_SUCCESS(failure) ? length : 0));
        if (!code.empty() && !isAscii(code))
            written_[std::u16string(1, source)] = code;
    }
}

std::optional<std::u16string> CLegacyTwin::decode(std::string const& bytes) const {
    std::u16string units;
    for (std::size_t i = 0; i < bytes.size();) {
        auto code = codes_.find(bytes.substr(i, 1));
        if (code == codes_.end())
            code = codes_.find(bytes.substr(i, 2));
        if (code == codes_.end())
            return std::nullopt;
        units += code->second;
        i += code->first.size();
    }
    return units;
}

std::optional<CEncoded> CLegacyTwin::longest(std::u16string const& units) const {
    for (std::size_t length = std::min<std::size_t>(5, units.size()); length > 0; --length) {
        auto const found = written_.find(units.substr(0, length));
        if (found != written_.end())
            return CEncoded{static_cast<CFIndex>(length), found->second};
    }
    return std::nullopt;
}

std::vector<CEncoded> CLegacyTwin::encode(std::u16string const& units) const {
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* const normalizer = unorm2_getNFCInstance(&status);
    std::vector<CEncoded> characters;
    for (std::size_t i = 0; i < units.size();) {
        std::u16string const rest = units.substr(i, 6);
        std::optional<CEncoded> character = longest(rest);
        if (composes_ && rest.size() > 1) {
            UChar32 const composed = unorm2_composePair(normalizer, rest[0], rest[1]);
            if (composed > 0 && composed < 0x10000) {
                auto const found =
                    written_.find(std::u16string(1, static_cast<char16_t>(composed)));
                if (found != written_.end())
                    character = CEncoded{2, found->second};
            }
        }
        if (!character) {
            bool const pair = rest.size() > 1 && U16_IS_LEAD(rest[0]) && U16_IS_TRAIL(rest[1]);
            character = CEncoded{pair ? 2 : 1, "?"};
        }
        characters.push_back(*character);
        i += static_cast<std::size_t>(character->units);
    }
    return characters;
}

std::u16string CLegacyTwin::drawText(std::mt19937& random, unsigned pieces) const {
    std::u16string text;
    for (std::size_t left = random() % (pieces + 1); left > 0; --left) {
        std::u16string const known = codes_.at(drawable_[random() % drawable_.size()]);
        switch (random() % 8) {
        case 0:
            text.append(random() % 40, static_cast<char16_t>('a' + random() % 26));
            break;
        case 1:
            text += {static_cast<char16_t>(0xD800 + random() % 0x400),
                     static_cast<char16_t>(0xDC00 + random() % 0x400)};
            break;
        case 2:
            text += {static_cast<char16_t>('A' + random() % 58),
                     static_cast<char16_t>(0x300 + random() % 0x30)};
            break;
        case 3:
            text += static_cast<char16_t>(random());
            break;
        case 4:
            text += known.substr(0, 1 + random() % known.size());
            break;
        default:
            text += known;
        }
    }
    return text;
}

std::string CLegacyTwin::drawBytes(std::mt19937& random, unsigned pieces, bool damaged) const {
    std::string bytes;
    for (std::size_t left = random() % (pieces + 1); left > 0; --left) {
        switch (random() % 6) {
        case 0:
            bytes.append(random() % 40, static_cast<char>('a' + random() % 26));
            break;
        case 1:
            if (damaged) {
                bytes += static_cast<char>(random());
                break;
            }
            [[fallthrough]];
        default:
            bytes += drawable_[random() % drawable_.size()];
        }
    }
    return bytes;
}

} // namespace TestSupport
