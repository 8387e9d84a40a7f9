/// Pins the time zone of the process for the length of a scope.
///
///     TestSupport::CZone const zone("Asia/Kolkata");
///
/// Zones by name come from the system's zone files; a POSIX text needs none.
#ifndef QORN_TESTS_ZONE_H
#define QORN_TESTS_ZONE_H

#include <cstdlib>
#include <ctime>
#include <optional>
#include <string>

namespace TestSupport {

class CZone {
  public:
    explicit CZone(std::string const& name) {
        if (char const* const before = std::getenv("TZ"))
            before_ = before;
        set(name);
    }
    ~CZone() { set(before_); }

    CZone(CZone const&) = delete;
    CZone& operator=(CZone const&) = delete;

  private:
    static void set(std::optional<std::string> const& name) {
        if (name)
            ::setenv("TZ", name->c_str(), 1);
        else
            ::unsetenv("TZ");
        ::tzset();
    }

    std::optional<std::string> before_;
};

/// The zones that dates are tried in: none, negative summer time, two sides of the Atlantic, half
/// an hour, a day that was left out, and one that stands for itself.
inline constexpr char const* zonesToTry[] = {
    "UTC",          "Europe/Dublin", "America/New_York",
    "Asia/Kolkata", "Pacific/Apia",  "EST5EDT,M3.2.0,M11.1.0"};

} // namespace TestSupport

#endif
