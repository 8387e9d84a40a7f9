// What the system's sources make of files and a kernel that tell their versions, or don't.

#include "2System/SysInfo/_Imp/SysInfoOsRelease.h"
#include "2System/SysInfo/_Imp/SysInfoVersionSources.h"

#include "support/ObjectCount.h"

#include <sys/utsname.h>

#include <cerrno>
#include <map>
#include <string>

namespace {

std::map<std::string, std::string> versions;
bool isKernelSilent = false;

std::string versionFrom(std::map<std::string, std::string> const& files) {
    versions = files;
    char text[16] = "(untouched)";
    int const result = SysInfo::systemVersionSources().productVersion(text, sizeof text);
    EXPECT_EQ(result, text[0] == '\0' ? -1 : 0);
    return text;
}

using CSysInfoVersionSourcesLinuxTest = TestSupport::CObjectCountTest;

TEST_F(CSysInfoVersionSourcesLinuxTest, TheMakersFileCountsWhereTheSystemsTellsNothing) {
    EXPECT_EQ(versionFrom({{"/etc/os-release", "12.4"}, {"/usr/lib/os-release", "12"}}), "12.4");
    EXPECT_EQ(versionFrom({{"/usr/lib/os-release", "12"}}), "12");
    EXPECT_EQ(versionFrom({}), "");
}

TEST_F(CSysInfoVersionSourcesLinuxTest, AKernelThatFailsTellsNoRelease) {
    char release[16] = "(untouched)";
    isKernelSilent = true;
    EXPECT_EQ(SysInfo::systemVersionSources().kernelRelease(release, sizeof release), -1);
    isKernelSilent = false;
    EXPECT_STREQ(release, "(untouched)");
    EXPECT_EQ(SysInfo::systemVersionSources().kernelRelease(release, sizeof release), 0);
    EXPECT_STRNE(release, "(untouched)");
}

} // namespace

std::string wrapReadVersion(std::string const& path) __asm__("__wrap_" READ_VERSION);

std::string wrapReadVersion(std::string const& path) {
    return versions[path];
}

extern "C" {
int __real_uname(struct utsname* names);
int __wrap_uname(struct utsname* names);

int __wrap_uname(struct utsname* names) {
    if (!isKernelSilent)
        return __real_uname(names);
    errno = EFAULT;
    return -1;
}
}
