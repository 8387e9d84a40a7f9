#include "1Base/Error/ErrorMacros.h"
#include "1Base/Streams/StreamsString.h"
#include "2System/SysInfo/SysInfoSystem.h"
#include "2System/SysInfo/_Imp/SysInfoVersionSources.h"

#include <ios>

namespace SysInfo {
namespace {

constexpr std::size_t textSize = 128;

// Fields that the text does not have stay as they are.
void readVersion(char const* text, SystemInfo& info) {
    std::sscanf(text, "%d.%d.%d", &info.majorVersion, &info.minorVersion, &info.patchVersion);
}

void readToolVersion(TToolOutput const output, SystemInfo& info) {
    char buf[1024] = "";
    std::size_t buflen = 0;
    char piece[256];
    while (output != nullptr && std::fgets(piece, sizeof(piece), output.get()) != nullptr) {
        buflen += static_cast<std::size_t>(
            std::snprintf(buf + buflen, sizeof(buf) - buflen, "%s", piece));
        ERROR_ASSERT(buflen < sizeof(buf));
    }
    readVersion(buf, info);
}

// Release 19.6.0 of the kernel came with 10.15.5.
SystemInfo versionOfKernel(CVersionSources const& sources) {
    char buffer[textSize] = "";
    int const result = sources.kernelRelease(buffer, sizeof(buffer));
    ERROR_ASSERT(result == 0);
    buffer[sizeof(buffer) - 1] = '\0';

    int rawMinor = 0;
    int rawPatch = 0;
    int const numScanned = std::sscanf(buffer, "%d.%d", &rawMinor, &rawPatch);
    ERROR_ASSERT(numScanned >= 1);
    ERROR_ASSERT(rawMinor > 4);
    return {10, rawMinor - 4, rawPatch >= 1 ? rawPatch - 1 : 0};
}

wchar_t const* productName(SystemInfo const& info) {
    if (info.majorVersion >= 11 || (info.majorVersion == 10 && info.minorVersion >= 12))
        return L"macOS ";
    return info.majorVersion == 10 ? L"Mac OS X " : L"Mac OS ";
}

} // namespace

SystemInfo discoverVersion(CVersionSources const& sources) {
    char buffer[textSize] = "";
    if (sources.productVersion(buffer, sizeof(buffer)) != 0)
        return versionOfKernel(sources);
    buffer[sizeof(buffer) - 1] = '\0';

    SystemInfo info;
    readVersion(buffer, info);
    if (info.majorVersion == 10 && info.minorVersion >= 16)
        readToolVersion(sources.startVersionTool(), info);
    return info;
}

SystemInfo GetOperatingSystemInformation() {
    return discoverVersion(systemVersionSources());
}

Strings::string GetOperatingSystemInformation_(SystemInfo const& info) {
    Streams::Detail::basic_ostringstream<wchar_t> stream(std::ios_base::out);
    stream << productName(info) << info.majorVersion << L'.' << info.minorVersion << L'.'
           << info.patchVersion;
    return stream.str();
}

Strings::string GetOperatingSystemInformation(SystemInfo const& info) {
    static Strings::string const platformName = GetOperatingSystemInformation_(info);
    return platformName;
}

Strings::string GetPlatformInformation() {
    return GetOperatingSystemInformation(GetOperatingSystemInformation());
}

Strings::string GetPlatformInformation(int& majorVersion, int& minorVersion) {
    SystemInfo const info = GetOperatingSystemInformation();
    majorVersion = info.majorVersion;
    minorVersion = info.minorVersion;
    return GetOperatingSystemInformation(info);
}

} // namespace SysInfo
