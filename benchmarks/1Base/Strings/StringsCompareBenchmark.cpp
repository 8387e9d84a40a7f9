// The comparisons beside other libraries. Both texts are equal but for the case of their letters,
// so every contender goes through to the end, and all of them must answer 0.

#include "1Base/Encoding/Encoding.h"
#include "1Base/Strings/Strings.h"

#include "1Base/Strings/StringsComparePeers.h"
#include "support/Benchmark.h"

#include <cstdlib>
#include <iostream>
#include <random>
#include <string>

namespace {

using namespace ComparePeers;

struct COurs {
    template <class TString>
    static int compare(TString const& a, TString const& b) {
        return Strings::stricmp(a, b);
    }
};

struct COursNatural {
    template <class TString>
    static int compare(TString const& a, TString const& b) {
        return Strings::strnatcmp(a, b);
    }
};

// A letter in both cases; the same twice where the script has none.
struct CLetter {
    wchar_t lower;
    wchar_t upper;
};

struct CScript {
    char const* name;
    CLetter (*draw)(std::mt19937& random);
};

wchar_t between(std::mt19937& random, unsigned int first, unsigned int last) {
    return static_cast<wchar_t>(first + random() % (last - first + 1));
}

CLetter drawASCII(std::mt19937& random) {
    wchar_t const lower = between(random, 'a', 'z');
    return {lower, lower - 'a' + 'A'};
}

// Like French or German prose: about one letter in eight has an accent.
CLetter drawLatin(std::mt19937& random) {
    if (random() % 8 != 0)
        return drawASCII(random);
    wchar_t const lower = between(random, 0xE0, 0xF6);
    return {lower, lower - 0xE0 + 0xC0};
}

CLetter drawGreek(std::mt19937& random) {
    wchar_t const lower = between(random, 0x3B1, 0x3C1);
    return {lower, lower - 0x3B1 + 0x391};
}

CLetter drawCJK(std::mt19937& random) {
    wchar_t const letter = between(random, 0x4E00, 0x9FFF);
    return {letter, letter};
}

constexpr CScript scripts[] = {
    {"ascii", drawASCII}, {"latin", drawLatin}, {"greek", drawGreek}, {"cjk", drawCJK}};

constexpr std::size_t sizes[] = {8, 48, 1000};

struct CPair {
    std::wstring first;
    std::wstring second;
};

// Every second letter stands in different cases.
CPair pairOf(CScript const& script, std::size_t size) {
    std::mt19937 random(static_cast<std::mt19937::result_type>(size));
    CPair pair;
    while (pair.first.size() < size) {
        CLetter const letter = script.draw(random);
        pair.first.push_back(random() % 2 == 0 ? letter.upper : letter.lower);
        pair.second.push_back(random() % 2 == 0 ? letter.upper : letter.lower);
    }
    return pair;
}

// Adds a contender after one trial run: one that finds a difference measures other work.
template <class TContender, class TString>
void add(std::string const& row, char const* name, TString const& a, TString const& b) {
    if (TContender::compare(a, b) != 0) {
        std::cerr << row << ": " << name << " finds a difference\n";
        std::exit(EXIT_FAILURE);
    }
    Benchmarks::add(row, name, [a, b] { return TContender::compare(a, b); });
}

template <class TOurs, class TString>
void addRow(std::string const& row, TString const& a, TString const& b) {
    add<TOurs>(row, "ours", a, b);
#ifdef QORN_HAVE_ICU
    add<CICU>(row, "icu:plain", a, b);
    add<CICUConverted>(row, "icu:convert", a, b);
    add<CICUString>(row, "icu:string", a, b);
#endif
#ifdef QORN_HAVE_QT
    add<CQt>(row, "qt", a, b);
#endif
#ifdef QORN_HAVE_GLIB
    add<CGLib>(row, "glib", a, b);
#endif
}

void addCase(std::string const& caseName, CPair const& pair) {
    std::string const first = Encoding::convert<std::string>(pair.first);
    std::string const second = Encoding::convert<std::string>(pair.second);
    addRow<COurs>("stricmpUTF8" + caseName, first, second);
    addRow<COurs>("stricmpWide" + caseName, pair.first, pair.second);
    // The peers beside it only ignore case, which is less work.
    addRow<COursNatural>("strnatcmpUTF8" + caseName, first, second);
}

void addBenchmarks() {
    for (CScript const& script : scripts)
        for (std::size_t const size : sizes)
            addCase("/" + std::string(script.name) + "/" + std::to_string(size),
                    pairOf(script, size));
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
