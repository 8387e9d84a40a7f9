// The conversions between the string kinds beside other libraries. Every contender makes a result
// that it owns, from input of the kind that it takes by nature, and must give the same text.

#include "1Base/Encoding/Encoding.h"

#include "1Base/Encoding/EncodingConverterPeers.h"
#include "support/Benchmark.h"

#include <cstdlib>
#include <iostream>
#include <memory>
#include <random>

namespace {

using namespace EncodingPeers;

// One kind of text; drawn at random, so that no contender lives on a repeated pattern.
struct CScript {
    char const* name;
    wchar_t (*draw)(std::mt19937& random);
};

wchar_t between(std::mt19937& random, unsigned int first, unsigned int last) {
    return static_cast<wchar_t>(first + random() % (last - first + 1));
}

wchar_t drawAscii(std::mt19937& random) {
    return between(random, ' ', '~');
}

// Like French or German prose: about one letter in eight has an accent.
wchar_t drawLatin(std::mt19937& random) {
    return random() % 8 == 0 ? between(random, 0xE0, 0xFF) : between(random, 'a', 'z');
}

wchar_t drawCJK(std::mt19937& random) {
    return between(random, 0x4E00, 0x9FFF);
}

wchar_t drawEmoji(std::mt19937& random) {
    return between(random, 0x1F300, 0x1F64F);
}

constexpr CScript scripts[] = {
    {"ascii", drawAscii}, {"latin", drawLatin}, {"cjk", drawCJK}, {"emoji", drawEmoji}};

constexpr std::size_t sizes[] = {16, 48, 1000, 1000000};

Strings::string textOf(CScript const& script, std::size_t size) {
    std::mt19937 random(size);
    Strings::string text;
    while (text.size() < size)
        text.push_back(script.draw(random));
    return text;
}

// Adds a contender after one trial run: a contender that gives another text measures other work.
template <class TExpected, class TRun>
void addChecked(std::string const& row, char const* contender, TExpected const& expected,
                TRun run) {
    if (!isSameText(run(), expected)) {
        std::cerr << row << ": " << contender << " gives another text\n";
        std::exit(EXIT_FAILURE);
    }
    Benchmarks::add(row, contender, std::move(run));
}

// Adds a contender's four directions. The UTF-16 is of its own type, which may not be copyable.
template <class TPeer>
void addPeer(std::string const& caseName, char const* name, std::string const& utf8,
             std::wstring const& wide) {
    auto const utf16 =
        std::make_shared<decltype(TPeer::utf16OfUTF8(utf8))>(TPeer::utf16OfUTF8(utf8));
    addChecked("UTF8ToWide" + caseName, name, wide, [utf8] { return TPeer::wideOfUTF8(utf8); });
    addChecked("WideToUTF8" + caseName, name, utf8, [wide] { return TPeer::utf8OfWide(wide); });
    addChecked("UTF8ToUTF16" + caseName, name, Encoding::convert<Strings::stringUTF16>(utf8),
               [utf8] { return TPeer::utf16OfUTF8(utf8); });
    addChecked("UTF16ToUTF8" + caseName, name, utf8,
               [utf16] { return TPeer::utf8OfUTF16(*utf16); });
}

void addCase(std::string const& caseName, std::wstring const& wide) {
    std::string const utf8 = Encoding::convert<std::string>(wide);
    addPeer<COurs>(caseName, "ours", utf8, wide);
    addPeer<CIconv>(caseName, "iconv", utf8, wide);
#ifdef QORN_HAVE_ICU
    addPeer<CICUPreflighted>(caseName, "icu:preflighted", utf8, wide);
    addPeer<CICUBounded>(caseName, "icu:bounded", utf8, wide);
#endif
#ifdef QORN_HAVE_QT
    addPeer<CQt>(caseName, "qt:std", utf8, wide);
    addPeer<CQtOwnTypes>(caseName, "qt:own", utf8, wide);
#endif
#ifdef QORN_HAVE_GLIB
    addPeer<CGLib>(caseName, "glib", utf8, wide);
#endif
}

void addBenchmarks() {
    for (CScript const& script : scripts)
        for (std::size_t const size : sizes)
            addCase("/" + std::string(script.name) + "/" + std::to_string(size),
                    textOf(script, size));
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
