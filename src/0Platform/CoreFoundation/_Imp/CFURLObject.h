/// The URL object: a path.
#ifndef QORN_0PLATFORM_CFURLOBJECT_H
#define QORN_0PLATFORM_CFURLOBJECT_H

#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <CoreFoundation/CFURL.h>

#include <string>
#include <string_view>
#include <utility>

struct __CFURL : CFPlatform::Object {
    __CFURL(TFinalize finalizer, std::string&& absolutePath)
    noexcept : Object(finalizer), path(std::move(absolutePath)) {}

    /// In UTF-8, beginning with "/".
    std::string const path;
};

namespace CFPlatform {

/// What CFURLCopyLastPathComponent() answers for an absolute path; a part of it.
std::string_view lastPathComponent(std::string_view path);

} // namespace CFPlatform

#endif
