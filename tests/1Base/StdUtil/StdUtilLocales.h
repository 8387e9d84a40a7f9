/// Global locales for a test's time.
#ifndef QORN_TESTS_STDUTILLOCALES_H
#define QORN_TESTS_STDUTILLOCALES_H

#include <locale>
#include <string>

namespace StdUtilTest {

/// Groups digits by three, with a dot between the groups.
class CGrouping : public std::numpunct<wchar_t> {
  protected:
    wchar_t do_thousands_sep() const override { return L'.'; }
    wchar_t do_decimal_point() const override { return L','; }
    std::string do_grouping() const override { return "\3"; }
};

/// Writes every number as "#".
class CHidingNumbers : public std::num_put<wchar_t> {
  protected:
    iter_type do_put(iter_type out, std::ios_base&, wchar_t, long) const override {
        return hide(out);
    }
    iter_type do_put(iter_type out, std::ios_base&, wchar_t, unsigned long) const override {
        return hide(out);
    }

  private:
    static iter_type hide(iter_type out) {
        *out = L'#';
        return ++out;
    }
};

/// Takes the letter x for white space and nothing else.
class CBlankX : public std::ctype<wchar_t> {
  protected:
    bool do_is(mask kind, wchar_t character) const override {
        return (kind & space) != 0 ? character == L'x'
                                   : std::ctype<wchar_t>::do_is(kind, character);
    }
};

/// Makes the classic locale with `facet` in it the global one, until the object is gone.
class CGlobalLocale {
  public:
    template <class TFacet>
    explicit CGlobalLocale(TFacet* facet)
        : before_(std::locale::global(std::locale(std::locale::classic(), facet))) {}
    CGlobalLocale(CGlobalLocale const&) = delete;
    CGlobalLocale& operator=(CGlobalLocale const&) = delete;
    ~CGlobalLocale() { std::locale::global(before_); }

  private:
    std::locale const before_;
};

} // namespace StdUtilTest

#endif
