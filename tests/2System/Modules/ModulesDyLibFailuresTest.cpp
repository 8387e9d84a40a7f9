// Libraries that don't load, and symbols that are not there.

#include "2System/Modules/ModulesCases.h"

#include "support/MessageParameters.h"
#include "support/TextFailures.h"

#include <elf.h>

#include <cstddef>
#include <cstring>
#include <filesystem>
#include <sstream>
#include <vector>

namespace fs = std::filesystem;

using FileSys::CFileSpec;
using Modules::CDyLib;
using Modules::loadLibrary;
using ModulesTest::CLoaderCalls;
using ModulesTest::libraryName;
using ModulesTest::openHandles;
using ModulesTest::TCalls;
using TestSupport::copyLibrary;
using TestSupport::layFile;
using TestSupport::moduleEvents;
using TestSupport::readFile;
using TestSupport::TParameters;

namespace {

// Nothing is loaded by a call that fails, and each bundle that was made is released.
class CModulesDyLibFailuresTest : public ModulesTest::CLoaderTest {
  protected:
    // Both ways to load raise the same.
    static void expectNotFound(Strings::string const& path, std::string const& narrowPath) {
        expectNotFoundBy([&path] { loadLibrary(path, 0); }, "loadLibrary(", narrowPath);
        expectNotFoundBy([&path] { CDyLib const library(path, 0); }, "CDyLib(", narrowPath);
    }

