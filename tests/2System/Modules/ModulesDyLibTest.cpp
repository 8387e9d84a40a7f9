// Libraries that load: by which loader, in which order, and what is undone.

#include "2System/Modules/ModulesCases.h"

#include <dlfcn.h>

#include <filesystem>
#include <iterator>
#include <vector>

namespace fs = std::filesystem;

using Modules::CDyLib;
using Modules::loadLibrary;
using Modules::TLibraryRef;
using Modules::unloadLibrary;
using ModulesTest::CLoaderCalls;
using ModulesTest::libraryName;
using ModulesTest::openHandles;
using ModulesTest::TCalls;
using TestSupport::copyLibrary;
using TestSupport::layFile;
using TestSupport::moduleEvents;

extern "C" void qornModuleEvent(char const* event);

namespace {

using CModulesDyLibTest = ModulesTest::CLoaderTest;
using TEvents = std::vector<std::string>;

// The folder "Second.so" in the working directory is a bundle, and dlopen finds the library
// "Second.so" by that name where the build made it.
constexpr wchar_t const* both = L"Second.so";

void makeBundle(std::string const& library, std::string const& folder) {
    copyLibrary(library, folder + "/Contents/Linux/Main");
    layFile(folder + "/Contents/Info.plist",
            TestSupport::xmlInfo({{"CFBundleExecutable", "Main"}}));
}

// --- which loader holds what

TEST_F(CModulesDyLibTest, AFileIsHeldByItsHandleAlone) {
    copyLibrary("First", "First.so");
    TLibraryRef const library = loadLibrary(L"./First.so", 0);
    EXPECT_EQ(library.first, nullptr);
    EXPECT_NE(library.second, nullptr);
    EXPECT_EQ(moduleEvents(), TEvents{"+First"});
    unloadLibrary(library);
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First"}));
}

TEST_F(CModulesDyLibTest, ABundleFolderIsHeldByItsBundleAlone) {
    makeBundle("First", "First.bundle");
    TLibraryRef const library = loadLibrary(L"./First.bundle", 0);
    EXPECT_NE(library.first, nullptr);
    EXPECT_EQ(library.second, nullptr);
    EXPECT_EQ(moduleEvents(), TEvents{"+First"});
    unloadLibrary(library);
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First"}));
}

TEST_F(CModulesDyLibTest, BothFormsOfInfoPlistNameTheExecutable) {
    copyLibrary("First", "First.bundle/Contents/Linux/Main");
    copyLibrary("Second", "First.bundle/Contents/Linux/Other");
    std::string const plist = "First.bundle/Contents/Info.plist";
    layFile(plist, TestSupport::xmlInfo({{"CFBundleExecutable", "Main"}}));
    EXPECT_EQ(libraryName(CDyLib(L"First.bundle", 0)), "First");
    layFile(plist, TestSupport::binaryInfo({{"CFBundleExecutable", "Other"}}));
    EXPECT_EQ(libraryName(CDyLib(L"First.bundle", 0)), "Second");
}

TEST_F(CModulesDyLibTest, WhatBothLoadersTakeIsHeldByBoth) {
    makeBundle("First", "Second.so");
    TLibraryRef const library = loadLibrary(both, 0);
    EXPECT_NE(library.first, nullptr);
    EXPECT_NE(library.second, nullptr);
    EXPECT_EQ(openHandles(), 2);
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "+Second"}));
    unloadLibrary(library);
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "+Second", "-First", "-Second"}));
}

TEST_F(CModulesDyLibTest, OneLibraryThatIsHeldTwiceComesAndGoesOnce) {
    fs::create_directories("Second.so/Contents/Linux");
    fs::create_symlink(TestSupport::libraryFolder() + "/Second.so",
                       "Second.so/Contents/Linux/Second");
    {
        CDyLib const library(both, 0);
        EXPECT_EQ(openHandles(), 2);
        EXPECT_EQ(libraryName(library), "Second");
        EXPECT_EQ(moduleEvents(), TEvents{"+Second"});
    }
    EXPECT_EQ(moduleEvents(), (TEvents{"+Second", "-Second"}));
}

