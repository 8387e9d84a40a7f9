/// How the version of the operating system is found, apart from where the raw texts come from.
///
///     discoverVersion(systemVersionSources());   // {12, 1, 0}
#ifndef QORN_2SYSTEM_SYSINFOVERSIONSOURCES_H
#define QORN_2SYSTEM_SYSINFOVERSIONSOURCES_H

#include "2System/SysInfo/SysInfoSystem.h"

#include <cstddef>
#include <cstdio>
#include <functional>
#include <memory>

namespace SysInfo {

/// An open stream with what closes it, or null.
using TToolOutput = std::unique_ptr<std::FILE, int (*)(std::FILE*)>;

/// The three raw texts.
struct CVersionSources {
    /// Fills a buffer with a text and returns 0, or else returns another number. A text that fills
    /// the whole buffer loses its last byte.
    using TText = std::function<int(char* buffer, std::size_t size)>;

    TText productVersion;
    std::function<TToolOutput()> startVersionTool; ///< what the tool prints; null for no tool
    TText kernelRelease;
};

/// The product's version. 10.16 is what the system tells programs of an older build, whatever its
/// version is: the tool knows better. Without a product version, the one that goes with the
/// kernel's release. Fails a check where that is none, or the tool prints 1024 bytes or more.
SystemInfo discoverVersion(CVersionSources const& sources);

/// The sources of this system.
CVersionSources systemVersionSources();

} // namespace SysInfo

#endif