  private:
    template <class TLoad>
    static void expectNotFoundBy(TLoad const& load, std::string const& function,
                                 std::string const& narrowPath) {
        long const liveBefore = TestSupport::liveObjects();
        try {
            load();
            ADD_FAILURE() << narrowPath << " was loaded";
        } catch (Modules::TExcDyLibNotFound const& exc) {
            EXPECT_EQ(TestSupport::parametersOf(exc.getInfo().getMessage()),
                      (TParameters{{"type", L"dynamic link library"},
                                   {"key", CFileSpec(narrowPath).getFullName(false) + L' '}}));
            std::ostringstream text;
            text << exc.getInfo().getMessage();
            EXPECT_EQ(text.str(), "dynamic link library " + narrowPath + "  was not found");
            EXPECT_STREQ(exc.getExcName(), "DyLibNotFound");
            EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
            EXPECT_NE(std::string(exc.getInfo().getOrigin().getFunc()).find(function),
                      std::string::npos);
            EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
        }
        EXPECT_EQ(openHandles(), 0);
        EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
        EXPECT_TRUE(moduleEvents().empty());
    }
};

std::string firstLibrary() {
    return readFile(TestSupport::libraryFolder() + "/First.so");
}

// --- what can't be loaded

TEST_F(CModulesDyLibFailuresTest, APathThatDoesNotExist) {
    expectNotFound(L"./missing.so", "./missing.so");
    expectNotFound(L"/nowhere/at/all", "/nowhere/at/all");
    expectNotFound(L"missing without a separator", "missing without a separator");
    expectNotFound(L"./a b/\u65E5\u672C", "./a b/\xE6\x97\xA5\xE6\x9C\xAC");
}

TEST_F(CModulesDyLibFailuresTest, AFileThatIsNoLibrary) {
    layFile("empty.so", "");
    layFile("text.so", "INPUT(libm.so.6)\n");
    expectNotFound(L"./empty.so", "./empty.so");
    expectNotFound(L"./text.so", "./text.so");
    fs::create_symlink("link", "link");
    expectNotFound(L"./link", "./link");
}

TEST_F(CModulesDyLibFailuresTest, ALibraryThatIsCutOff) {
    std::string const whole = firstLibrary();
    for (std::size_t const size : {std::size_t(4), sizeof(Elf64_Ehdr) - 1, sizeof(Elf64_Ehdr),
                                   sizeof(Elf64_Ehdr) + sizeof(Elf64_Phdr)}) {
        layFile("cut.so", whole.substr(0, size));
        expectNotFound(L"./cut.so", "./cut.so");
    }
}

TEST_F(CModulesDyLibFailuresTest, ALibraryOfAnotherMachine) {
    std::string machine = firstLibrary();
    auto const other = static_cast<Elf64_Half>(EM_PPC64);
    std::memcpy(&machine[offsetof(Elf64_Ehdr, e_machine)], &other, sizeof(other));
    layFile("machine.so", machine);
    expectNotFound(L"./machine.so", "./machine.so");

    std::string width = firstLibrary();
    width[EI_CLASS] = ELFCLASS32;
    layFile("width.so", width);
    expectNotFound(L"./width.so", "./width.so");

    std::string order = firstLibrary();
    order[EI_DATA] = ELFDATA2MSB;
    layFile("order.so", order);
    expectNotFound(L"./order.so", "./order.so");
}

TEST_F(CModulesDyLibFailuresTest, ALibraryThatMissesAnother) {
    copyLibrary("Dependent", "Dependent.so");
    expectNotFound(L"./Dependent.so", "./Dependent.so");
    copyLibrary("Dependent", "Dependent.bundle/Contents/Linux/Dependent");
    expectNotFound(L"./Dependent.bundle", "./Dependent.bundle");

    // With the other one loaded it is complete.
    copyLibrary("apart/Dependency", "Dependency.so");
    CDyLib const dependency(L"./Dependency.so", 0);
    CDyLib const dependent(L"./Dependent.so", 0);
    EXPECT_EQ(reinterpret_cast<int (*)()>(dependent.getSymbol(L"onlyInDependent"))(), 1);
}

TEST_F(CModulesDyLibFailuresTest, AFolderWithoutAnExecutable) {
    fs::create_directories("Plain/Contents/Linux");
    expectNotFound(L"./Plain", "./Plain");
    expectNotFound(L".", ".");
    expectNotFound(L"/", "/");
}

TEST_F(CModulesDyLibFailuresTest, ABundleWhoseExecutableCanNotBeLoaded) {
    layFile("Demo.bundle/Contents/Info.plist",
            TestSupport::xmlInfo({{"CFBundleName", "Demo"}, {"CFBundleVersion", "1"}}));
    layFile("Demo.bundle/Contents/Linux/Demo", firstLibrary().substr(0, 100));
    expectNotFound(L"./Demo.bundle", "./Demo.bundle");

    CLoaderCalls const calls;
    EXPECT_THROW(loadLibrary(L"./Demo.bundle", 0), Modules::TExcDyLibNotFound);
    EXPECT_EQ(calls.all(),
              (TCalls{"CFURLCreateWithFileSystemPath folder", "CFBundleCreate", "CFRelease url",
                      "CFBundleLoadExecutable", "CFRelease bundle", "dlopen ./Demo.bundle lazy"}));
}

TEST_F(CModulesDyLibFailuresTest, ABundleThatFailsLeavesTheHandle) {
    layFile("Second.so/Contents/Linux/Second", "no library");
    long const liveBefore = TestSupport::liveObjects();
    Modules::TLibraryRef const library = loadLibrary(L"Second.so", 0);
    EXPECT_EQ(library.first, nullptr);
    EXPECT_NE(library.second, nullptr);
    EXPECT_EQ(TestSupport::liveObjects(), liveBefore);
    Modules::unloadLibrary(library);
}

TEST_F(CModulesDyLibFailuresTest, WithoutAUrlOrABundleTheHandleIsTaken) {
    copyLibrary("First", "First.so");
    for (char const* const function : {"CFURLCreateWithFileSystemPath", "CFBundleCreate"}) {
        CLoaderCalls calls;
        calls.fail(function);
        EXPECT_EQ(libraryName(CDyLib(L"./First.so", 0)), "First") << function;
    }
}

TEST_F(CModulesDyLibFailuresTest, WithoutAHandleTheBundleIsTaken) {
    copyLibrary("First", "Second.so/Contents/Linux/Second");
    CLoaderCalls calls;
    calls.fail("dlopen");
    EXPECT_EQ(libraryName(CDyLib(L"Second.so", 0)), "First");
    EXPECT_EQ(calls.all().at(4), "dlopen Second.so lazy");
}

TEST_F(CModulesDyLibFailuresTest, APathThatIsNoTextRaisesTheConversionFailure) {
    copyLibrary("First", "First.so");
    Strings::string const path = L"./First.so" + Strings::string(1, static_cast<wchar_t>(0xD800));
    CLoaderCalls const calls;
    EXPECT_THROW(loadLibrary(path, 0), Encoding::TExcEncoding);
    EXPECT_THROW(CDyLib(path, 0), Encoding::TExcEncoding);
    EXPECT_TRUE(calls.all().empty());
}

// --- symbols

void expectSymbolNotFound(CDyLib const& library, Strings::string const& name,
                          std::string const& narrowName) {
    try {
        library.getSymbol(name);
        ADD_FAILURE() << narrowName << " was found";
    } catch (Modules::TExcSymbolNotFound const& exc) {
        EXPECT_EQ(TestSupport::parametersOf(exc.getInfo().getMessage()),
                  (TParameters{{"type", L"symbol"}, {"key", name}}));
        std::ostringstream text;
        text << exc.getInfo().getMessage();
        EXPECT_EQ(text.str(), "symbol " + narrowName + " was not found");
        EXPECT_STREQ(exc.getExcName(), "SymbolNotFound");
    }
}

TEST_F(CModulesDyLibFailuresTest, AnUnknownSymbolIsNotFoundByEitherRoad) {
    copyLibrary("First", "First.so");
    copyLibrary("First", "First.bundle/Contents/Linux/First");
    for (wchar_t const* const path : {L"./First.so", L"./First.bundle"}) {
        CDyLib const library(path, 0);
        expectSymbolNotFound(library, L"onlyInSecond", "onlyInSecond");
        expectSymbolNotFound(library, L"LIBRARYNAME", "LIBRARYNAME");
        expectSymbolNotFound(library, L"", "");
        expectSymbolNotFound(library, L"caf\u00E9", "caf\xC3\xA9");
        EXPECT_EQ(libraryName(library), "First");
    }
}

TEST_F(CModulesDyLibFailuresTest, ASymbolWhoseAddressIsNullIsNotFound) {
    copyLibrary("First", "First.so");
    copyLibrary("First", "First.bundle/Contents/Linux/First");
    for (wchar_t const* const path : {L"./First.so", L"./First.bundle"})
        expectSymbolNotFound(CDyLib(path, 0), L"symbolAtNull", "symbolAtNull");
}

TEST_F(CModulesDyLibFailuresTest, ANameThatIsNoTextRaisesTheConversionFailure) {
    copyLibrary("First", "First.so");
    copyLibrary("First", "First.bundle/Contents/Linux/First");
    Strings::string const name(1, static_cast<wchar_t>(0xD800));
    for (wchar_t const* const path : {L"./First.so", L"./First.bundle"}) {
        CDyLib const library(path, 0);
        CLoaderCalls const calls;
        EXPECT_THROW(library.getSymbol(name), Encoding::TExcEncoding);
        EXPECT_TRUE(calls.all().empty());
    }
}

// --- the chain, and unloading

template <class TLevel>
bool isCaughtAs() {
    bool notFound = false;
    bool symbolNotFound = false;
    try {
        loadLibrary(L"./missing.so", 0);
    } catch (TLevel const&) {
        notFound = true;
    }
    try {
        CDyLib(L"", 0).getSymbol(L"missing");
    } catch (TLevel const&) {
        symbolNotFound = true;
    }
    return notFound && symbolNotFound;
}

TEST_F(CModulesDyLibFailuresTest, BothFailuresAreCaughtAtEveryLevelAboveThem) {
    EXPECT_TRUE(isCaughtAs<Modules::TExcDyLib>());
    EXPECT_TRUE(isCaughtAs<Modules::TExcModules>());
    EXPECT_TRUE(isCaughtAs<TExcSystem>());
    EXPECT_TRUE(isCaughtAs<Error::CException>());
}

TEST_F(CModulesDyLibFailuresTest, AFailureToUnloadGoesUnnoticed) {
    copyLibrary("First", "First.so");
    CLoaderCalls calls;
    calls.fail("dlclose");
    EXPECT_NO_THROW({ CDyLib const library(L"./First.so", 0); });
    EXPECT_NO_THROW(Modules::unloadLibrary(loadLibrary(L"./First.so", 0)));
    EXPECT_EQ(calls.all().back(), "dlclose");
}

} // namespace