TEST_F(CModulesDyLibTest, ANameWithoutASeparatorIsLookedForInTheLoadersFolders) {
    CDyLib const library(L"Second.so", 0);
    EXPECT_EQ(libraryName(library), "Second");
}

TEST_F(CModulesDyLibTest, TheEmptyNameIsTheProgramItself) {
    CLoaderCalls const calls;
    CDyLib const program(L"", 0);
    EXPECT_EQ(calls.all(), (TCalls{"CFURLCreateWithFileSystemPath file", "dlopen  lazy"}));
    EXPECT_EQ(program.getSymbol(L"qornModuleEvent"), reinterpret_cast<void*>(qornModuleEvent));
}

TEST_F(CModulesDyLibTest, PathsOfAnyLettersAreLoaded) {
    std::string const folder = "Gr\xC3\xB6\xC3\x9F"
                               "e \xE6\x97\xA5\xE6\x9C\xAC \xF0\x9F\x98\x80";
    Strings::string const path = L"./Gr\u00F6\u00DFe \u65E5\u672C \U0001F600/";
    copyLibrary("First", folder + "/caf\xC3\xA9.so");
    makeBundle("Second", folder + "/caf\xC3\xA9.bundle");
    EXPECT_EQ(libraryName(CDyLib(path + L"caf\u00E9.so", 0)), "First");
    EXPECT_EQ(libraryName(CDyLib(path + L"caf\u00E9.bundle", 0)), "Second");
    EXPECT_EQ(libraryName(CDyLib(path + L"caf\u00E9.bundle/", 0)), "Second");
}

// --- the calls

TEST_F(CModulesDyLibTest, BothLoadersAreTriedForAFile) {
    copyLibrary("First", "First.so");
    CLoaderCalls const calls;
    { CDyLib const library(L"./First.so", 0); }
    EXPECT_EQ(calls.all(), (TCalls{"CFURLCreateWithFileSystemPath file", "CFBundleCreate",
                                   "CFRelease url", "dlopen ./First.so lazy", "dlclose"}));
}

TEST_F(CModulesDyLibTest, BothLoadersAreTriedForABundle) {
    makeBundle("First", "First.bundle");
    CLoaderCalls const calls;
    { CDyLib const library(L"./First.bundle", 0); }
    EXPECT_EQ(calls.all(),
              (TCalls{"CFURLCreateWithFileSystemPath folder", "CFBundleCreate", "CFRelease url",
                      "CFBundleLoadExecutable", "dlopen ./First.bundle lazy",
                      "CFBundleUnloadExecutable", "CFRelease bundle"}));
}

TEST_F(CModulesDyLibTest, TheBundleIsUndoneBeforeTheHandle) {
    makeBundle("First", "Second.so");
    TLibraryRef const library = loadLibrary(both, 0);
    CLoaderCalls const calls;
    unloadLibrary(library);
    EXPECT_EQ(calls.all(), (TCalls{"CFBundleUnloadExecutable", "CFRelease bundle", "dlclose"}));
}

TEST_F(CModulesDyLibTest, NothingIsUndoneForNothing) {
    CLoaderCalls const calls;
    unloadLibrary(TLibraryRef());
    EXPECT_TRUE(calls.all().empty());
}

TEST_F(CModulesDyLibTest, TheFlagsAreNotRead) {
    copyLibrary("First", "First.so");
    for (Modules::LoadFlags const flags :
         {Modules::LoadFlags(0), Modules::LoadFlags(RTLD_NOW), Modules::LoadFlags(RTLD_GLOBAL),
          Modules::LoadFlags(RTLD_NOLOAD), ~Modules::LoadFlags(0)}) {
        CLoaderCalls const calls;
        unloadLibrary(loadLibrary(L"./First.so", flags));
        { CDyLib const library(L"./First.so", flags); }
        EXPECT_EQ(calls.all().at(3), "dlopen ./First.so lazy");
        EXPECT_EQ(calls.all().at(8), "dlopen ./First.so lazy");
    }
}

