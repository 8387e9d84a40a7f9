// Splitting and joining beside a plain reading of the rules, for every short text.

#include "2System/FileSys/FileSys.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <cstdio>
#include <random>
#include <string>
#include <vector>

namespace {

using FileSys::CFileSpec;

// All texts of "/", "." and "a" up to `length` characters.
std::vector<std::wstring> textsUpTo(std::size_t length) {
    std::vector<std::wstring> texts = {L""};
    for (std::size_t first = 0; texts[first].size() < length; ++first) {
        for (wchar_t const character : {L'/', L'.', L'a'})
            texts.push_back(texts[first] + character);
    }
    return texts;
}

// The parts of a text, found by walking through it once from the front.
struct CNaiveSplit {
    explicit CNaiveSplit(std::wstring const& text) {
        for (wchar_t const character : text) {
            if (character == L'/') {
                path = isFound ? path + L'/' + file : file;
                isFound = true;
                file.clear();
            } else {
                file += character;
            }
        }
        if (isFound && path.empty())
            path = L"/";
        name = file;
        for (std::size_t i = 0; i < file.size(); ++i) {
            if (file[i] == L'.') {
                hasDot = true;
                name = std::wstring(file.begin(), file.begin() + static_cast<std::ptrdiff_t>(i));
                extension.clear();
            } else if (hasDot) {
                extension += file[i];
            }
        }
    }

    bool isFound = false;
    bool hasDot = false;
    std::wstring path;
    std::wstring file;
    std::wstring name;
    std::wstring extension;
};

// The text before its last component.
std::wstring frontOf(std::wstring const& text, CNaiveSplit const& split) {
    return std::wstring(text.begin(), text.end() - static_cast<std::ptrdiff_t>(split.file.size()));
}

std::wstring naiveWithExtension(std::wstring const& text, std::wstring const& extension,
                                bool replace) {
    CNaiveSplit const split(text);
    std::wstring const bare = replace && split.hasDot ? frontOf(text, split) + split.name : text;
    return replace && extension.empty() ? bare : bare + L'.' + extension;
}

std::wstring naiveJoin(std::wstring const& left, std::wstring const& right) {
    if (left.empty() || right.empty())
        return left + right;
    int const separators = (*left.rbegin() == L'/' ? 1 : 0) + (*right.begin() == L'/' ? 1 : 0);
    if (separators == 0)
        return left + L'/' + right;
    return separators == 1 ? left + right : left + std::wstring(right.begin() + 1, right.end());
}

void expectSplit(std::wstring const& text) {
    CNaiveSplit const expected(text);
    CFileSpec const spec(text);
    ASSERT_EQ(spec.getPath(), expected.path) << testing::PrintToString(text);
    ASSERT_EQ(spec.getFile(), expected.file) << testing::PrintToString(text);
    ASSERT_EQ(spec.getFileName(), expected.name) << testing::PrintToString(text);
    ASSERT_EQ(spec.getFileExtension(), expected.extension) << testing::PrintToString(text);
    ASSERT_EQ(spec.getParentFolder().getFullName(false), expected.path);
    for (std::wstring const& extension : {std::wstring(), std::wstring(L"x"), std::wstring(L".")}) {
        for (bool const replace : {false, true}) {
            CFileSpec changed(text);
            changed.setFileExtension(extension, replace);
            ASSERT_EQ(changed.getFullName(false), naiveWithExtension(text, extension, replace))
                << testing::PrintToString(text);
        }
    }
}

TEST(CFileSysFileSpecTextsTest, EveryShortTextIsSplitByTheRules) {
    std::vector<std::wstring> const texts = textsUpTo(7);
    ASSERT_EQ(texts.size(), 3280U);
    for (std::wstring const& text : texts)
        ASSERT_NO_FATAL_FAILURE(expectSplit(text));
}

TEST(CFileSysFileSpecTextsTest, EveryTwoShortTextsAreJoinedByTheRules) {
    std::vector<std::wstring> const texts = textsUpTo(4);
    ASSERT_EQ(texts.size(), 121U);
    for (std::wstring const& left : texts) {
        for (std::wstring const& right : texts) {
            CFileSpec const joined = CFileSpec(left) + right;
            ASSERT_EQ(joined.getFullName(false), naiveJoin(left, right))
                << testing::PrintToString(left) << " and " << testing::PrintToString(right);
        }
    }
}

TEST(CFileSysFileSpecTextsTest, EveryTwoShortTextsAreComparedByTheRules) {
    for (std::wstring const& left : textsUpTo(4)) {
        for (std::wstring const& right : textsUpTo(4)) {
            std::vector<int> const leftUnits(left.begin(), left.end());
            std::vector<int> const rightUnits(right.begin(), right.end());
            bool isPrefix = rightUnits.size() <= leftUnits.size();
            for (std::size_t i = 0; isPrefix && i < rightUnits.size(); ++i)
                isPrefix = leftUnits[i] == rightUnits[i];
            CFileSpec const spec(left);
            ASSERT_EQ(spec == CFileSpec(right), leftUnits == rightUnits);
            ASSERT_EQ(spec < CFileSpec(right), leftUnits < rightUnits);
            ASSERT_EQ(spec.isSubFolderOf(CFileSpec(right)), isPrefix);
        }
    }
}

TEST(CFileSysFileSpecTextsTest, RandomTextsAreSplitAndJoinedByTheRules) {
    unsigned const seed = 20080229;
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    std::wstring const characters = {
        L'/', L'/', L'.', L'.', L'a', L'\0', L'\u00E9', L'\U0001F600', static_cast<wchar_t>(-1)};
    auto const randomText = [&] {
        std::wstring text;
        for (std::size_t i = random() % 60; i > 0; --i)
            text += characters[random() % characters.size()];
        return text;
    };
    for (int round = 0; round < 20000; ++round) {
        std::wstring const left = randomText();
        std::wstring const right = randomText();
        ASSERT_NO_FATAL_FAILURE(expectSplit(left));
        ASSERT_EQ((CFileSpec(left) + right).getFullName(false), naiveJoin(left, right));
        ASSERT_EQ(CFileSpec(left) < CFileSpec(right),
                  std::vector<int>(left.begin(), left.end()) <
                      std::vector<int>(right.begin(), right.end()));
    }
}

} // namespace
