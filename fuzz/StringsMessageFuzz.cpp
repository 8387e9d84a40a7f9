// A template and its parameters, expanded beside the slow twin of the tests again and again.
//
// The lines of the input are the template, then a name and a value in turn. A byte from 80 to 86
// stands for a character at a border, every other byte of a wide text for itself. What must hold:
// messages of a class that overrides the expansion and of one that doesn't give the twin's text and
// leftovers, and raise where it says that a name is no text. Input whose values lead back to
// themselves is passed over.

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Strings/StringsMessageProbe.h"
#include "1Base/Strings/StringsNaiveExpander.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <iterator>
#include <string>

namespace {

using NaiveExpander::EOutcome;
using NaiveExpander::TEntries;
using TestSupport::CMessageProbe;
using TestSupport::TMessage;
using TestSupport::TParameters;

// The twin's time grows with the square of both.
constexpr std::size_t mostBytes = 2000;
constexpr std::size_t mostReplaced = 200;

// A value may make each run's text longer than the last one's.
constexpr int mostRuns = 4;

constexpr unsigned long borders[] = {0xD800, 0xDFFF, 0x10FFFF, 0x110000, 0x7FF, 0x800, 0xFFFF};

std::wstring wide(std::string const& bytes) {
    std::wstring text;
    for (char const byte : bytes) {
        auto const value = static_cast<unsigned char>(byte);
        bool const isBorder = value >= 0x80 && value - 0x80U < std::size(borders);
        text += static_cast<wchar_t>(isBorder ? borders[value - 0x80] : value);
    }
    return text;
}

// Converting it fails and keeps a platform string, as it is bound to.
constexpr char const* markAlone = "\xEF\xBB\xBF";

// The text up to the next line feed, which is taken along.
std::string takeLine(std::string& input) {
    std::size_t const end = input.find('\n');
    std::string const line = input.substr(0, end);
    input.erase(0, end == std::string::npos ? end : end + 1);
    return line;
}

void check(bool holds) {
    if (!holds)
        std::abort();
}

// One run of a message; false where it raises.
bool run(TMessage const& message, bool addLeftovers) {
    try {
        message.insertParameters(addLeftovers);
        return true;
    } catch (Encoding::TExcEncoding const&) {
        return false;
    }
}

// Leftovers stand behind the text, but where the run raises: also for a name that is no UTF-8.
void checkSuffix(TMessage const& message, NaiveExpander::CResult const& expected) {
    bool const isDone = run(message, true);
    std::wstring const& text = message.getString(false);
    bool const hasSuffix = text.size() > expected.text.size();
    check(text.compare(0, expected.text.size(), expected.text) == 0);
    check(hasSuffix == (isDone && !expected.leftovers.empty()));
    check(!isDone || expected.outcome == EOutcome::eDone);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size > mostBytes)
        return 0;
    std::string input(data, data + size);
    std::wstring text = wide(takeLine(input));
    TEntries entries;
    TParameters parameters;
    while (!input.empty()) {
        std::string const name = takeLine(input);
        if (name == markAlone)
            return 0;
        entries.emplace_back(name, wide(takeLine(input)));
        parameters.add(name, entries.back().second);
    }

    TMessage const plain(text, parameters);
    CMessageProbe const probe(text, parameters);
    for (int i = 0; i < mostRuns; ++i) {
        NaiveExpander::CResult const expected = NaiveExpander::expand(text, entries, mostReplaced);
        if (expected.outcome == EOutcome::eTooManyReplaced)
            return 0;
        bool const isDone = expected.outcome == EOutcome::eDone;
        TMessage const copy(plain);
        check(run(plain, false) == isDone && run(probe, false) == isDone);
        check(plain.getString(false) == expected.text && probe.getString(false) == expected.text);
        check(!isDone || probe.leftovers() == expected.leftovers);
        checkSuffix(copy, expected);
        if (!isDone)
            return 0;
        text = expected.text;
    }
    return 0;
}
