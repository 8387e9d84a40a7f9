/// A zone of ICU that asks the C library.
#ifndef QORN_0PLATFORM_CFLOCALTIMEZONE_H
#define QORN_0PLATFORM_CFLOCALTIMEZONE_H

#include <unicode/timezone.h>

namespace CFPlatform {

/// For what ICU has no zone of: rules in TZ, files without a name, names that only one of the two
/// knows. Its texts name the offset ("GMT-5"). It shows what `localtime_r` says when it is asked,
/// so a change of TZ changes it.
class LocaltimeZone : public icu::TimeZone {
  public:
    LocaltimeZone();

    void getOffset(UDate date, UBool isLocal, int32_t& raw, int32_t& saving,
                   UErrorCode& status) const override;
    int32_t getOffset(uint8_t era, int32_t year, int32_t month, int32_t day, uint8_t dayOfWeek,
                      int32_t millis, UErrorCode& status) const override;
    int32_t getOffset(uint8_t era, int32_t year, int32_t month, int32_t day, uint8_t dayOfWeek,
                      int32_t millis, int32_t monthLength, UErrorCode& status) const override;

    int32_t getRawOffset() const override;
    void setRawOffset(int32_t offsetMillis) override;
    UBool useDaylightTime() const override;
    UBool inDaylightTime(UDate date, UErrorCode& status) const override;

    LocaltimeZone* clone() const override;
    UClassID getDynamicClassID() const override;

  private:
    int32_t raw_; // milliseconds, without summer time
};

/// What the C library adds to GMT at an instant, in milliseconds; both count from 1970.
int32_t localtimeOffset(UDate instant) noexcept;

} // namespace CFPlatform

#endif
