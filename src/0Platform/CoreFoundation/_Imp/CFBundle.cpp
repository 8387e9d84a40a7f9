#include "0Platform/CoreFoundation/_Imp/CFBundleInfo.h"
#include "0Platform/CoreFoundation/_Imp/CFCreate.h"
#include "0Platform/CoreFoundation/_Imp/CFStringConstant.h"
#include "0Platform/CoreFoundation/_Imp/CFStringUTF8.h"
#include "0Platform/CoreFoundation/_Imp/CFURLObject.h"

#include <CoreFoundation/CFBundle.h>

#include <atomic>

#include <dlfcn.h>
#include <sys/stat.h>

using namespace CFPlatform;

struct __CFBundle : Object {
    __CFBundle(TFinalize finalizer, std::string&& path, BundleInfo&& dictionary) noexcept
        : Object(finalizer), folder(std::move(path)), info(std::move(dictionary)) {}

    ~__CFBundle() { unload(); }

    void unload() {
        if (void* const loaded = handle.exchange(nullptr))
            ::dlclose(loaded);
    }

    std::string const folder;
    BundleInfo const info;
    std::atomic<void*> handle{nullptr}; // of dlopen, while the executable is loaded
};

namespace {

bool isFolder(std::string const& path) {
    struct stat status;
    return ::stat(path.c_str(), &status) == 0 && S_ISDIR(status.st_mode);
}

bool isFile(std::string const& path) {
    struct stat status;
    return ::stat(path.c_str(), &status) == 0 && S_ISREG(status.st_mode);
}

CFStringRef textOf(__CFBundle const& bundle, std::string const& key) {
    auto const entry = bundle.info.find(key);
    return entry == bundle.info.end() ? nullptr : entry->second.get();
}

std::string withoutExtension(std::string_view name) {
    std::size_t const dot = name.rfind('.');
    bool const hasExtension = dot != std::string_view::npos && dot > 0 && dot + 1 < name.size();
    return std::string(hasExtension ? name.substr(0, dot) : name);
}

std::string executableName(__CFBundle const& bundle) {
    CFStringRef const named = textOf(bundle, "CFBundleExecutable");
    std::optional<std::string> name = named == nullptr ? std::nullopt : readUTF8(named);
    if (name && !name->empty())
        return std::move(*name);
    return withoutExtension(lastPathComponent(bundle.folder));
}

// Empty where there is none.
std::string executablePath(__CFBundle const& bundle) {
    std::string const name = executableName(bundle);
    for (char const* const folder : {"/Contents/Linux/", "/Contents/MacOS/"}) {
        std::string path = bundle.folder + folder + name;
        if (isFile(path))
            return path;
    }
    return std::string();
}

// Null where it can't be loaded. Two threads may both load; one handle is kept.
void* load(__CFBundle& bundle) {
    std::string const path = executablePath(bundle);
    void* const loaded = path.empty() ? nullptr : ::dlopen(path.c_str(), RTLD_LAZY);
    void* kept = nullptr;
    if (loaded == nullptr || bundle.handle.compare_exchange_strong(kept, loaded))
        return loaded;
    ::dlclose(loaded);
    return kept;
}

void* handleOf(__CFBundle& bundle) {
    return nullWithoutMemory([&bundle] {
        void* const handle = bundle.handle;
        return handle != nullptr ? handle : load(bundle);
    });
}

CFURLRef createURLOfExecutable(__CFBundle const& bundle) {
    std::string path = executablePath(bundle);
    return path.empty() ? nullptr : createObject<__CFURL>(std::move(path));
}

CFBundleRef createBundle(std::string path) {
    if (!isFolder(path))
        return nullptr;
    BundleInfo info = readBundleInfo(path + "/Contents/Info.plist");
    return createObject<__CFBundle>(std::move(path), std::move(info));
}

StringConstant nameKey(u"CFBundleName");
StringConstant versionKey(u"CFBundleVersion");

} // namespace

CFStringRef const kCFBundleNameKey = &nameKey;
CFStringRef const kCFBundleVersionKey = &versionKey;

extern "C" CFBundleRef CFBundleCreate(CFAllocatorRef, CFURLRef bundleURL) {
    return nullWithoutMemory([bundleURL] { return createBundle(bundleURL->path); });
}

extern "C" CFTypeRef CFBundleGetValueForInfoDictionaryKey(CFBundleRef bundle, CFStringRef key) {
    return nullWithoutMemory([bundle, key]() -> CFTypeRef {
        std::optional<std::string> const name = readUTF8(key);
        return name ? textOf(*bundle, *name) : nullptr;
    });
}

extern "C" CFURLRef CFBundleCopyExecutableURL(CFBundleRef bundle) {
    return nullWithoutMemory([bundle] { return createURLOfExecutable(*bundle); });
}

extern "C" Boolean CFBundleLoadExecutable(CFBundleRef bundle) {
    return handleOf(*bundle) != nullptr;
}

extern "C" void CFBundleUnloadExecutable(CFBundleRef bundle) {
    bundle->unload();
}

extern "C" void* CFBundleGetFunctionPointerForName(CFBundleRef bundle, CFStringRef functionName) {
    return nullWithoutMemory([bundle, functionName]() -> void* {
        std::optional<std::string> const name = readUTF8(functionName);
        void* const handle = name ? handleOf(*bundle) : nullptr;
        return handle == nullptr ? nullptr : ::dlsym(handle, name->c_str());
    });
}
