/// The conversions of other libraries, each written as a careful caller of that library would, and
/// our own in the same shape. A contender is a struct of four static functions.
#ifndef QORN_BENCHMARKS_ENCODINGCONVERTERPEERS_H
#define QORN_BENCHMARKS_ENCODINGCONVERTERPEERS_H

#include "1Base/Encoding/Encoding.h"

#ifdef QORN_HAVE_GLIB
#    include <glib.h>
#endif
#ifdef QORN_HAVE_ICU
#    include <unicode/ustring.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QString>
#    include <QVector>
#endif

#include <iconv.h>

#include <algorithm>
#include <cstring>
#include <memory>
#include <string>

namespace EncodingPeers {

/// True where both hold the same units, whatever types the two libraries give them.
template <class TResult, class TExpected>
bool isSameText(TResult const& result, TExpected const& expected) {
    static_assert(sizeof(*result.begin()) == sizeof(*expected.begin()));
    return static_cast<std::size_t>(result.end() - result.begin()) == expected.size() &&
           std::memcmp(&*result.begin(), expected.data(),
                       expected.size() * sizeof(*expected.data())) == 0;
}

struct COurs {
    static std::wstring wideOfUTF8(std::string const& text) {
        return Encoding::convert<Strings::string>(text);
    }
    static std::string utf8OfWide(std::wstring const& text) {
        return Encoding::convert<std::string>(text);
    }
    static Strings::stringUTF16 utf16OfUTF8(std::string const& text) {
        return Encoding::convert<Strings::stringUTF16>(text);
    }
    static std::string utf8OfUTF16(Strings::stringUTF16 const& text) {
        return Encoding::convert<std::string>(text);
    }
};

/// The C library's converter. The handles stay open, as opening one costs microseconds.
class CIconv {
  public:
    static std::wstring wideOfUTF8(std::string const& text) {
        static CHandle const handle("WCHAR_T", "UTF-8");
        return convert<std::wstring>(handle, text, text.size());
    }
    static std::string utf8OfWide(std::wstring const& text) {
        static CHandle const handle("UTF-8", "WCHAR_T");
        return convert<std::string>(handle, text, text.size() * 4);
    }
    static std::u16string utf16OfUTF8(std::string const& text) {
        static CHandle const handle("UTF-16LE", "UTF-8");
        return convert<std::u16string>(handle, text, text.size());
    }
    static std::string utf8OfUTF16(std::u16string const& text) {
        static CHandle const handle("UTF-8", "UTF-16LE");
        return convert<std::string>(handle, text, text.size() * 3);
    }

  private:
    struct CHandle {
        CHandle(char const* target, char const* source) : handle(iconv_open(target, source)) {}
        ~CHandle() { iconv_close(handle); }
        CHandle(CHandle const&) = delete;
        CHandle& operator=(CHandle const&) = delete;

        iconv_t handle;
    };

    template <class TTarget, class TSource>
    static TTarget convert(CHandle const& handle, TSource const& text, std::size_t bound) {
        TTarget result(bound, typename TTarget::value_type());
        char* in = const_cast<char*>(reinterpret_cast<char const*>(text.data()));
        std::size_t inLeft = text.size() * sizeof(text[0]);
        char* out = reinterpret_cast<char*>(&result[0]);
        std::size_t outLeft = bound * sizeof(result[0]);
        iconv(handle.handle, &in, &inLeft, &out, &outLeft);
        result.resize(bound - outLeft / sizeof(result[0]));
        return result;
    }
};

#ifdef QORN_HAVE_ICU

/// Asks for each length first, so that every result is made in its final size.
struct CICUPreflighted {
    static std::wstring wideOfUTF8(std::string const& text) {
        std::u16string const units = utf16OfUTF8(text);
        UErrorCode status = U_ZERO_ERROR;
        int32_t length = 0;
        u_strToUTF32(nullptr, 0, &length, units.data(), sizeOf(units), &status);
        std::wstring result(static_cast<std::size_t>(length), L'\0');
        status = U_ZERO_ERROR;
        u_strToUTF32(reinterpret_cast<UChar32*>(&result[0]), length, nullptr, units.data(),
                     sizeOf(units), &status);
        return result;
    }
    static std::string utf8OfWide(std::wstring const& text) {
        auto const* const elements = reinterpret_cast<UChar32 const*>(text.data());
        UErrorCode status = U_ZERO_ERROR;
        int32_t length = 0;
        u_strFromUTF32(nullptr, 0, &length, elements, sizeOf(text), &status);
        std::u16string units(static_cast<std::size_t>(length), u'\0');
        status = U_ZERO_ERROR;
        u_strFromUTF32(&units[0], length, nullptr, elements, sizeOf(text), &status);
        return utf8OfUTF16(units);
    }
    static std::u16string utf16OfUTF8(std::string const& text) {
        UErrorCode status = U_ZERO_ERROR;
        int32_t length = 0;
        u_strFromUTF8(nullptr, 0, &length, text.data(), sizeOf(text), &status);
        std::u16string result(static_cast<std::size_t>(length), u'\0');
        status = U_ZERO_ERROR;
        u_strFromUTF8(&result[0], length, nullptr, text.data(), sizeOf(text), &status);
        return result;
    }
    static std::string utf8OfUTF16(std::u16string const& text) {
        UErrorCode status = U_ZERO_ERROR;
        int32_t length = 0;
        u_strToUTF8(nullptr, 0, &length, text.data(), sizeOf(text), &status);
        std::string result(static_cast<std::size_t>(length), '\0');
        status = U_ZERO_ERROR;
        u_strToUTF8(&result[0], length, nullptr, text.data(), sizeOf(text), &status);
        return result;
    }

