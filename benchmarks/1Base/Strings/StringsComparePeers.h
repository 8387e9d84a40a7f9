/// The case-blind comparisons of other libraries, each written as a careful caller of that library
/// would. Every contender starts from our kinds of text, so each of them converts first.
#ifndef QORN_BENCHMARKS_STRINGSCOMPAREPEERS_H
#define QORN_BENCHMARKS_STRINGSCOMPAREPEERS_H

#include "1Base/Encoding/Encoding.h"

#ifdef QORN_HAVE_GLIB
#    include <glib.h>
#endif
#ifdef QORN_HAVE_ICU
#    include <unicode/stringoptions.h>
#    include <unicode/unistr.h>
#    include <unicode/ustring.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QString>
#endif

#include <cstdint>
#include <cstring>
#include <memory>
#include <string>

namespace ComparePeers {

#ifdef QORN_HAVE_ICU

/// Plain arrays of the worst-case size, then the C function.
class CICU {
  public:
    template <class TString>
    static int compare(TString const& a, TString const& b) {
        CUnits const first(a);
        CUnits const second(b);
        UErrorCode status = U_ZERO_ERROR;
        return u_strCaseCompare(first.units.get(), first.length, second.units.get(), second.length,
                                U_FOLD_CASE_DEFAULT | U_COMPARE_CODE_POINT_ORDER, &status);
    }

  private:
    struct CUnits {
        explicit CUnits(std::string const& text) : units(new UChar[text.size()]) {
            int32_t const size = static_cast<int32_t>(text.size());
            UErrorCode status = U_ZERO_ERROR;
            u_strFromUTF8(units.get(), size, &length, text.data(), size, &status);
        }
        explicit CUnits(std::wstring const& text) : units(new UChar[2 * text.size()]) {
            int32_t const size = static_cast<int32_t>(text.size());
            UErrorCode status = U_ZERO_ERROR;
            u_strFromUTF32(units.get(), 2 * size, &length,
                           reinterpret_cast<UChar32 const*>(text.data()), size, &status);
        }

        std::unique_ptr<UChar[]> units;
        int32_t length = 0;
    };
};

/// The C function behind our own conversion: what the comparison itself costs is the difference.
class CICUConverted {
  public:
    template <class TString>
    static int compare(TString const& a, TString const& b) {
        Strings::stringUTF16 const first = Encoding::convert<Strings::stringUTF16>(a);
        Strings::stringUTF16 const second = Encoding::convert<Strings::stringUTF16>(b);
        UErrorCode status = U_ZERO_ERROR;
        return u_strCaseCompare(
            reinterpret_cast<UChar const*>(first.data()), static_cast<int32_t>(first.size()),
            reinterpret_cast<UChar const*>(second.data()), static_cast<int32_t>(second.size()),
            U_FOLD_CASE_DEFAULT | U_COMPARE_CODE_POINT_ORDER, &status);
    }
};

/// The library's string class, which holds short texts without the heap.
class CICUString {
  public:
    template <class TString>
    static int compare(TString const& a, TString const& b) {
        return unitsOf(a).caseCompare(unitsOf(b), U_FOLD_CASE_DEFAULT | U_COMPARE_CODE_POINT_ORDER);
    }

  private:
    using CText = U_ICU_NAMESPACE::UnicodeString;

    static CText unitsOf(std::string const& text) { return CText::fromUTF8(text); }
    static CText unitsOf(std::wstring const& text) {
        return CText::fromUTF32(reinterpret_cast<UChar32 const*>(text.data()),
                                static_cast<int32_t>(text.size()));
    }
};

#endif

#ifdef QORN_HAVE_QT

/// Folds character by character, so a sharp s is not "ss" here.
class CQt {
  public:
    template <class TString>
    static int compare(TString const& a, TString const& b) {
        return unitsOf(a).compare(unitsOf(b), Qt::CaseInsensitive);
    }

  private:
    static QString unitsOf(std::string const& text) { return QString::fromStdString(text); }
    static QString unitsOf(std::wstring const& text) { return QString::fromStdWString(text); }
};

#endif

#ifdef QORN_HAVE_GLIB

class CGLib {
  public:
    template <class TString>
    static int compare(TString const& a, TString const& b) {
        return std::strcmp(folded(a).get(), folded(b).get());
    }

  private:
    struct CFree {
        void operator()(void* text) const { g_free(text); }
    };
    using CText = std::unique_ptr<char, CFree>;

    static CText folded(std::string const& text) {
        return CText(g_utf8_casefold(text.data(), static_cast<gssize>(text.size())));
    }
    static CText folded(std::wstring const& text) {
        glong written = 0;
        CText const narrow(g_ucs4_to_utf8(reinterpret_cast<gunichar const*>(text.data()),
                                          static_cast<glong>(text.size()), nullptr, &written,
                                          nullptr));
        return CText(g_utf8_casefold(narrow.get(), written));
    }
};

#endif

} // namespace ComparePeers

#endif
