/// A clock that tests set.
///
///     TimeTest::CClockInHand const clock(TimeTest::march);
///     Time::CDateTime::getCurrentTimeUTC();   // 5 March 2021, 12:05:09
#ifndef QORN_TESTS_TIMECLOCKINHAND_H
#define QORN_TESTS_TIMECLOCKINHAND_H

#include "2System/Time/_Imp/TimeClock.h"

#include <ctime>

namespace TimeTest {

inline constexpr std::time_t march = 1614945909; ///< 5 March 2021, 12:05:09 UTC
inline constexpr std::time_t july = 1625140800;  ///< 1 July 2021, 12:00:00 UTC

/// Stands still at one moment while it lives.
class CClockInHand {
  public:
    explicit CClockInHand(std::time_t moment) : before_(Time::Detail::getClock()) {
        moment_ = moment;
        asked_ = 0;
        Time::Detail::setClock({tell, ::gmtime_r, ::localtime_r});
    }
    CClockInHand(CClockInHand const&) = delete;
    CClockInHand& operator=(CClockInHand const&) = delete;
    ~CClockInHand() { Time::Detail::setClock(before_); }

    /// How often the moment was asked for.
    static int asked() { return asked_; }

    void loseUTC() const { Time::Detail::setClock({tell, lose, ::localtime_r}); }
    void loseLocal() const { Time::Detail::setClock({tell, ::gmtime_r, lose}); }

  private:
    static std::time_t tell(std::time_t*) {
        ++asked_;
        return moment_;
    }
    static std::tm* lose(std::time_t const*, std::tm*) { return nullptr; }

    static inline std::time_t moment_ = 0;
    static inline int asked_ = 0;

    Time::Detail::CClock const before_;
};

} // namespace TimeTest

#endif
