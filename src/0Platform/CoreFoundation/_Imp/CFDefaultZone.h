/// The process's time zone, as the C library sees it, for ICU.
#ifndef QORN_0PLATFORM_CFDEFAULTZONE_H
#define QORN_0PLATFORM_CFDEFAULTZONE_H

#include <unicode/timezone.h>

#include <memory>

namespace CFPlatform {

using ZoneOwner = std::unique_ptr<icu::TimeZone>;

/// The zone of TZ, or without TZ the system's: ICU's zone of that name where ICU has it and it is
/// the same one, otherwise, and where ICU has no memory for it, a LocaltimeZone. Null without
/// memory for that. Reads the environment at each call and lets the C library do so too (`tzset`).
///
/// ICU's own default zone does not serve: ICU asks for it once in a process and takes a rule in TZ
/// ("EST5EDT,M3.2.0,M11.1.0") for no zone at all.
ZoneOwner createDefaultZone() noexcept;

} // namespace CFPlatform

#endif