// Each of the libraries calls a function that nobody defines.
TEST_F(CModulesDyLibTest, SymbolsAreBoundAtTheirFirstUse) {
    copyLibrary("First", "First.so");
    EXPECT_EQ(::dlopen("./First.so", RTLD_NOW), nullptr);
    CDyLib const library(L"./First.so", RTLD_NOW);
    EXPECT_NE(library.getSymbol(L"callsNowhere"), nullptr);
}

// --- symbols

TEST_F(CModulesDyLibTest, SymbolsComeByEitherRoad) {
    copyLibrary("First", "First.so");
    makeBundle("First", "First.bundle");
    for (wchar_t const* const path : {L"./First.so", L"./First.bundle"}) {
        CDyLib const library(path, 0);
        EXPECT_EQ(libraryName(library), "First");
        EXPECT_EQ(*static_cast<int*>(library.getSymbol(L"libraryNumber")), 42);
        EXPECT_EQ(reinterpret_cast<int (*)()>(library.getSymbol(L"onlyInFirst"))(), 1);
        EXPECT_EQ(reinterpret_cast<int (*)()>(library.getSymbol(L"gr\u00FC\u00DFen"))(), 7);
    }
}

TEST_F(CModulesDyLibTest, OneLoaderIsAskedForASymbol) {
    copyLibrary("First", "First.so");
    makeBundle("First", "First.bundle");
    CDyLib const file(L"./First.so", 0);
    CDyLib const bundle(L"./First.bundle", 0);
    CLoaderCalls const calls;
    file.getSymbol(L"gr\u00FC\u00DFen");
    bundle.getSymbol(L"libraryName");
    EXPECT_EQ(calls.all(), (TCalls{"dlsym gr\xC3\xBC\xC3\x9F"
                                   "en",
                                   "CFBundleGetFunctionPointerForName"}));
}

TEST_F(CModulesDyLibTest, ABundleHidesTheHandle) {
    makeBundle("First", "Second.so");
    CDyLib const library(both, 0);
    EXPECT_EQ(libraryName(library), "First");
    EXPECT_EQ(reinterpret_cast<int (*)()>(library.getSymbol(L"onlyInFirst"))(), 1);

    void* const handle = ::dlopen("Second.so", RTLD_LAZY);
    EXPECT_NE(::dlsym(handle, "onlyInSecond"), nullptr);
    ::dlclose(handle);
    CLoaderCalls const calls;
    EXPECT_THROW(library.getSymbol(L"onlyInSecond"), Modules::TExcSymbolNotFound);
    EXPECT_EQ(calls.all(), TCalls{"CFBundleGetFunctionPointerForName"});
}

// --- lifetime

TEST_F(CModulesDyLibTest, ALibraryIsLoadedAsLongAsItsOwnersLive) {
    copyLibrary("First", "First.so");
    {
        CDyLib const outer(L"./First.so", 0);
        { CDyLib const inner(L"./First.so", 0); }
        EXPECT_EQ(moduleEvents(), TEvents{"+First"});
        EXPECT_EQ(libraryName(outer), "First");
    }
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First"}));
}

TEST_F(CModulesDyLibTest, TwoOwnersOfOneBundleDoNotUnloadEachOther) {
    makeBundle("First", "First.bundle");
    {
        CDyLib const outer(L"First.bundle", 0);
        { CDyLib const inner(L"First.bundle", 0); }
        EXPECT_EQ(libraryName(outer), "First");
        EXPECT_EQ(moduleEvents(), TEvents{"+First"});
    }
    EXPECT_EQ(moduleEvents(), (TEvents{"+First", "-First"}));
}

TEST_F(CModulesDyLibTest, ManyRoundsLeaveNothingBehind) {
    copyLibrary("First", "First.so");
    makeBundle("Second", "Second.bundle");
    auto const openFiles = [] {
        return std::distance(fs::directory_iterator("/proc/self/fd"), fs::directory_iterator());
    };
    auto const before = openFiles();
    for (int round = 0; round < 200; ++round) {
        EXPECT_EQ(libraryName(CDyLib(L"./First.so", 0)), "First");
        EXPECT_EQ(libraryName(CDyLib(L"./Second.bundle", 0)), "Second");
    }
    EXPECT_EQ(moduleEvents().size(), 800U);
    EXPECT_EQ(openFiles(), before);
}

} // namespace
