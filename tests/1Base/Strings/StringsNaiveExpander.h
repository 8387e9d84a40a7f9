/// A slow twin of the expansion of messages. Where the real one changes one text in place and looks
/// names up in maps, this one takes the text apart from its front and searches lists.
///
///     NaiveExpander::CResult const result = NaiveExpander::expand(L"@(a)", {{"a", L"1"}}, 100);
///     // result.text == L"1", no leftovers
#ifndef QORN_TESTS_STRINGSNAIVEEXPANDER_H
#define QORN_TESTS_STRINGSNAIVEEXPANDER_H

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

namespace NaiveExpander {

using TEntries = std::vector<std::pair<std::string, std::wstring>>;

enum class EOutcome {
    eDone,
    eNameIsNoText,   ///< the real one raises, with its text as it stands here
    eTooManyReplaced ///< a value may lead back to itself
};

struct CResult {
    EOutcome outcome = EOutcome::eDone;
    std::wstring text;
    TEntries leftovers; ///< sorted by name
    std::size_t replaced = 0;
};

constexpr std::size_t notFound = std::wstring::npos;

/// The index of the parenthesis that closes the one at `open`.
inline std::size_t findMate(std::wstring const& text, std::size_t open) {
    std::size_t next = text.find_first_of(L"()", open + 1);
    while (next != notFound && text[next] != L')') {
        std::size_t const inner = findMate(text, next);
        next = inner == notFound ? notFound : text.find_first_of(L"()", inner + 1);
    }
    return next;
}

inline bool isText(std::wstring const& text) {
    return std::all_of(text.begin(), text.end(), [](wchar_t element) {
        auto const code = static_cast<unsigned long>(element);
        return code < 0xD800 || (code > 0xDFFF && code < 0x110000);
    });
}

inline std::string utf8(std::wstring const& text) {
    std::string bytes;
    auto const put = [&bytes](unsigned long byte) { bytes += static_cast<char>(byte); };
    for (wchar_t const element : text) {
        auto const code = static_cast<unsigned long>(element);
        if (code < 0x80) {
            put(code);
        } else if (code < 0x800) {
            put(0xC0 | code >> 6);
            put(0x80 | (code & 0x3F));
        } else {
            if (code < 0x10000) {
                put(0xE0 | code >> 12);
            } else {
                put(0xF0 | code >> 18);
                put(0x80 | (code >> 12 & 0x3F));
            }
            put(0x80 | (code >> 6 & 0x3F));
            put(0x80 | (code & 0x3F));
        }
    }
    return bytes;
}

/// The value for a placeholder: the first entry of its name that no placeholder has used, or else
/// the first of that name. Null where there is none.
inline std::wstring const* take(std::string const& name, TEntries const& entries,
                                std::vector<bool>& used) {
    std::wstring const* first = nullptr;
    for (std::size_t i = 0; i < entries.size(); ++i) {
        if (entries[i].first != name)
            continue;
        if (!used[i]) {
            used[i] = true;
            return &entries[i].second;
        }
        if (first == nullptr)
            first = &entries[i].second;
    }
    return first;
}

/// One run over `text`, given up after `mostReplaced` replacements.
inline CResult expand(std::wstring const& text, TEntries const& entries, std::size_t mostReplaced) {
    CResult result;
    std::vector<bool> used(entries.size(), false);
    std::wstring rest = text;
    auto const pass = [&](std::size_t count) {
        result.text += rest.substr(0, count);
        rest.erase(0, count);
    };
    while (!rest.empty()) {
        if (rest.substr(0, 2) == L"@@") {
            rest.erase(0, 1);
            pass(1);
            continue;
        }
        std::size_t const mate = rest.substr(0, 2) == L"@(" ? findMate(rest, 1) : notFound;
        if (mate == notFound) {
            pass(1);
            continue;
        }
        std::wstring const name = rest.substr(2, mate - 2);
        if (!isText(name)) {
            result.outcome = EOutcome::eNameIsNoText;
            break;
        }
        std::wstring const* const value = take(utf8(name), entries, used);
        if (value == nullptr) {
            pass(1);
            continue;
        }
        if (++result.replaced > mostReplaced) {
            result.outcome = EOutcome::eTooManyReplaced;
            break;
        }
        rest = *value + rest.substr(mate + 1);
    }
    result.text += rest;
    for (std::size_t i = 0; i < entries.size(); ++i) {
        if (!used[i])
            result.leftovers.push_back(entries[i]);
    }
    std::stable_sort(result.leftovers.begin(), result.leftovers.end(),
                     [](auto const& a, auto const& b) { return a.first < b.first; });
    return result;
}

} // namespace NaiveExpander

#endif
