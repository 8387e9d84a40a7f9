/// The system's services whose types belong to this floor.
#ifndef QORN_2SYSTEM_MACOSGLUE_H
#define QORN_2SYSTEM_MACOSGLUE_H

#include "2System/FileSys/FileSysFileSpec.h"
#include "2System/Time/TimeDateTime.h"

#include <Carbon/Carbon.h>

#include <string>

namespace MacOS {

/// A date-time from the platform's record. Raises TExcTimeDateTime where its date is none.
Time::CDateTime getTime(DateTimeRec const& record);

/// The path as UTF-8.
std::string convertToPosixPath(FileSys::CFileSpec const& spec);

} // namespace MacOS

#endif
