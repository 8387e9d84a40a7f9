#include "2System/MacOS/MacOSGlue.h"

namespace MacOS {

Time::CDateTime getTime(DateTimeRec const& record) {
    return Time::CDateTime(record.day, static_cast<Time::CDate::EMonth>(record.month), record.year,
                           record.hour, record.minute, record.second, 0);
}

std::string convertToPosixPath(FileSys::CFileSpec const& spec) {
    return spec.getFullName<std::string>(false);
}

} // namespace MacOS
