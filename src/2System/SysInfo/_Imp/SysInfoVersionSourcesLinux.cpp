#include "2System/SysInfo/_Imp/SysInfoOsRelease.h"
#include "2System/SysInfo/_Imp/SysInfoVersionSources.h"

#include <sys/utsname.h>

#include <string>

namespace SysInfo {
namespace {

// The second is the maker's own file, which the first overrides.
int readProductVersion(char* buffer, std::size_t size) {
    std::string version = readVersionID("/etc/os-release");
    if (version.empty())
        version = readVersionID("/usr/lib/os-release");
    std::snprintf(buffer, size, "%s", version.c_str());
    return version.empty() ? -1 : 0;
}

TToolOutput startNoTool() {
    return TToolOutput(nullptr, std::fclose);
}

int readKernelRelease(char* buffer, std::size_t size) {
    utsname names;
    int const result = uname(&names);
    if (result == 0)
        std::snprintf(buffer, size, "%s", names.release);
    return result;
}

} // namespace

CVersionSources systemVersionSources() {
    return {readProductVersion, startNoTool, readKernelRelease};
}

} // namespace SysInfo
