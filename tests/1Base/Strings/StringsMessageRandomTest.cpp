// Expansion beside its slow twin, on random templates, with the text and the leftovers of two runs.
// A message whose class overrides something and one whose class doesn't take different roads.

#include "1Base/Strings/StringsMessageProbe.h"
#include "1Base/Strings/StringsNaiveExpander.h"
#include "support/ObjectCount.h"

#include <iostream>
#include <random>
#include <string>

namespace {

using NaiveExpander::EOutcome;
using NaiveExpander::TEntries;
using TestSupport::CMessageProbe;
using TestSupport::TMessage;
using TestSupport::TParameters;

// Together a million. Each seed is a test of its own, so that they run side by side.
constexpr int templatesPerSeed = 250000;
constexpr unsigned int seeds[] = {1, 2, 3, 4};

// Far more than such short texts need, but for a value that leads back to itself.
constexpr std::size_t mostReplaced = 200;

constexpr char const* names[] = {
    "", "a", "b", "ab", "a b", "(a)", "a", "b", "b", "@", "z", "\xC3\xA9", "\xF0\x9F\x98\x80"};
constexpr wchar_t const* placeholders[] = {L"@()",    L"@(a)", L"@(b)",      L"@(ab)",
                                           L"@(a b)", L"@(@)", L"@(\u00E9)", L"@(\U0001F600)"};
constexpr wchar_t characters[] = {L'@', L'@', L'(', L'(',      L')',         L')',
                                  L'a', L'b', L' ', L'\u00E9', L'\U0001F600'};

class CTemplates {
  public:
    explicit CTemplates(unsigned int seed) : random_(seed) {}

    // At most `most` characters, but for the last placeholder.
    std::wstring text(std::size_t most) {
        std::size_t const length = below(most + 1);
        std::wstring result;
        while (result.size() < length) {
            if (below(4) == 0)
                result += pick(placeholders);
            else
                result += pick(characters);
        }
        return result;
    }

    // With repeated names, and with values that hold placeholders.
    TEntries entries() {
        TEntries result(below(8));
        for (auto& [name, value] : result) {
            name = pick(names);
            value = text(below(3) == 0 ? 6 : 2);
        }
        return result;
    }

  private:
    std::size_t below(std::size_t bound) { return random_() % bound; }

    template <class T, std::size_t size>
    T pick(T const (&from)[size]) {
        return from[below(size)];
    }

    std::mt19937 random_;
};

TParameters parametersOf(TEntries const& entries) {
    TParameters list;
    for (auto const& [name, value] : entries)
        list.add(name, value);
    return list;
}

std::wstring suffixOf(TEntries const& leftovers) {
    std::wstring suffix;
    for (auto const& [name, value] : leftovers) {
        std::wstring wideName;
        for (char const* const known : names) {
            if (name != known)
                continue;
            wideName = name == "\xC3\xA9"           ? L"\u00E9"
                       : name == "\xF0\x9F\x98\x80" ? L"\U0001F600"
                                                    : std::wstring(name.begin(), name.end());
        }
        suffix += (suffix.empty() ? L" (" : L", ") + wideName + L": \"" + value + L"\"";
    }
    return suffix.empty() ? suffix : suffix + L")";
}

class CStringsMessageRandomTest : public TestSupport::CObjectCountTest,
                                  public testing::WithParamInterface<unsigned int> {};

TEST_P(CStringsMessageRandomTest, ExpansionAgreesWithItsSlowTwin) {
    std::cout << "seed " << GetParam() << '\n';
    CTemplates templates(GetParam());
    int drawn = 0;
    int compared = 0;
    int withReplacements = 0;
    for (; compared < templatesPerSeed; ++drawn) {
        std::wstring const text = templates.text(24);
        TEntries const entries = templates.entries();
        NaiveExpander::CResult const first = NaiveExpander::expand(text, entries, mostReplaced);
        if (first.outcome == EOutcome::eTooManyReplaced)
            continue;
        CMessageProbe const message(text, parametersOf(entries));
        TMessage const plain(text, parametersOf(entries));
        ASSERT_EQ(message.getString(true), first.text) << testing::PrintToString(text);
        ASSERT_EQ(plain.getString(true), first.text) << testing::PrintToString(text);
        ASSERT_EQ(message.leftovers(), first.leftovers) << testing::PrintToString(text);
        ++compared;
        withReplacements += first.replaced != 0;

        NaiveExpander::CResult const second =
            NaiveExpander::expand(first.text, entries, mostReplaced);
        if (second.outcome == EOutcome::eTooManyReplaced)
            continue;
        std::wstring const expected = second.text + suffixOf(second.leftovers);
        message.insertParameters(true);
        plain.insertParameters(true);
        ASSERT_EQ(message.getString(false), expected) << testing::PrintToString(text);
        ASSERT_EQ(plain.getString(false), expected) << testing::PrintToString(text);
        ASSERT_EQ(message.leftovers(), second.leftovers) << testing::PrintToString(text);
    }
    std::cout << withReplacements << " with replacements, " << drawn - compared << " left out\n";
    EXPECT_LT(drawn - compared, templatesPerSeed / 10);
    EXPECT_GT(withReplacements, templatesPerSeed / 4);
}

INSTANTIATE_TEST_SUITE_P(Seeds, CStringsMessageRandomTest, testing::ValuesIn(seeds));

} // namespace
