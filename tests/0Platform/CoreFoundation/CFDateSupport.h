/// What the tests of dates share: an environment of their own, and short forms of the calls.
///
///     setZone("Europe/Berlin");
///     setLocale("de_DE");
///     double const at = composed({2021, 3, 5, 8, 5, 9});   // 636620709
///     textOf(at, kCFDateFormatterMediumStyle, kCFDateFormatterNoStyle);   // u"05.03.2021"
#ifndef QORN_TESTS_CFDATESUPPORT_H
#define QORN_TESTS_CFDATESUPPORT_H

#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"
#include "support/Zone.h"

#include <optional>
#include <ostream>
#include <random>
#include <string>

namespace TestSupport {

/// A local date and time, as written.
struct CLocalTime {
    int year = 1;
    int month = 1;
    int day = 1;
    int hour = 0;
    int minute = 0;
    int second = 0;
};

inline std::ostream& operator<<(std::ostream& out, CLocalTime const& time) {
    return out << time.year << '-' << time.month << '-' << time.day << ' ' << time.hour << ':'
               << time.minute << ':' << time.second;
}

/// Each test runs in a process of its own, so the environment is its to change. It begins without
/// any locale and zone.
class CDateTest : public CObjectCountTest {
  protected:
    void SetUp() override;

    /// Without a value the variable is unset. The C library is not told of a zone (`tzset`): the
    /// platform has to do that.
    static void setZone(std::optional<std::string> const& zone);
    static void setLocale(std::optional<std::string> const& locale);
};

/// The one of the zones to try that is no name.
constexpr char const* zoneRule = "EST5EDT,M3.2.0,M11.1.0";

/// The point in time in the process's zone, by a calendar made for it; NaN and a failed test where
/// there is none.
CFAbsoluteTime composed(CLocalTime const& time);

/// The same of a calendar that lives.
std::optional<CFAbsoluteTime> composedBy(CFCalendarRef calendar, CLocalTime const& time);

/// The text in the process's locale and zone.
std::u16string textOf(CFAbsoluteTime at, CFDateFormatterStyle dateStyle,
                      CFDateFormatterStyle timeStyle);

/// Random numbers that are the same in each run. Prints its seed.
class CRandomNumbers {
  public:
    explicit CRandomNumbers(unsigned seed);

    /// Both ends are included.
    int between(int first, int last);

  private:
    std::mt19937 engine_;
};

/// UTF-8, for messages.
std::string readable(std::u16string const& text);

} // namespace TestSupport

#endif
