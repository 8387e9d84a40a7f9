#include "2System/SysInfo/_Imp/SysInfoVersionSources.h"

#include <sys/sysctl.h>

namespace SysInfo {
namespace {

int readProductVersion(char* buffer, std::size_t size) {
    return sysctlbyname("kern.osproductversion", buffer, &size, nullptr, 0);
}

TToolOutput startVersionTool() {
    return TToolOutput(popen("sw_vers -productVersion", "r"), pclose);
}

int readKernelRelease(char* buffer, std::size_t size) {
    int name[] = {CTL_KERN, KERN_OSRELEASE};
    return sysctl(name, 2, buffer, &size, nullptr, 0);
}

} // namespace

CVersionSources systemVersionSources() {
    return {readProductVersion, startVersionTool, readKernelRelease};
}

} // namespace SysInfo
