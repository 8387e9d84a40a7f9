#include "support/InfoPlist.h"

#include "support/NaiveUnicode.h"

#include <algorithm>
#include <cstddef>
#include <vector>

namespace TestSupport {
namespace {

// An object's type stands in the upper half of its first byte.
enum EMarker : unsigned { integer = 0x10, asciiText = 0x50, utf16Text = 0x60, dictionary = 0xD0 };

std::string bigEndian(std::size_t value, unsigned bytes) {
    std::string text;
    while (bytes-- > 0)
        text += static_cast<char>(value >> (8 * bytes) & 0xFF);
    return text;
}

// A count from 15 on follows as an integer of four bytes.
std::string head(EMarker marker, std::size_t count) {
    if (count < 15)
        return bigEndian(marker + count, 1);
    return bigEndian(marker + 15, 1) + bigEndian(integer + 2, 1) + bigEndian(count, 4);
}

std::string textObject(std::string const& text) {
    auto const isAscii = [](char byte) { return static_cast<unsigned char>(byte) < 0x80; };
    if (std::all_of(text.begin(), text.end(), isAscii))
        return head(asciiText, text.size()) + text;
    std::u16string const units = naiveUTF16(naiveFromUTF8(text).value());
    std::string object = head(utf16Text, units.size());
    for (char16_t const unit : units)
        object += bigEndian(unit, 2);
    return object;
}

// Objects are known by their numbers: the dictionary is the first, then come all keys and values.
std::string dictionaryObject(std::size_t count) {
    std::string object = head(dictionary, count);
    for (std::size_t number = 1; number <= 2 * count; ++number)
        object += bigEndian(number, 1);
    return object;
}

} // namespace

std::string xmlPlist(std::string const& content) {
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
           "<!DOCTYPE plist PUBLIC \"-//Apple//DTD PLIST 1.0//EN\" "
           "\"http://www.apple.com/DTDs/PropertyList-1.0.dtd\">\n"
           "<plist version=\"1.0\">" +
           content + "</plist>\n";
}

std::string xmlInfo(TInfo const& info) {
    std::string content = "<dict>\n";
    for (auto const& [key, value] : info)
        content += "<key>" + key + "</key>\n<string>" + value + "</string>\n";
    return xmlPlist(content + "</dict>\n");
}

std::string binaryInfo(TInfo const& info) {
    std::vector<std::string> objects = {dictionaryObject(info.size())};
    for (auto const& entry : info)
        objects.push_back(textObject(entry.first));
    for (auto const& entry : info)
        objects.push_back(textObject(entry.second));

    std::string bytes = "bplist00";
    std::string offsets;
    for (std::string const& object : objects) {
        offsets += bigEndian(bytes.size(), 4);
        bytes += object;
    }
    // The trailer: unused, size of an offset, size of a number, count, root, place of the offsets.
    return bytes + offsets + bigEndian(0, 6) + bigEndian(4, 1) + bigEndian(1, 1) +
           bigEndian(objects.size(), 8) + bigEndian(0, 8) + bigEndian(bytes.size(), 8);
}

} // namespace TestSupport
