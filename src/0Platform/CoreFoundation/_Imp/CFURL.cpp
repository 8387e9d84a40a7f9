#include "0Platform/CoreFoundation/_Imp/CFCreate.h"
#include "0Platform/CoreFoundation/_Imp/CFStringUTF8.h"
#include "0Platform/CoreFoundation/_Imp/CFURLObject.h"

#include <cstdlib>
#include <optional>

#include <unistd.h>

using namespace CFPlatform;

namespace {

std::optional<std::string> workingFolder() {
    char* const folder = ::getcwd(nullptr, 0);
    if (folder == nullptr)
        return std::nullopt;
    std::string text(folder);
    std::free(folder);
    return text;
}

std::optional<std::string> absolutePath(std::string&& path) {
    if (path.front() == '/')
        return std::move(path);
    std::optional<std::string> absolute = workingFolder();
    if (absolute)
        *absolute += '/' + path;
    return absolute;
}

CFURLRef createURL(CFStringRef filePath) {
    std::optional<std::string> path = readUTF8(filePath);
    if (!path || path->empty())
        return nullptr;
    path = absolutePath(std::move(*path));
    return path ? createObject<__CFURL>(std::move(*path)) : nullptr;
}

} // namespace

namespace CFPlatform {

std::string_view lastPathComponent(std::string_view path) {
    std::size_t const end = path.find_last_not_of('/');
    if (end == std::string_view::npos)
        return path.substr(0, 1);
    path = path.substr(0, end + 1);
    return path.substr(path.rfind('/') + 1);
}

} // namespace CFPlatform

extern "C" CFURLRef CFURLCreateWithFileSystemPath(CFAllocatorRef, CFStringRef filePath,
                                                  CFURLPathStyle pathStyle, Boolean) {
    if (pathStyle != kCFURLPOSIXPathStyle)
        return nullptr;
    return nullWithoutMemory([filePath] { return createURL(filePath); });
}

extern "C" CFStringRef CFURLCopyLastPathComponent(CFURLRef url) {
    return createFromUTF8(lastPathComponent(url->path));
}
