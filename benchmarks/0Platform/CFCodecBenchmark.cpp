// Text in legacy encodings beside the C library's iconv and ICU's converters. Every contender makes
// a result that it owns and must give the same one. The peers' handles stay open, since opening one
// costs microseconds; such a handle serves one thread, and ours any number.

#include "1Base/Encoding/Encoding.h"

#include "support/Benchmark.h"

#ifdef QORN_HAVE_ICU
#    include <unicode/ucnv.h>
#endif

#include <iconv.h>

#include <algorithm>
#include <cstddef>
#include <cstdlib>
#include <iostream>
#include <memory>
#include <random>
#include <string>
#include <type_traits>
#include <utility>

namespace {

using Encoding::ESysEncoding;
using Strings::stringUTF16;
using TBytes = std::basic_string<unsigned char>;

struct CEncoding {
    char const* name;
    ESysEncoding number;
    char const* iconvName;
    char const* icuName;
    char16_t (*draw)(std::mt19937& random);
};

char16_t between(std::mt19937& random, unsigned int first, unsigned int last) {
    return static_cast<char16_t>(first + random() % (last - first + 1));
}

char16_t drawAscii(std::mt19937& random) {
    return between(random, ' ', '~');
}

// Prose with about one accent in eight letters.
char16_t drawWestern(std::mt19937& random) {
    return random() % 8 == 0 ? between(random, 0xE0, 0xFF) : between(random, 'a', 'z');
}

char16_t drawJapanese(std::mt19937& random) {
    return random() % 2 == 0 ? between(random, 0x3041, 0x3093) : between(random, 0x4E00, 0x9FA0);
}

char16_t drawChinese(std::mt19937& random) {
    return between(random, 0x4E00, 0x9FA0);
}

constexpr CEncoding encodings[] = {
    {"shift-jis", Encoding::eseWinJapanese, "CP932", "ibm-943_P15A-2003", drawJapanese},
    {"gbk", Encoding::eseWinSimplifiedChinese, "GBK", "windows-936-2000", drawChinese},
    {"latin-1", Encoding::eseISO8859_1, "ISO-8859-1", "ISO-8859-1", drawWestern},
    {"windows-1252", Encoding::eseWinAnsi, "CP1252", "ibm-5348_P100-1997", drawWestern},
    {"mac-roman", Encoding::eseMacRoman, "MACINTOSH", "macos-0_2-10.2", drawWestern},
};

constexpr std::size_t sizes[] = {48, 1000, 100000};

struct COurs {
    explicit COurs(CEncoding const& encoding) : number(encoding.number) {}

    stringUTF16 read(TBytes const& bytes) const {
        return Encoding::CConverter<stringUTF16, TBytes>::convert(bytes, number);
    }
    TBytes write(stringUTF16 const& units) const {
        return Encoding::CConverter<TBytes, stringUTF16>::convert(units, number);
    }

    ESysEncoding number;
};

struct CIconv {
    explicit CIconv(CEncoding const& encoding)
        : reader(iconv_open("UTF-16LE", encoding.iconvName), iconv_close),
          writer(iconv_open(encoding.iconvName, "UTF-16LE"), iconv_close) {}

    std::u16string read(TBytes const& bytes) const {
        return convert<std::u16string>(reader.get(), bytes, bytes.size());
    }
    std::string write(stringUTF16 const& units) const {
        return convert<std::string>(writer.get(), units, units.size() * 2);
    }

    template <class TTarget, class TSource>
    static TTarget convert(iconv_t handle, TSource const& text, std::size_t bound) {
        using TElement = typename TTarget::value_type;
        TTarget result(bound, TElement());
        char* in = const_cast<char*>(reinterpret_cast<char const*>(text.data()));
        std::size_t inLeft = text.size() * sizeof(text[0]);
        char* out = reinterpret_cast<char*>(&result[0]);
        std::size_t outLeft = bound * sizeof(TElement);
        iconv(handle, &in, &inLeft, &out, &outLeft);
        result.resize(bound - outLeft / sizeof(TElement));
        return result;
    }

