// A bundle's executable: where it lies, and how it is loaded.

#include "0Platform/CoreFoundation/CFBundleCases.h"

#include <atomic>
#include <cstddef>
#include <filesystem>
#include <functional>
#include <new>
#include <thread>
#include <utility>
#include <vector>

namespace fs = std::filesystem;

using PlatformTest::CBundle;
using PlatformTest::demoExecutable;
using PlatformTest::demoInfo;
using TestSupport::copyLibrary;
using TestSupport::CPlatformString;
using TestSupport::layFile;
using TestSupport::moduleEvents;
using TestSupport::xmlInfo;

namespace {

using TEvents = std::vector<std::string>;

constexpr auto nothing = std::nullopt;

// Which allocation from now on fails: the first is 1, and 0 is none.
std::atomic<long> failingAllocation{0};
std::atomic<long> openHandles{0};

// Called once, between a library's coming and the platform's hearing of it.
std::function<void()> onLoaded;

bool mayAllocate() {
    return failingAllocation == 0 || --failingAllocation != 0;
}

// What libraries do when they come and go is none of the platform's allocations.
struct CPause {
    CPause() : failing(failingAllocation.exchange(0)) {}
    ~CPause() { failingAllocation = failing; }
    CPause(CPause const&) = delete;
    CPause& operator=(CPause const&) = delete;

    long const failing;
};

} // namespace

extern "C" {
void* __real_malloc(std::size_t bytes);
void* __real__Znwm(std::size_t bytes);
void* __real_dlopen(char const* file, int mode);
int __real_dlclose(void* handle);

void* __wrap_malloc(std::size_t bytes) {
    return mayAllocate() ? __real_malloc(bytes) : nullptr;
}

// libc++ refers to it, and a hidden function cannot be referred to by a library.
__attribute__((visibility("default"))) void* __wrap__Znwm(std::size_t bytes) {
    if (!mayAllocate())
        throw std::bad_alloc();
    return __real__Znwm(bytes);
}

void* __wrap_dlopen(char const* file, int mode) {
    CPause const pause;
    EXPECT_EQ(mode, 1); // RTLD_LAZY
    void* const handle = __real_dlopen(file, mode);
    openHandles += handle != nullptr ? 1 : 0;
    if (std::function<void()> const other = std::exchange(onLoaded, nullptr))
        other();
    return handle;
}

int __wrap_dlclose(void* handle) {
    CPause const pause;
    --openHandles;
    return __real_dlclose(handle);
}
}

namespace {

class CFBundleTest : public PlatformTest::CBundleTest {
  protected:
    void TearDown() override {
        EXPECT_EQ(openHandles, 0);
        PlatformTest::CBundleTest::TearDown();
    }
};

TEST_F(CFBundleTest, AFolderIsABundleWhateverLiesInIt) {
    fs::create_directory("Empty");
    layFile("Other/file", "text");
    EXPECT_FALSE(CBundle("Empty").isNull());
    EXPECT_FALSE(CBundle("Other").isNull());
    EXPECT_FALSE(CBundle("Other/").isNull());
    EXPECT_FALSE(CBundle(".").isNull());
    fs::create_directory_symlink("Empty", "link");
    EXPECT_FALSE(CBundle("link").isNull());
}

TEST_F(CFBundleTest, WhatIsNoFolderIsNoBundle) {
    copyLibrary("First", "First.so");
    layFile("file", "");
    fs::create_symlink("nowhere", "dangling");
    EXPECT_TRUE(CBundle("missing").isNull());
    EXPECT_TRUE(CBundle("First.so").isNull());
    EXPECT_TRUE(CBundle("First.so/").isNull());
    EXPECT_TRUE(CBundle("file").isNull());
    EXPECT_TRUE(CBundle("dangling").isNull());
}

TEST_F(CFBundleTest, ARelativePathCountsFromTheFolderOfItsTime) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    fs::create_directory("elsewhere");
    fs::current_path("elsewhere");
    EXPECT_EQ(bundle.libraryName(), "First");
    EXPECT_TRUE(CBundle("Demo.bundle").isNull());
    fs::current_path("..");
}

