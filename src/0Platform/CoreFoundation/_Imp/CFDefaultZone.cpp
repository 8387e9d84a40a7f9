#include "0Platform/CoreFoundation/_Imp/CFDefaultZone.h"
#include "0Platform/CoreFoundation/_Imp/CFLocaltimeZone.h"

#include <climits>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <initializer_list>

namespace CFPlatform {
namespace {

// The C library takes both for UTC: an empty TZ, and a system that names no zone.
constexpr char const* nameOfNothing = "UTC";

// The name of a zone whose file is given by its name or its path.
char const* zoneNameOf(char const* file) {
    constexpr char folder[] = "/zoneinfo/";
    char const* const found = std::strstr(file, folder);
    return found != nullptr ? found + sizeof(folder) - 1 : file;
}

// The zone of a name, not of a text that ICU understands as an offset: "GMT+5" lies east for ICU
// and west for the C library. Null where there is none.
ZoneOwner createNamedZone(char const* name) {
    icu::UnicodeString const id = icu::UnicodeString::fromUTF8(name);
    icu::UnicodeString canonical;
    UBool isName = false;
    UErrorCode status = U_ZERO_ERROR;
    icu::TimeZone::getCanonicalID(id, canonical, isName, status);
    return U_SUCCESS(status) && isName ? ZoneOwner(icu::TimeZone::createTimeZone(id)) : nullptr;
}

// Whether a name means the same to both: ICU's "PST" is California, but UTC for the C library, and
// so is every name where the system's zone files are not installed.
bool agreesWithLocaltime(icu::TimeZone const& zone) {
    constexpr UDate january2000 = 947894400000.0;
    constexpr UDate july2000 = 963619200000.0;
    for (UDate const instant : {january2000, july2000}) {
        int32_t raw = 0;
        int32_t saving = 0;
        UErrorCode status = U_ZERO_ERROR;
        zone.getOffset(instant, false, raw, saving, status);
        if (U_FAILURE(status) || raw + saving != localtimeOffset(instant))
            return false;
    }
    return true;
}

} // namespace

ZoneOwner createDefaultZone() noexcept {
    tzset();
    char buffer[PATH_MAX];
    char const* file = std::getenv("TZ");
    if (file == nullptr)
        file = realpath("/etc/localtime", buffer);
    else if (*file == ':')
        ++file;
    char const* const name = file == nullptr || *file == '\0' ? nameOfNothing : zoneNameOf(file);
    ZoneOwner zone = createNamedZone(name);
    if (zone == nullptr || !agreesWithLocaltime(*zone))
        zone.reset(new LocaltimeZone);
    return zone;
}

} // namespace CFPlatform
