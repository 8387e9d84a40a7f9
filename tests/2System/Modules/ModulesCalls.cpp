#include "2System/Modules/ModulesCalls.h"

#include <CoreFoundation/CoreFoundation.h>

#include <dlfcn.h>

namespace ModulesTest {
namespace {

CLoaderCalls* recorder = nullptr;
int depth = 0;
long handles = 0;

struct CKnownObject {
    char const* name;
    CFTypeRef object;
} knownObjects[] = {{"url", nullptr}, {"bundle", nullptr}};

} // namespace

/// One call on its way through a wrapper.
class CLoaderCall {
  public:
    explicit CLoaderCall(std::string const& function, std::string const& details = "") {
        if (++depth != 1 || recorder == nullptr)
            return;
        recorder->calls_.push_back(function + details);
        fails_ = recorder->failing_ == function;
    }
    ~CLoaderCall() { --depth; }

    CLoaderCall(CLoaderCall const&) = delete;
    CLoaderCall& operator=(CLoaderCall const&) = delete;

    bool fails() const { return fails_; }

  private:
    bool fails_ = false;
};

CLoaderCalls::CLoaderCalls() {
    recorder = this;
}

CLoaderCalls::~CLoaderCalls() {
    recorder = nullptr;
}

long openHandles() {
    return handles;
}

} // namespace ModulesTest

using ModulesTest::CLoaderCall;

extern "C" {

CFURLRef __real_CFURLCreateWithFileSystemPath(CFAllocatorRef allocator, CFStringRef filePath,
                                              CFURLPathStyle pathStyle, Boolean isDirectory);
CFBundleRef __real_CFBundleCreate(CFAllocatorRef allocator, CFURLRef bundleURL);
Boolean __real_CFBundleLoadExecutable(CFBundleRef bundle);
void __real_CFBundleUnloadExecutable(CFBundleRef bundle);
void* __real_CFBundleGetFunctionPointerForName(CFBundleRef bundle, CFStringRef functionName);
void __real_CFRelease(CFTypeRef object);
void* __real_dlopen(char const* file, int mode);
void* __real_dlsym(void* handle, char const* name);
int __real_dlclose(void* handle);
}

namespace {

void* recordedDlsym(void* handle, char const* name) {
    CLoaderCall const call("dlsym", std::string(" ") + name);
    return call.fails() ? nullptr : __real_dlsym(handle, name);
}

} // namespace

extern "C" {

CFURLRef __wrap_CFURLCreateWithFileSystemPath(CFAllocatorRef allocator, CFStringRef filePath,
                                              CFURLPathStyle pathStyle, Boolean isDirectory) {
    CLoaderCall const call("CFURLCreateWithFileSystemPath", isDirectory != 0 ? " folder" : " file");
    if (call.fails())
        return nullptr;
    CFURLRef const url =
        __real_CFURLCreateWithFileSystemPath(allocator, filePath, pathStyle, isDirectory);
    ModulesTest::knownObjects[0].object = url;
    return url;
}

CFBundleRef __wrap_CFBundleCreate(CFAllocatorRef allocator, CFURLRef bundleURL) {
    CLoaderCall const call("CFBundleCreate");
    if (call.fails())
        return nullptr;
    CFBundleRef const bundle = __real_CFBundleCreate(allocator, bundleURL);
    ModulesTest::knownObjects[1].object = bundle;
    return bundle;
}

Boolean __wrap_CFBundleLoadExecutable(CFBundleRef bundle) {
    CLoaderCall const call("CFBundleLoadExecutable");
    return call.fails() ? Boolean(0) : __real_CFBundleLoadExecutable(bundle);
}

void __wrap_CFBundleUnloadExecutable(CFBundleRef bundle) {
    CLoaderCall const call("CFBundleUnloadExecutable");
    if (!call.fails())
        __real_CFBundleUnloadExecutable(bundle);
}

void* __wrap_CFBundleGetFunctionPointerForName(CFBundleRef bundle, CFStringRef functionName) {
    CLoaderCall const call("CFBundleGetFunctionPointerForName");
    return call.fails() ? nullptr : __real_CFBundleGetFunctionPointerForName(bundle, functionName);
}

void __wrap_CFRelease(CFTypeRef object) {
    for (ModulesTest::CKnownObject& known : ModulesTest::knownObjects) {
        if (object != known.object)
            continue;
        CLoaderCall const call("CFRelease", std::string(" ") + known.name);
        // Its place in memory may be the next object's.
        if (CFGetRetainCount(object) == 1)
            known.object = nullptr;
    }
    __real_CFRelease(object);
}

void* __wrap_dlopen(char const* file, int mode) {
    CLoaderCall const call("dlopen", std::string(" ") + file + " " +
                                         (mode == RTLD_LAZY ? "lazy" : std::to_string(mode)));
    void* const handle = call.fails() ? nullptr : __real_dlopen(file, mode);
    ModulesTest::handles += handle != nullptr ? 1 : 0;
    return handle;
}

// A sanitizer's run-time library calls it before its own checks can run.
__attribute__((no_sanitize("address", "undefined"))) void* __wrap_dlsym(void* handle,
                                                                        char const* name) {
    return ModulesTest::recorder == nullptr ? __real_dlsym(handle, name)
                                            : recordedDlsym(handle, name);
}

int __wrap_dlclose(void* handle) {
    CLoaderCall const call("dlclose");
    --ModulesTest::handles;
    int const result = __real_dlclose(handle);
    return call.fails() ? -1 : result;
}
}