TEST_F(CFBundleTest, WithoutAWorkingFolderARelativePathLeadsNowhere) {
    fs::path const before = fs::current_path();
    fs::create_directory("gone");
    fs::current_path("gone");
    fs::remove(before / "gone");
    CPlatformString const relative(u"Demo.bundle");
    EXPECT_EQ(CFURLCreateWithFileSystemPath(kCFAllocatorDefault, relative.get(),
                                            kCFURLPOSIXPathStyle, true),
              nullptr);
    CPlatformString const absolute(u"/usr");
    CFURLRef const url = CFURLCreateWithFileSystemPath(kCFAllocatorDefault, absolute.get(),
                                                       kCFURLPOSIXPathStyle, true);
    ASSERT_NE(url, nullptr);
    CFRelease(url);
    fs::current_path(before);
}

// --- the executable's place

TEST_F(CFBundleTest, TheExecutableIsNamedLikeTheFolder) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    EXPECT_EQ(bundle.executable(), u"Demo");
    EXPECT_EQ(bundle.libraryName(), "First");
}

TEST_F(CFBundleTest, OneExtensionOfTheFolderIsLeftOut) {
    struct CCase {
        char const* folder;
        char const* executable;
    };
    for (CCase const& names :
         {CCase{"Plain", "Plain"}, CCase{"Two.tar.gz", "Two.tar"}, CCase{".hidden", ".hidden"},
          CCase{"dot.", "dot."}, CCase{"caf\xC3\xA9.bundle", "caf\xC3\xA9"}}) {
        layFile(std::string(names.folder) + "/Contents/Linux/" + names.executable, "");
        CPlatformString const expected(names.executable, kCFStringEncodingUTF8);
        EXPECT_EQ(CBundle(names.folder).executable(), expected.units()) << names.folder;
        EXPECT_EQ(CBundle(std::string(names.folder) + "/").executable(), expected.units());
    }
}

TEST_F(CFBundleTest, InfoPlistNamesTheExecutable) {
    copyLibrary("First", demoExecutable);
    copyLibrary("Second", "Demo.bundle/Contents/Linux/libother.so");
    layFile(demoInfo, xmlInfo({{"CFBundleExecutable", "libother.so"}}));
    CBundle const bundle("Demo.bundle");
    EXPECT_EQ(bundle.executable(), u"libother.so");
    EXPECT_EQ(bundle.libraryName(), "Second");
}

TEST_F(CFBundleTest, AnExecutableThatInfoPlistNamesInVainIsNotReplaced) {
    copyLibrary("First", demoExecutable);
    layFile(demoInfo, xmlInfo({{"CFBundleExecutable", "missing"}}));
    CBundle const bundle("Demo.bundle");
    EXPECT_EQ(bundle.executable(), nothing);
    EXPECT_FALSE(bundle.load());
}

TEST_F(CFBundleTest, AnEmptyNameInInfoPlistCountsAsNone) {
    copyLibrary("First", demoExecutable);
    layFile(demoInfo, xmlInfo({{"CFBundleExecutable", ""}}));
    EXPECT_EQ(CBundle("Demo.bundle").executable(), u"Demo");
}

TEST_F(CFBundleTest, TheFolderOfThisSystemComesFirst) {
    copyLibrary("First", "Demo.bundle/Contents/Linux/Demo");
    copyLibrary("Second", "Demo.bundle/Contents/MacOS/Demo");
    EXPECT_EQ(CBundle("Demo.bundle").libraryName(), "First");
    fs::remove("Demo.bundle/Contents/Linux/Demo");
    EXPECT_EQ(CBundle("Demo.bundle").libraryName(), "Second");
    EXPECT_EQ(CBundle("Demo.bundle").executable(), u"Demo");
    // What is no file is passed over.
    fs::create_directory("Demo.bundle/Contents/Linux/Demo");
    EXPECT_EQ(CBundle("Demo.bundle").libraryName(), "Second");
}

TEST_F(CFBundleTest, AnExecutableElsewhereIsNotFound) {
    copyLibrary("First", "Demo.bundle/Demo");
    copyLibrary("First", "Demo.bundle/Contents/Demo");
    CBundle const bundle("Demo.bundle");
    EXPECT_EQ(bundle.executable(), nothing);
    EXPECT_FALSE(bundle.load());
    EXPECT_EQ(bundle.symbol("libraryName"), nullptr);
}

