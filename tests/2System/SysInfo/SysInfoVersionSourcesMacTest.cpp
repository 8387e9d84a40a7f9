// The source for macOS, run against stand-ins for what it calls.

#include "2System/SysInfo/_Imp/SysInfoVersionSources.h"

#include "support/ObjectCount.h"

#include <sys/sysctl.h>

#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

namespace {

// What the kernel answers and was asked, and what became of the tool.
struct CKernel {
    std::string value;
    int result = 0;
    std::string name;
    std::vector<int> numbers;
    std::string command;
    std::string mode;
    bool hasTool = true;
    int toolsClosed = 0;
};
CKernel kernel;

// Neither more than the buffer holds nor anything behind the value.
int answer(void* buffer, std::size_t* size, void* newValue, std::size_t newSize) {
    EXPECT_EQ(newValue, nullptr);
    EXPECT_EQ(newSize, 0u);
    if (kernel.result != 0)
        return kernel.result;
    *size = std::min(*size, kernel.value.size());
    std::memcpy(buffer, kernel.value.data(), *size);
    return 0;
}

class SysInfoVersionSourcesMacTest : public TestSupport::CObjectCountTest {
  protected:
    SysInfoVersionSourcesMacTest() { kernel = CKernel(); }

    SysInfo::CVersionSources const sources = SysInfo::systemVersionSources();
    char buffer[8] = {'x', 'x', 'x', 'x', 'x', 'x', 'x', 'x'};
};

} // namespace

int sysctl(int* name, unsigned int namelen, void* oldp, size_t* oldlenp, void* newp,
           size_t newlen) {
    kernel.numbers.assign(name, name + namelen);
    return answer(oldp, oldlenp, newp, newlen);
}

int sysctlbyname(char const* name, void* oldp, size_t* oldlenp, void* newp, size_t newlen) {
    kernel.name = name;
    return answer(oldp, oldlenp, newp, newlen);
}

extern "C" {
std::FILE* __wrap_popen(char const* command, char const* mode);
int __wrap_pclose(std::FILE* stream);
}

std::FILE* __wrap_popen(char const* command, char const* mode) {
    kernel.command = command;
    kernel.mode = mode;
    return kernel.hasTool ? std::fopen("/dev/null", "r") : nullptr;
}

int __wrap_pclose(std::FILE* stream) {
    ++kernel.toolsClosed;
    return std::fclose(stream);
}

namespace {

TEST_F(SysInfoVersionSourcesMacTest, TheProductVersionIsAskedForByName) {
    kernel.value = "12.1";
    EXPECT_EQ(sources.productVersion(buffer, sizeof(buffer)), 0);
    EXPECT_EQ(kernel.name, "kern.osproductversion");
    EXPECT_EQ(std::string(buffer, sizeof(buffer)), "12.1xxxx");
}

TEST_F(SysInfoVersionSourcesMacTest, TheReleaseOfTheKernelIsAskedForByNumbers) {
    kernel.value = "19.6.0";
    EXPECT_EQ(sources.kernelRelease(buffer, sizeof(buffer)), 0);
    EXPECT_EQ(kernel.numbers, (std::vector<int>{1, 2}));
    EXPECT_EQ(std::string(buffer, sizeof(buffer)), "19.6.0xx");
}

TEST_F(SysInfoVersionSourcesMacTest, AFailureIsPassedOn) {
    kernel.result = -1;
    EXPECT_EQ(sources.productVersion(buffer, sizeof(buffer)), -1);
    EXPECT_EQ(sources.kernelRelease(buffer, sizeof(buffer)), -1);
}

TEST_F(SysInfoVersionSourcesMacTest, TheToolIsReadAndClosedAsAProcess) {
    {
        SysInfo::TToolOutput const output = sources.startVersionTool();
        EXPECT_NE(output, nullptr);
        EXPECT_EQ(kernel.command, "sw_vers -productVersion");
        EXPECT_EQ(kernel.mode, "r");
        EXPECT_EQ(kernel.toolsClosed, 0);
    }
    EXPECT_EQ(kernel.toolsClosed, 1);
}

TEST_F(SysInfoVersionSourcesMacTest, AToolThatDoesNotStartIsNone) {
    kernel.hasTool = false;
    EXPECT_EQ(sources.startVersionTool(), nullptr);
    EXPECT_EQ(kernel.toolsClosed, 0);
}

TEST_F(SysInfoVersionSourcesMacTest, TheVersionIsFoundThroughThem) {
    kernel.value = "11.2.3";
    SysInfo::SystemInfo const info = SysInfo::GetOperatingSystemInformation();
    EXPECT_EQ(info.majorVersion, 11);
    EXPECT_EQ(info.minorVersion, 2);
    EXPECT_EQ(info.patchVersion, 3);
    EXPECT_EQ(kernel.command, "");
}

} // namespace