    template <class TText>
    static int32_t sizeOf(TText const& text) {
        return static_cast<int32_t>(text.size());
    }
};

/// Makes room for the worst case and cuts the result to what was written. The text in between lies
/// in memory that nobody clears first.
class CICUBounded {
  public:
    static std::wstring wideOfUTF8(std::string const& text) {
        std::unique_ptr<UChar[]> const units(new UChar[text.size()]);
        UErrorCode status = U_ZERO_ERROR;
        int32_t count = 0;
        u_strFromUTF8(units.get(), sizeOf(text), &count, text.data(), sizeOf(text), &status);
        return filled<std::wstring>(count, [&](wchar_t* room, int32_t* length) {
            u_strToUTF32(reinterpret_cast<UChar32*>(room), count, length, units.get(), count,
                         &status);
        });
    }
    static std::string utf8OfWide(std::wstring const& text) {
        int32_t const bound = 2 * sizeOf(text);
        std::unique_ptr<UChar[]> const units(new UChar[static_cast<std::size_t>(bound)]);
        UErrorCode status = U_ZERO_ERROR;
        int32_t count = 0;
        u_strFromUTF32(units.get(), bound, &count, reinterpret_cast<UChar32 const*>(text.data()),
                       sizeOf(text), &status);
        return utf8Of(units.get(), count);
    }
    static std::u16string utf16OfUTF8(std::string const& text) {
        UErrorCode status = U_ZERO_ERROR;
        return filled<std::u16string>(sizeOf(text), [&](UChar* room, int32_t* length) {
            u_strFromUTF8(room, sizeOf(text), length, text.data(), sizeOf(text), &status);
        });
    }
    static std::string utf8OfUTF16(std::u16string const& text) {
        return utf8Of(text.data(), sizeOf(text));
    }

  private:
    template <class TText>
    static int32_t sizeOf(TText const& text) {
        return static_cast<int32_t>(text.size());
    }

    template <class TText, class TFill>
    static TText filled(int32_t bound, TFill const& fill) {
        TText result(static_cast<std::size_t>(bound), typename TText::value_type());
        int32_t length = 0;
        fill(&result[0], &length);
        result.resize(static_cast<std::size_t>(length));
        return result;
    }

    static std::string utf8Of(UChar const* units, int32_t count) {
        UErrorCode status = U_ZERO_ERROR;
        return filled<std::string>(3 * count, [&](char* room, int32_t* length) {
            u_strToUTF8(room, 3 * count, length, units, count, &status);
        });
    }
};

#endif

#ifdef QORN_HAVE_QT

/// In and out of the standard string types.
struct CQt {
    static std::wstring wideOfUTF8(std::string const& text) {
        return utf16OfUTF8(text).toStdWString();
    }
    static std::string utf8OfWide(std::wstring const& text) {
        return utf8OfUTF16(QString::fromStdWString(text));
    }
    static QString utf16OfUTF8(std::string const& text) {
        return QString::fromUtf8(text.data(), static_cast<int>(text.size()));
    }
    static std::string utf8OfUTF16(QString const& text) { return text.toStdString(); }
};

/// Results in the library's own types.
struct CQtOwnTypes {
    static QVector<uint> wideOfUTF8(std::string const& text) {
        return CQt::utf16OfUTF8(text).toUcs4();
    }
    static QByteArray utf8OfWide(std::wstring const& text) {
        return QString::fromUcs4(reinterpret_cast<char32_t const*>(text.data()),
                                 static_cast<int>(text.size()))
            .toUtf8();
    }
    static QString utf16OfUTF8(std::string const& text) { return CQt::utf16OfUTF8(text); }
    static QByteArray utf8OfUTF16(QString const& text) { return text.toUtf8(); }
};

#endif

#ifdef QORN_HAVE_GLIB

/// Results in memory of the library's heap.
class CGLib {
  public:
    template <class TElement>
    struct CText {
        CText(TElement* text, long count) : first(text), length(count) {}

        TElement const* begin() const { return first.get(); }
        TElement const* end() const { return first.get() + length; }

        struct CFree {
            void operator()(TElement* text) const { g_free(text); }
        };
        std::unique_ptr<TElement[], CFree> first;
        long length;
    };

    static CText<gunichar> wideOfUTF8(std::string const& text) {
        glong written = 0;
        gunichar* const result = g_utf8_to_ucs4(text.data(), static_cast<glong>(text.size()),
                                                nullptr, &written, nullptr);
        return {result, written};
    }
    static CText<char> utf8OfWide(std::wstring const& text) {
        glong written = 0;
        char* const result =
            g_ucs4_to_utf8(reinterpret_cast<gunichar const*>(text.data()),
                           static_cast<glong>(text.size()), nullptr, &written, nullptr);
        return {result, written};
    }
    static CText<gunichar2> utf16OfUTF8(std::string const& text) {
        glong written = 0;
        gunichar2* const result = g_utf8_to_utf16(text.data(), static_cast<glong>(text.size()),
                                                  nullptr, &written, nullptr);
        return {result, written};
    }
    static CText<char> utf8OfUTF16(CText<gunichar2> const& text) {
        glong written = 0;
        char* const result = g_utf16_to_utf8(text.begin(), text.length, nullptr, &written, nullptr);
        return {result, written};
    }
};

#endif

} // namespace EncodingPeers

#endif