TEST_F(CFBundleTest, TheCallerOwnsTheUrlOfTheExecutable) {
    copyLibrary("First", demoExecutable);
    CBundle bundle("Demo.bundle");
    CFURLRef const url = CFBundleCopyExecutableURL(bundle.get());
    bundle.release();
    EXPECT_EQ(CFGetRetainCount(url), 1);
    CPlatformString const name(CFURLCopyLastPathComponent(url));
    EXPECT_EQ(name.units(), u"Demo");
    CFRelease(url);
}

// --- loading

TEST_F(CFBundleTest, TheExecutableIsLoadedOnceAndUnloadedOnce) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    EXPECT_TRUE(moduleEvents().empty());
    EXPECT_TRUE(bundle.load());
    EXPECT_TRUE(bundle.load());
    EXPECT_EQ(openHandles, 1);
    EXPECT_EQ(moduleEvents(), TEvents{"+First"});
    bundle.unload();
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First"}));
    bundle.unload();
    EXPECT_EQ(openHandles, 0);
}

TEST_F(CFBundleTest, ALoadedExecutableNeedsItsFileNoMore) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    EXPECT_TRUE(bundle.load());
    fs::remove_all("Demo.bundle");
    EXPECT_TRUE(bundle.load());
    EXPECT_EQ(bundle.libraryName(), "First");
    bundle.unload();
    EXPECT_FALSE(bundle.load());
}

TEST_F(CFBundleTest, AnUnloadedExecutableIsLoadedAnew) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    EXPECT_TRUE(bundle.load());
    bundle.unload();
    EXPECT_TRUE(bundle.load());
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First", "+First"}));
}

TEST_F(CFBundleTest, AskingForAFunctionLoads) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    EXPECT_EQ(bundle.libraryName(), "First");
    EXPECT_EQ(moduleEvents(), TEvents{"+First"});
    bundle.unload();
    EXPECT_EQ(moduleEvents().size(), 2U);
    EXPECT_EQ(bundle.libraryName(), "First");
}

TEST_F(CFBundleTest, TheLastReleaseUnloads) {
    copyLibrary("First", demoExecutable);
    CBundle bundle("Demo.bundle");
    bundle.load();
    CFRetain(bundle.get());
    CFRelease(bundle.get());
    EXPECT_EQ(moduleEvents(), TEvents{"+First"});
    bundle.release();
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First"}));
}

TEST_F(CFBundleTest, BundlesOfOneFolderLoadAndUnloadApart) {
    copyLibrary("First", demoExecutable);
    CBundle const one("Demo.bundle");
    CBundle const other("Demo.bundle");
    EXPECT_NE(one.get(), other.get());
    EXPECT_TRUE(one.load());
    EXPECT_TRUE(other.load());
    one.unload();
    EXPECT_EQ(moduleEvents(), TEvents{"+First"});
    EXPECT_EQ(other.libraryName(), "First");
    other.unload();
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First"}));
}

TEST_F(CFBundleTest, SymbolsAreFoundByTheirNamesInUTF8) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    auto const greet = reinterpret_cast<int (*)()>(bundle.symbol("gr\xC3\xBC\xC3\x9F"
                                                                 "en"));
    ASSERT_NE(greet, nullptr);
    EXPECT_EQ(greet(), 7);
    EXPECT_EQ(*static_cast<int*>(bundle.symbol("libraryNumber")), 42);
    EXPECT_EQ(bundle.symbol("onlyInSecond"), nullptr);
    EXPECT_EQ(bundle.symbol(""), nullptr);
    CPlatformString const surrogate(std::u16string(1, 0xD800));
    EXPECT_EQ(CFBundleGetFunctionPointerForName(bundle.get(), surrogate.get()), nullptr);
    CPlatformString const beyond(std::u16string(u"libraryName\0x", 13));
    EXPECT_EQ(CFBundleGetFunctionPointerForName(bundle.get(), beyond.get()), nullptr);
}

TEST_F(CFBundleTest, SymbolsAreKeptFromOtherLibraries) {
    copyLibrary("First", "First.bundle/Contents/Linux/First");
    copyLibrary("Second", "Second.bundle/Contents/Linux/Second");
    CBundle const first("First.bundle");
    CBundle const second("Second.bundle");
    EXPECT_TRUE(first.load());
    EXPECT_EQ(second.libraryName(), "Second");
    EXPECT_EQ(second.symbol("onlyInFirst"), nullptr);
}

