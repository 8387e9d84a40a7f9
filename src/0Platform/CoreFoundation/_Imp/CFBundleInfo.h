/// The texts of a bundle's Info.plist.
#ifndef QORN_0PLATFORM_CFBUNDLEINFO_H
#define QORN_0PLATFORM_CFBUNDLEINFO_H

#include <CoreFoundation/CFBase.h>

#include <map>
#include <memory>
#include <string>

namespace CFPlatform {

struct StringRelease {
    void operator()(CFStringRef string) const { CFRelease(string); }
};
using StringOwner = std::unique_ptr<__CFString const, StringRelease>;

/// Values by key.
using BundleInfo = std::map<std::string, StringOwner>;

/// The values that are texts, of a property list in XML or binary form. A file that is missing,
/// broken or no dictionary has none.
BundleInfo readBundleInfo(std::string const& file);

} // namespace CFPlatform

#endif
