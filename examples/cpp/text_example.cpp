// Reads a list of names in a legacy encoding, sorts it as people count, and adds up the numbers
// behind the names.
//
// Prints:
//     Äpfel 9
//     äpfel 10
//     Birnen 2
//     sum: 21
//     in Latin 1: 7 bytes, in UTF-8: 8

#include "1Base/Encoding/Encoding.h"
#include "1Base/StdUtil/StdUtil.h"
#include "1Base/Strings/Strings.h"

#include <algorithm>
#include <iostream>
#include <string>
#include <vector>

namespace {

using TBytes = std::basic_string<unsigned char>;
using TDecoder = Encoding::CConverter<Strings::stringUTF16, TBytes>;

// The bytes come from a Macintosh, where 8A and 80 are a small and a capital A with diaeresis.
Strings::string fromMacRoman(char const* text) {
    TBytes const bytes(text, text + std::char_traits<char>::length(text));
    return Encoding::convert<Strings::string>(TDecoder::convert(bytes, Encoding::eseMacRoman));
}

bool isBefore(Strings::string const& left, Strings::string const& right) {
    return Strings::strnatcmp(left, right) < 0;
}

} // namespace

int main() {
    std::vector<Strings::string> names = {fromMacRoman("Birnen 2"), fromMacRoman("\x8Apfel 10"),
                                          fromMacRoman("\x80pfel 9")};
    std::sort(names.begin(), names.end(), isBefore);

    int sum = 0;
    for (Strings::string const& name : names) {
        std::cout << Encoding::convert<std::string>(name) << "\n";
        sum += StdUtil::stream_cast<int>(name.substr(name.find(L' ')));
    }
    std::cout << "sum: " << sum << "\n";
    std::cout << "in Latin 1: " << Encoding::convert<TBytes>(names.front()).size()
              << " bytes, in UTF-8: " << Encoding::convert<std::string>(names.front()).size()
              << "\n";
}
