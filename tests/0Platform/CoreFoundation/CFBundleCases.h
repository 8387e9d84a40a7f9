/// Bundles in tests: made of folders below the working directory, asked by plain texts.
#ifndef QORN_TESTS_CFBUNDLECASES_H
#define QORN_TESTS_CFBUNDLECASES_H

#include <CoreFoundation/CoreFoundation.h>

#include "support/InfoPlist.h"
#include "support/ObjectCount.h"
#include "support/PlatformString.h"
#include "support/TestLibraries/TestLibraries.h"

#include <optional>
#include <string>

namespace PlatformTest {

/// Owns the bundle of a path, which may be null.
class CBundle {
  public:
    explicit CBundle(std::string const& path) : ref_(create(path)) {}
    ~CBundle() { release(); }
    CBundle(CBundle const&) = delete;
    CBundle& operator=(CBundle const&) = delete;

    CFBundleRef get() const { return ref_; }
    bool isNull() const { return ref_ == nullptr; }

    void release() {
        if (ref_ != nullptr)
            CFRelease(ref_);
        ref_ = nullptr;
    }

    bool load() const { return CFBundleLoadExecutable(ref_) != 0; }
    void unload() const { CFBundleUnloadExecutable(ref_); }

    void* symbol(std::string const& name) const {
        TestSupport::CPlatformString const text(name, kCFStringEncodingUTF8);
        return CFBundleGetFunctionPointerForName(ref_, text.get());
    }

    /// What the executable calls itself; empty where it has no such function.
    std::string libraryName() const {
        void* const function = symbol("libraryName");
        return function == nullptr ? "" : reinterpret_cast<char const* (*)()>(function)();
    }

    /// A value of Info.plist that is a text; nothing where there is none.
    std::optional<std::u16string> value(std::string const& key) const {
        TestSupport::CPlatformString const text(key, kCFStringEncodingUTF8);
        CFTypeRef const value = CFBundleGetValueForInfoDictionaryKey(ref_, text.get());
        if (value == nullptr)
            return std::nullopt;
        return TestSupport::CPlatformString::unitsOf(static_cast<CFStringRef>(value));
    }

    /// The name of the executable's file; nothing where there is none.
    std::optional<std::u16string> executable() const {
        CFURLRef const url = CFBundleCopyExecutableURL(ref_);
        if (url == nullptr)
            return std::nullopt;
        TestSupport::CPlatformString const name(CFURLCopyLastPathComponent(url));
        CFRelease(url);
        return name.units();
    }

  private:
    static CFBundleRef create(std::string const& path) {
        TestSupport::CPlatformString const text(path, kCFStringEncodingUTF8);
        CFURLRef const url = CFURLCreateWithFileSystemPath(kCFAllocatorDefault, text.get(),
                                                           kCFURLPOSIXPathStyle, true);
        CFBundleRef const bundle = CFBundleCreate(kCFAllocatorDefault, url);
        CFRelease(url);
        return bundle;
    }

    CFBundleRef ref_;
};

/// Each test has an empty working directory.
class CBundleTest : public TestSupport::CObjectCountTest {
    TestSupport::CEmptyFolder const folder_;
};

inline constexpr char const* demoInfo = "Demo.bundle/Contents/Info.plist";
inline constexpr char const* demoExecutable = "Demo.bundle/Contents/Linux/Demo";

} // namespace PlatformTest

#endif
