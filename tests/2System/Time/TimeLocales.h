/// Global locales that treat numbers in their own way: one that groups digits, for a test's time,
/// and facets of others.
///
///     TimeTest::CGroupingLocale const locale(',', "\3");   // 12,345,678
#ifndef QORN_TESTS_TIMELOCALES_H
#define QORN_TESTS_TIMELOCALES_H

#include <ios>
#include <locale>
#include <string>
#include <utility>

namespace TimeTest {

template <class TCh>
class CGroupingFacet : public std::numpunct<TCh> {
  public:
    CGroupingFacet(char separator, std::string grouping)
        : separator_(static_cast<TCh>(separator)), grouping_(std::move(grouping)) {}

  protected:
    TCh do_thousands_sep() const override { return separator_; }
    std::string do_grouping() const override { return grouping_; }

  private:
    TCh const separator_;
    std::string const grouping_;
};

class CGroupingLocale {
  public:
    CGroupingLocale(char separator, std::string const& grouping)
        : before_(std::locale::global(std::locale(
              std::locale(std::locale::classic(), new CGroupingFacet<char>(separator, grouping)),
              new CGroupingFacet<wchar_t>(separator, grouping)))) {}
    ~CGroupingLocale() { std::locale::global(before_); }

    CGroupingLocale(CGroupingLocale const&) = delete;
    CGroupingLocale& operator=(CGroupingLocale const&) = delete;

  private:
    std::locale const before_;
};

/// Reads every number as the one behind it.
class CNumbersAhead : public std::num_get<char> {
  protected:
    iter_type do_get(iter_type in, iter_type end, std::ios_base& base,
                     std::ios_base::iostate& state, long& number) const override {
        iter_type const last = std::num_get<char>::do_get(in, end, base, state, number);
        ++number;
        return last;
    }
};

} // namespace TimeTest

#endif
