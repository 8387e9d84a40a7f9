// Comparison of any two texts: it never crashes, answers -1, 0 or 1, finds a text equal to itself,
// gives the same for every kind of text, and agrees with the slow twin that knows no blocks and no
// tables. The opposite order is not bound to give the opposite answer, so that is not asked.
//
// An input is two texts with a byte FF between them, which stands in no UTF-8. They are compared as
// UTF-8, and once more with their bytes taken for UTF-16, where surrogates may lack their partner.

#include "FuzzTexts.h"

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Strings/StringsCompare.h"

#include "0Platform/CoreFoundation/CFStringPlainCompare.h"

#include <CoreFoundation/CoreFoundation.h>

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string>

namespace {

using FuzzTexts::require;

CFStringRef createString(std::u16string const& units) {
    return CFStringCreateWithCharacters(kCFAllocatorDefault,
                                        reinterpret_cast<UniChar const*>(units.data()),
                                        static_cast<CFIndex>(units.size()));
}

int compareUnits(std::u16string const& a, std::u16string const& b, bool natural) {
    CFStringRef const first = createString(a);
    CFStringRef const second = createString(b);
    CFRange const whole = CFRangeMake(0, static_cast<CFIndex>(a.size()));
    CFComparisonResult const result =
        CFStringCompareWithOptions(first, second, whole, natural ? 193 : 1);
    CFRelease(first);
    CFRelease(second);
    return static_cast<int>(result);
}

void checkUnits(std::u16string const& a, std::u16string const& b) {
    for (bool const natural : {false, true}) {
        int const result = compareUnits(a, b, natural);
        require(result >= -1 && result <= 1);
        require(result == plainCompare(a, b, natural));
        require(compareUnits(a, a, natural) == 0);
    }
}

std::u16string unitsOfBytes(std::string const& bytes) {
    std::u16string units(bytes.size() / 2, u'\0');
    std::memcpy(units.data(), bytes.data(), 2 * units.size());
    return units;
}

std::u16string unitsOfText(std::string const& text) {
    Strings::stringUTF16 const units = Encoding::convert<Strings::stringUTF16>(text);
    return std::u16string(units.begin(), units.end());
}

bool isWellFormed(std::string const& text) {
    CFStringRef const ref =
        CFStringCreateWithBytes(kCFAllocatorDefault, reinterpret_cast<UInt8 const*>(text.data()),
                                static_cast<CFIndex>(text.size()), kCFStringEncodingUTF8, false);
    if (ref == nullptr)
        return false;
    CFRelease(ref);
    return true;
}

void checkTexts(std::string const& a, std::string const& b) {
    Strings::string const wideA = Encoding::convert<Strings::string>(a);
    Strings::string const wideB = Encoding::convert<Strings::string>(b);
    std::u16string const unitsA = unitsOfText(a);
    std::u16string const unitsB = unitsOfText(b);
    int const ignoringCase = Strings::stricmp(a, b);
    int const naturally = Strings::strnatcmp(a, b);
    require(ignoringCase == Strings::stricmp(wideA, wideB));
    require(naturally == Strings::strnatcmp(wideA, wideB));
    require(ignoringCase == compareUnits(unitsA, unitsB, false));
    require(naturally == compareUnits(unitsA, unitsB, true));
    checkUnits(unitsA, unitsB);
}

void checkRefused(std::string const& a, std::string const& b) {
    bool isRefused = false;
    try {
        Strings::stricmp(a, b);
    } catch (...) {
        isRefused = true;
    }
    require(isRefused);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    auto const [first, second] = FuzzTexts::twoTexts(data, size);
    checkUnits(unitsOfBytes(first), unitsOfBytes(second));
    if (FuzzTexts::isMarkAlone(first) || FuzzTexts::isMarkAlone(second))
        return 0;
    if (isWellFormed(first) && isWellFormed(second))
        checkTexts(first, second);
    else
        checkRefused(first, second);
    return 0;
}