    using THandle = std::shared_ptr<std::remove_pointer_t<iconv_t>>;
    THandle reader;
    THandle writer;
};

#ifdef QORN_HAVE_ICU
struct CICU {
    explicit CICU(CEncoding const& encoding) {
        UErrorCode status = U_ZERO_ERROR;
        converter.reset(ucnv_open(encoding.icuName, &status), ucnv_close);
    }

    std::u16string read(TBytes const& bytes) const {
        std::u16string result(bytes.size(), u'\0');
        UErrorCode status = U_ZERO_ERROR;
        int32_t const length =
            ucnv_toUChars(converter.get(), &result[0], sizeOf(result),
                          reinterpret_cast<char const*>(bytes.data()), sizeOf(bytes), &status);
        result.resize(static_cast<std::size_t>(length));
        return result;
    }
    std::string write(stringUTF16 const& units) const {
        std::string result(units.size() * 2, '\0');
        UErrorCode status = U_ZERO_ERROR;
        int32_t const length =
            ucnv_fromUChars(converter.get(), &result[0], sizeOf(result),
                            reinterpret_cast<UChar const*>(units.data()), sizeOf(units), &status);
        result.resize(static_cast<std::size_t>(length));
        return result;
    }

    template <class TText>
    static int32_t sizeOf(TText const& text) {
        return static_cast<int32_t>(text.size());
    }

    std::shared_ptr<UConverter> converter;
};
#endif

// True where both hold the same elements, of whatever types.
template <class TLeft, class TRight>
bool isSame(TLeft const& left, TRight const& right) {
    using TElement = std::make_unsigned_t<std::remove_const_t<
        std::conditional_t<sizeof(left[0]) == 1, unsigned char, unsigned short>>>;
    return std::equal(left.begin(), left.end(), right.begin(), right.end(), [](auto a, auto b) {
        return static_cast<TElement>(a) == static_cast<TElement>(b);
    });
}

// A text of characters that come back as they are.
stringUTF16 textOf(CEncoding const& encoding, char16_t (*draw)(std::mt19937& random),
                   std::size_t size) {
    COurs const ours(encoding);
    std::mt19937 random(static_cast<unsigned int>(size));
    stringUTF16 text;
    while (text.size() < size) {
        stringUTF16 const character(1, static_cast<short>(draw(random)));
        if (ours.read(ours.write(character)) == character)
            text += character;
    }
    return text;
}

// A contender that gives another result measures other work: that ends the program.
template <class TContender>
void addContender(std::string const& row, char const* name, CEncoding const& encoding,
                  stringUTF16 const& units) {
    COurs const ours(encoding);
    TContender const contender(encoding);
    TBytes const bytes = ours.write(units);
    if (!isSame(contender.read(bytes), units) || !isSame(contender.write(units), bytes)) {
        std::cerr << row << ": " << name << " gives another text\n";
        std::exit(EXIT_FAILURE);
    }
    Benchmarks::add("LegacyToUTF16" + row, name,
                    [contender, bytes] { return contender.read(bytes); });
    Benchmarks::add("UTF16ToLegacy" + row, name,
                    [contender, units] { return contender.write(units); });
}

void addBenchmarks() {
    for (CEncoding const& encoding : encodings) {
        for (bool const isAscii : {false, true}) {
            for (std::size_t const size : sizes) {
                stringUTF16 const units =
                    textOf(encoding, isAscii ? drawAscii : encoding.draw, size);
                std::string const row = std::string("/") + encoding.name +
                                        (isAscii ? "-ascii/" : "/") + std::to_string(size);
                addContender<COurs>(row, "ours", encoding, units);
                addContender<CIconv>(row, "iconv", encoding, units);
#ifdef QORN_HAVE_ICU
                addContender<CICU>(row, "icu", encoding, units);
#endif
            }
        }
    }
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