TEST_F(CFBundleTest, WhatIsNoLibraryIsNotLoaded) {
    std::string const whole = TestSupport::readFile(TestSupport::libraryFolder() + "/First.so");
    for (std::string const& bytes : {std::string(), std::string("text\n"), whole.substr(0, 100)}) {
        layFile(demoExecutable, bytes);
        CBundle const bundle("Demo.bundle");
        EXPECT_EQ(bundle.executable(), u"Demo");
        EXPECT_FALSE(bundle.load());
        EXPECT_EQ(bundle.symbol("libraryName"), nullptr);
        bundle.unload();
    }
    EXPECT_TRUE(moduleEvents().empty());
}

TEST_F(CFBundleTest, AFileThatComesLaterIsLoaded) {
    fs::create_directory("Demo.bundle");
    CBundle const bundle("Demo.bundle");
    EXPECT_FALSE(bundle.load());
    copyLibrary("First", demoExecutable);
    EXPECT_TRUE(bundle.load());
}

TEST_F(CFBundleTest, ThreadsThatLoadAtOnceKeepOneHandle) {
    copyLibrary("First", demoExecutable);
    for (int round = 0; round < 50; ++round) {
        CBundle const bundle("Demo.bundle");
        std::atomic<int> ready{0};
        std::atomic<int> found{0};
        auto const ask = [&] {
            ++ready;
            while (ready < 4)
                std::this_thread::yield();
            found += bundle.symbol("libraryName") != nullptr ? 1 : 0;
        };
        std::vector<std::thread> threads;
        for (int i = 0; i < 4; ++i)
            threads.emplace_back(ask);
        for (std::thread& thread : threads)
            thread.join();
        EXPECT_EQ(found, 4);
        EXPECT_EQ(openHandles, 1);
    }
}

TEST_F(CFBundleTest, OfTwoThatLoadTheFirstToEndCounts) {
    copyLibrary("First", demoExecutable);
    CBundle const bundle("Demo.bundle");
    void* inner = nullptr;
    onLoaded = [&] { inner = bundle.symbol("libraryName"); };
    EXPECT_TRUE(bundle.load());
    EXPECT_NE(inner, nullptr);
    EXPECT_EQ(bundle.symbol("libraryName"), inner);
    EXPECT_EQ(openHandles, 1);
}

// --- without memory

// Asks a bundle for everything. Returns whether it was all there.
bool use(CFStringRef path, CFStringRef functionName) {
    CFURLRef const url =
        CFURLCreateWithFileSystemPath(kCFAllocatorDefault, path, kCFURLPOSIXPathStyle, true);
    if (url == nullptr)
        return false;
    CFBundleRef const bundle = CFBundleCreate(kCFAllocatorDefault, url);
    CFRelease(url);
    if (bundle == nullptr)
        return false;
    CFURLRef const executable = CFBundleCopyExecutableURL(bundle);
    bool const complete =
        executable != nullptr &&
        CFBundleGetValueForInfoDictionaryKey(bundle, kCFBundleNameKey) != nullptr &&
        CFBundleGetFunctionPointerForName(bundle, functionName) != nullptr;
    if (executable != nullptr)
        CFRelease(executable);
    CFRelease(bundle);
    return complete;
}

// Each allocation in its turn is the one that fails.
TEST_F(CFBundleTest, ShortMemoryLeavesNothingBehind) {
    copyLibrary("First", demoExecutable);
    layFile(demoInfo, xmlInfo({{"CFBundleName", "Demo"}}));
    CPlatformString const path(u"Demo.bundle");
    CPlatformString const function(u"libraryName");
    long const before = TestSupport::liveObjects();
    long failures = 0;
    for (bool complete = false; !complete; failures += complete ? 0 : 1) {
        failingAllocation = failures + 1;
        complete = use(path.get(), function.get());
        failingAllocation = 0;
        EXPECT_EQ(TestSupport::liveObjects(), before);
        EXPECT_EQ(openHandles, 0);
    }
    // Two URLs, the bundle, its name and the name's place among the values.
    EXPECT_GE(failures, 5);
}

} // namespace
