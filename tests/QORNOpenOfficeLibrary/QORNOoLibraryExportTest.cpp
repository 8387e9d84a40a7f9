// The built file: what it shows to its host, and what it does when it is loaded.

#include "QORNOpenOfficeLibrary/ElfFile.h"
#include "QORNOpenOfficeLibrary/OutputCapture.h"
#include "QORNOpenOfficeLibrary/QORNOoLibrary_if.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <dirent.h>
#include <dlfcn.h>
#include <sys/stat.h>

namespace {

using BridgeTest::CElfFile;

std::string const file = QORN_TEST_LIBRARY;
std::string const folder = file.substr(0, file.rfind('/') + 1);

std::set<std::string> const exports = {"Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion",
                                       "Java_veltra_1qorn_QORN_1OoLibrary_initializeLibrary",
                                       "Java_veltra_1qorn_QORN_1OoLibrary_startSuppressingDialogs",
                                       "Java_veltra_1qorn_QORN_1OoLibrary_stopSuppressingDialogs"};

void* load(std::string const& name) {
    void* const library = dlopen(name.c_str(), RTLD_NOW | RTLD_LOCAL);
    EXPECT_NE(library, nullptr) << dlerror();
    return library;
}

bool isLoaded() {
    return dlopen(file.c_str(), RTLD_NOW | RTLD_NOLOAD) != nullptr;
}

template <class TFunction>
TFunction* find(void* library, char const* name) {
    auto* const function = reinterpret_cast<TFunction*>(dlsym(library, name));
    EXPECT_NE(function, nullptr) << dlerror();
    return function;
}

int threadCount() {
    int count = 0;
    DIR* const threads = opendir("/proc/self/task");
    while (dirent const* const entry = readdir(threads))
        count += entry->d_name[0] != '.';
    closedir(threads);
    return count;
}

bool hasOne(std::vector<std::string> const& texts, std::string const& part) {
    return std::any_of(texts.begin(), texts.end(), [&part](std::string const& text) {
        return text.find(part) != std::string::npos;
    });
}

TEST(CQORNOoLibraryExportTest, ItExportsTheFourNativeMethodsAndNothingElse) {
    EXPECT_EQ(CElfFile(file).definedSymbols(), exports);
}

TEST(CQORNOoLibraryExportTest, TheNativeMethodsAreFoundByName) {
    void* const library = load(file);
    for (std::string const& name : exports)
        find<void()>(library, name.c_str());
}

TEST(CQORNOoLibraryExportTest, ThePlainMethodsAnswer) {
    using TMethod = jint(JNIEnv*, jobject);
    void* const library = load(file);
    auto const call = [library](char const* name) {
        return find<TMethod>(library, name)(nullptr, nullptr);
    };
    EXPECT_EQ(call("Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion"), 3);
    EXPECT_EQ(call("Java_veltra_1qorn_QORN_1OoLibrary_stopSuppressingDialogs"), 0);
    EXPECT_EQ(call("Java_veltra_1qorn_QORN_1OoLibrary_startSuppressingDialogs"), 0);
}

TEST(CQORNOoLibraryExportTest, ASecondNameLeadsToTheSameFile) {
    EXPECT_EQ(file, folder + "libQORNOpenOffice.jnilib");
    struct stat first = {};
    struct stat second = {};
    ASSERT_EQ(stat(file.c_str(), &first), 0);
    ASSERT_EQ(stat((folder + "libQORNOpenOffice.so").c_str(), &second), 0);
    EXPECT_EQ(second.st_dev, first.st_dev);
    EXPECT_EQ(second.st_ino, first.st_ino);
    EXPECT_EQ(load(folder + "libQORNOpenOffice.so"), load(file)) << "two copies in one process";
}

TEST(CQORNOoLibraryExportTest, ItNeedsNoJavaMachineToBeLoaded) {
    auto const needed = CElfFile(file).strings(DT_NEEDED);
    EXPECT_TRUE(hasOne(needed, "libc.so"));
    EXPECT_FALSE(hasOne(needed, "libjvm"));
    EXPECT_FALSE(hasOne(needed, "libboost")) << "the host may bring another one";
}

TEST(CQORNOoLibraryExportTest, ItIsBoundAtOnceAndProtected) {
    CElfFile const elf(file);
    auto const flags = elf.values(DT_FLAGS_1);
    ASSERT_EQ(flags.size(), 1u);
    EXPECT_NE(flags.front() & DF_1_NOW, 0u);
    EXPECT_EQ(elf.segmentFlags(PT_GNU_RELRO).size(), 1u);
    EXPECT_EQ(elf.values(DT_TEXTREL).size(), 0u);
    auto const stack = elf.segmentFlags(PT_GNU_STACK);
    ASSERT_EQ(stack.size(), 1u);
    EXPECT_EQ(stack.front() & PF_X, 0u);
}

TEST(CQORNOoLibraryExportTest, ItStaysWhenItIsUnloaded) {
    if (isLoaded())
        GTEST_SKIP() << "needs a process that has not loaded the library yet";
    EXPECT_EQ(dlclose(load(file)), 0);
    EXPECT_TRUE(isLoaded());
}

TEST(CQORNOoLibraryExportTest, LoadingStartsNoThreadAndWritesNothing) {
    if (isLoaded())
        GTEST_SKIP() << "needs a process that has not loaded the library yet";
    int const before = threadCount();
    BridgeTest::COutputCapture const output;
    load(file);
    EXPECT_EQ(threadCount(), before);
    EXPECT_EQ(output.text(), "");
}

} // namespace
