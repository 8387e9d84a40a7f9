#include "support/TableFile.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <fstream>

namespace TestSupport {

std::vector<std::string> splitText(std::string const& text, char separator) {
    std::vector<std::string> parts(1);
    for (char const character : text) {
        if (character == separator)
            parts.emplace_back();
        else
            parts.back() += character;
    }
    return parts;
}

std::vector<std::vector<std::string>> readTable(std::string const& name) {
    std::vector<std::vector<std::string>> rows;
    std::ifstream file(std::string(QORN_TEST_DATA "/") + name);
    EXPECT_TRUE(file.is_open()) << name;
    for (std::string line; std::getline(file, line);) {
        if (!line.empty() && line[0] != '#')
            rows.push_back(splitText(line, '\t'));
    }
    EXPECT_FALSE(rows.empty()) << name;
    return rows;
}

std::u16string unitsOfHex(std::string const& text) {
    std::u16string units;
    if (text == "-")
        return units;
    EXPECT_EQ(text.size() % 4, 0U) << text;
    for (std::size_t i = 0; i + 4 <= text.size(); i += 4)
        units += static_cast<char16_t>(std::stoul(text.substr(i, 4), nullptr, 16));
    return units;
}

} // namespace TestSupport
