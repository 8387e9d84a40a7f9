/// The file in which a Linux system tells its name and version, os-release(5).
#ifndef QORN_2SYSTEM_SYSINFOOSRELEASE_H
#define QORN_2SYSTEM_SYSINFOOSRELEASE_H

#include <string>

namespace SysInfo {

/// The value of VERSION_ID in the file, without its quotes. Empty where the file or the value is
/// missing, as in systems that are renewed all the time and have no version.
std::string readVersionID(std::string const& path);

} // namespace SysInfo

#endif
