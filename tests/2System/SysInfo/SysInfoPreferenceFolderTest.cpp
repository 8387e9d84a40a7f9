// The plain road: files of the process's own.

#include "2System/SysInfo/SysInfoPreferenceFolderCases.h"

#include "2System/FileSys/FileSysExc.h"
#include "2System/SysInfo/SysInfoExc.h"

#include "support/LogRecorder.h"
#include "support/MessageParameters.h"
#include "support/Place.h"
#include "support/SystemCalls.h"
#include "support/TextFailures.h"

#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <filesystem>
#include <functional>
#include <system_error>

using Strings::string;

// What stands in front of MacOS::setHiddenAttribute, where a test wants to see it called.
static std::function<bool(string const&, bool)> onSetHidden;

bool realSetHidden(string const& path, bool hidden) __asm__("__real_" SET_HIDDEN);
bool wrapSetHidden(string const& path, bool hidden) __asm__("__wrap_" SET_HIDDEN);

bool wrapSetHidden(string const& path, bool hidden) {
    return onSetHidden ? onSetHidden(path, hidden) : realSetHidden(path, hidden);
}

namespace {

using namespace PreferenceTest;

class CPlainPreferenceTest : public CPreferenceFolderTest {
  protected:
    void TearDown() override {
        onSetHidden = nullptr;
        CPreferenceFolderTest::TearDown();
    }
};

mode_t permissionsOf(std::string const& file) {
    struct stat status;
    EXPECT_EQ(stat(file.c_str(), &status), 0) << file;
    return status.st_mode & 07777U;
}

bool isHidden(std::string const& file) {
    return getxattr(file.c_str(), "user.hidden", nullptr, 0) > 0;
}

bool canHide(std::string const& folder) {
    return setxattr(folder.c_str(), "user.probe", "1", 1, 0) == 0;
}

// The mask of new files' permissions, for the length of a scope.
class CMask {
  public:
    explicit CMask(mode_t mask) : before_(umask(mask)) {}
    ~CMask() { umask(before_); }
    CMask(CMask const&) = delete;
    CMask& operator=(CMask const&) = delete;

  private:
    mode_t before_;
};

// Opening.

TEST_F(CPlainPreferenceTest, TheKindSaysWhereTheStoreLies) {
    CPreferenceFolder(CSystemPrefs::ekUser, CSystemPrefs::erRead, at("a"), true, nullptr);
    CPreferenceFolder(CSystemPrefs::ekMachine, CSystemPrefs::erRead, at("b/c"), true, nullptr);
    CPreferenceFolder(CSystemPrefs::ekUser, CSystemPrefs::erRead, CSystemPrefsPath(), true,
                      nullptr);
    EXPECT_EQ(listTree(path()),
              (TNames{"machine", "machine/Library", "machine/Library/Preferences",
                      "machine/Library/Preferences/b", "machine/Library/Preferences/b/c", "user",
                      "user/Library", "user/Library/Preferences", "user/Library/Preferences/a"}));
}

TEST_F(CPlainPreferenceTest, AKindThatIsNoneFailsACheck) {
    for (int const kind : {2, -1, 256}) {
        EXPECT_EQ(TestSupport::failedCheckOf([&] {
                      CPreferenceFolder(CSystemPrefs::EKind(kind), CSystemPrefs::erRead, at("a"),
                                        true, nullptr);
                  }),
                  "!\"invalid SysInfo::CSystemPrefs::EKind\"")
            << kind;
    }
    EXPECT_EQ(listTree(path()), TNames());
}

TEST_F(CPlainPreferenceTest, AStoreThatIsNotToBeMadeMayBeMissing) {
    CPreferenceFolder store = userStore(nullptr, false);
    EXPECT_EQ(valueOf(store, "", "key"), "(untouched)");
    EXPECT_EQ(store.getValues(), TNames());
    EXPECT_TRUE(store.getPaths().empty());
    store.deleteKey(at("path"));
    store.deleteKey(at(""));
    store.deleteValue(at("path"), "key");
    EXPECT_EQ(listTree(path()), TNames());
}

TEST_F(CPlainPreferenceTest, AStoreThatIsThereIsOpened) {
    userStore().setValue(at(""), "key", bytes("value"));
    EXPECT_EQ(valueOf(userStore(), "", "key"), "value");
    EXPECT_EQ(valueOf(userStore(nullptr, false), "", "key"), "value");
}

TEST_F(CPlainPreferenceTest, WhatStandsInTheStoresPlaceCountsAsTheStore) {
    makeFolders(path("user/Library/Preferences"));
    writeFile(user());
    EXPECT_EQ(valueOf(userStore(), "", "key"), "(untouched)");
}

TEST_F(CPlainPreferenceTest, AStoreThatCannotBeMadeRaises) {
    writeFile(path("user"));
    EXPECT_THROW(userStore(), FileSys::TExcFileSpec);
}

TEST_F(CPlainPreferenceTest, TheRightChangesNothing) {
    for (CSystemPrefs::ERight const right : {CSystemPrefs::erRead, CSystemPrefs::erWrite}) {
        CPreferenceFolder store(CSystemPrefs::ekUser, right, at("Acme"), true, nullptr);
        store.setValue(at(""), "key", bytes("value"));
        EXPECT_EQ(valueOf(store, "", "key"), "value");
    }
}

// Values.

TEST_F(CPlainPreferenceTest, AValueIsTheContentOfItsFile) {
    CPreferenceFolder store = userStore();
    for (std::size_t const size : valueSizes) {
        std::string const content = binaryContent(size);
        store.setValue(at("Window/Main"), "size", bytes(content));
        EXPECT_TRUE(readFile(user("/Window/Main/size")) == content) << size;
        EXPECT_TRUE(valueOf(store, "Window/Main", "size") == content) << size;
    }
    EXPECT_EQ(listTree(user()), (TNames{"Window", "Window/Main", "Window/Main/size"}));
}

TEST_F(CPlainPreferenceTest, AMissingValueLeavesTheCallersValue) {
    CPreferenceFolder const store = userStore();
    EXPECT_EQ(valueOf(store, "", "missing"), "(untouched)");
    EXPECT_EQ(valueOf(store, "missing", "missing"), "(untouched)");
}

TEST_F(CPlainPreferenceTest, AnEmptyFileEmptiesTheCallersValue) {
    CPreferenceFolder const store = userStore();
    writeFile(user("/key"));
    EXPECT_EQ(valueOf(store, "", "key"), "");
}

TEST_F(CPlainPreferenceTest, AFolderReadsAsAnEmptyValue) {
    CPreferenceFolder const store = userStore();
    makeFolders(user("/key"));
    EXPECT_EQ(valueOf(store, "", "key"), "");
}

TEST_F(CPlainPreferenceTest, AFileThatMayNotBeReadLooksMissing) {
    CPreferenceFolder const store = userStore();
    writeFile(user("/key"), "secret");
    chmod(user("/key").c_str(), 0);
    runAsOrdinaryUser([&store] { EXPECT_EQ(valueOf(store, "", "key"), "(untouched)"); });
}

TEST_F(CPlainPreferenceTest, AValueReplacesTheOldOneWholly) {
    CPreferenceFolder store = userStore();
    for (char const* const value : {"a long value", "short", "", "an even longer value"}) {
        store.setValue(at(""), "key", bytes(value));
        EXPECT_EQ(readFile(user("/key")), value);
    }
}

TEST_F(CPlainPreferenceTest, TheFileIsRewrittenInPlace) {
    CPreferenceFolder store = userStore();
    store.setValue(at(""), "key", bytes("old"));
    EXPECT_EQ(link(user("/key").c_str(), path("link").c_str()), 0);
    store.setValue(at(""), "key", bytes("new"));
    EXPECT_EQ(readFile(path("link")), "new");
}

TEST_F(CPlainPreferenceTest, EachWriteHidesTheFileAndOpensItToAll) {
    CMask const mask(0077);
    CPreferenceFolder store = userStore();
    store.setValue(at(""), "key", bytes("1"));
    EXPECT_EQ(permissionsOf(user("/key")), 0666U);

    chmod(user("/key").c_str(), 0311);
    store.setValue(at(""), "key", bytes("2"));
    EXPECT_EQ(permissionsOf(user("/key")), 0777U);
    chmod(user("/key").c_str(), 0600);
    store.setValue(at(""), "key", bytes("3"));
    EXPECT_EQ(permissionsOf(user("/key")), 0666U);

    if (!canHide(user()))
        GTEST_SKIP() << "files can't be hidden here";
    EXPECT_TRUE(isHidden(user("/key")));
    removexattr(user("/key").c_str(), "user.hidden");
    store.setValue(at(""), "key", bytes("4"));
    EXPECT_TRUE(isHidden(user("/key")));
}

TEST_F(CPlainPreferenceTest, TheFileIsHiddenBeforeItIsOpenedToAll) {
    CMask const mask(0077);
    CPreferenceFolder store = userStore();
    int calls = 0;
    onSetHidden = [&](string const& file, bool hidden) {
        ++calls;
        EXPECT_EQ(file, Encoding::convert<string>(user("/key")));
        EXPECT_TRUE(hidden);
        EXPECT_EQ(permissionsOf(user("/key")), 0600U);
        return true;
    };
    store.setValue(at(""), "key", bytes("value"));
    EXPECT_EQ(calls, 1);
    EXPECT_EQ(permissionsOf(user("/key")), 0666U);
}

// Whether this process has the file open.
bool isOpen(std::string const& file) {
    std::error_code gone;
    for (auto const& entry : std::filesystem::directory_iterator("/proc/self/fd"))
        if (std::filesystem::read_symlink(entry, gone) == file)
            return true;
    return false;
}

// Readers that wait for the close find the value as it is to stay.
TEST_F(CPlainPreferenceTest, TheFileIsHiddenAndOpenedToAllBeforeItIsClosed) {
    CPreferenceFolder store = userStore();
    TNames steps;
    onSetHidden = [&](string const&, bool) {
        steps.push_back(isOpen(user("/key")) ? "hidden" : "hidden when closed");
        return true;
    };
    {
        TestSupport::CSystemCalls calls;
        calls.observe([&](std::string const& function, std::string const& file) {
            if (function == "chmod" && file == user("/key"))
                steps.push_back(isOpen(file) ? "opened to all" : "opened to all when closed");
        });
        store.setValue(at(""), "key", bytes("value"));
    }
    EXPECT_EQ(steps, (TNames{"hidden", "opened to all"}));
    EXPECT_FALSE(isOpen(user("/key")));
}

TEST_F(CPlainPreferenceTest, AFileThatCannotBeHiddenRaises) {
    CMask const mask(0077);
    CPreferenceFolder store = userStore();
    onSetHidden = [](string const&, bool) { return false; };
    try {
        store.setValue(at(""), "key", bytes("value"));
        FAIL() << "nothing was raised";
    } catch (SysInfo::TExcSystemPrefs const& exc) {
        EXPECT_NE(dynamic_cast<SysInfo::TExcPreferenceFolder const*>(&exc), nullptr);
        EXPECT_NE(dynamic_cast<SysInfo::TExcSysInfo const*>(&exc), nullptr);
        EXPECT_NE(dynamic_cast<TExcSystem const*>(&exc), nullptr);
        EXPECT_STREQ(exc.getExcName(), "PreferenceFolder");
        EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
        EXPECT_EQ(TestSupport::parametersOf(exc.getInfo().getMessage()),
                  (TestSupport::TParameters{{"function", L"MacOS::setHiddenAttribute"},
                                            {"error", L"0"}}));
        EXPECT_EQ(exc.getInfo().getMessage().getString(true),
                  L"Error in OS call MacOS::setHiddenAttribute: 0");
        // setFileInvisible, doWriteFile_, writeFile_, setValue.
        EXPECT_EQ(exc.getStackInfo().end() - exc.getStackInfo().begin(), 4);
    }
    EXPECT_EQ(permissionsOf(user("/key")), 0600U);
    EXPECT_EQ(readFile(user("/key")), "value");
}

// The permissions of another user's file are not ours to change, even if all may write it.
TEST_F(CPlainPreferenceTest, AnotherUsersFileIsWrittenAndThenRaises) {
    if (geteuid() != 0)
        GTEST_SKIP() << "only root can make another user's file";
    CPreferenceFolder store = userStore();
    store.setValue(at(""), "key", bytes("root's"));
    runAsOrdinaryUser([&] {
        EXPECT_THROW(store.setValue(at(""), "key", bytes("mine")), Error::TExcStdLibException);
        EXPECT_EQ(readFile(user("/key")), "mine");
    });
}

// Where writing fails.

void expectBadStream(CPreferenceFolder& store, std::string const& path, std::string const& key,
                     std::string const& file) {
    try {
        store.setValue(at(path), key, bytes("value"));
        ADD_FAILURE() << "nothing was raised for " << key;
    } catch (SysInfo::TExcPreferenceFolder const& exc) {
        EXPECT_EQ(TestSupport::parametersOf(exc.getInfo().getMessage()),
                  (TestSupport::TParameters{{"process", L"open"},
                                            {"type", L"file"},
                                            {"key", Encoding::convert<string>(file)},
                                            {"reason", L"bad stream"}}));
        EXPECT_EQ(exc.getInfo().getMessage().getString(true),
                  L"Could not open file " + Encoding::convert<string>(file) + L": bad stream");
        EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
        // doWriteFile_, writeFile_, setValue.
        EXPECT_EQ(exc.getStackInfo().end() - exc.getStackInfo().begin(), 3);
    }
}

TEST_F(CPlainPreferenceTest, AValueThatIsAFolderCannotBeWritten) {
    CPreferenceFolder store = userStore();
    makeFolders(user("/key/inner"));
    expectBadStream(store, "", "key", user("/key"));
    EXPECT_EQ(listTree(user()), (TNames{"key", "key/inner"}));
}

TEST_F(CPlainPreferenceTest, AReadOnlyFolderTakesNoNewValue) {
    CPreferenceFolder store = userStore();
    writeFile(user("/old"), "old");
    chmod(user("/old").c_str(), 0444);
    chmod(user().c_str(), 0555);
    runAsOrdinaryUser([&] {
        expectBadStream(store, "", "new", user("/new"));
        expectBadStream(store, "", "old", user("/old"));
        EXPECT_THROW(store.setValue(at("path"), "new", bytes("value")), FileSys::TExcFileSpec);
        EXPECT_EQ(valueOf(store, "", "old"), "old");
    });
}

TEST_F(CPlainPreferenceTest, AFileInTheWayOfAPathRaisesWhatTheFileSystemRaises) {
    CPreferenceFolder store = userStore();
    writeFile(user("/path"), "a file");
    try {
        store.setValue(at("path"), "key", bytes("value"));
        FAIL() << "nothing was raised";
    } catch (FileSys::TExcFileSpec const& exc) {
        EXPECT_EQ(TestSupport::parameterOf(exc.getInfo().getMessage(), "process"), L"create");
        EXPECT_EQ(TestSupport::parameterOf(exc.getInfo().getMessage(), "key"),
                  Encoding::convert<string>(user("/path")));
    }
    EXPECT_EQ(readFile(user("/path")), "a file");
}

TEST_F(CPlainPreferenceTest, AFullDiskStoresTheValueShortAndTellsNobody) {
    makeFolders(user());
    withSmallVolume(user(), [this] {
        CPreferenceFolder store = userStore();
        std::string const tooMuch = binaryContent(100000);
        store.setValue(at(""), "large", bytes(tooMuch));
        EXPECT_EQ(readFile(user("/large")), tooMuch.substr(0, 65536));
        // Nothing is left for a value that fits in the stream's buffer and is written at its end.
        store.setValue(at(""), "small", bytes("value"));
        EXPECT_EQ(readFile(user("/small")), "");
        EXPECT_EQ(valueOf(store, "", "small"), "");
        EXPECT_EQ(permissionsOf(user("/small")), 0666U);
    });
}

// Keys and paths.

TEST_F(CPlainPreferenceTest, AKeyIsAFilesNameAsItStands) {
    CPreferenceFolder store = userStore();
    TNames const keys = {" ",
                         " a b ",
                         "-f",
                         ".hidden",
                         "a.b.",
                         "$(x)`y`\"'*?",
                         "line\nbreak",
                         "\xC3\xA9",
                         "e\xCC\x81",
                         "\xF0\x9F\x98\x80",
                         std::string(255, 'k')};
    for (std::string const& key : keys) {
        store.setValue(at(""), key, bytes("value of " + key));
        EXPECT_EQ(readFile(user("/" + key)), "value of " + key);
    }
    for (std::string const& key : keys)
        EXPECT_EQ(valueOf(store, "", key), "value of " + key);
    EXPECT_EQ(store.getValues().size(), keys.size());
    for (std::string const& key : keys)
        store.deleteValue(at(""), key);
    EXPECT_EQ(listTree(user()), TNames());
}

TEST_F(CPlainPreferenceTest, AKeyThatNoFileCanHaveCannotBeWritten) {
    CPreferenceFolder store = userStore();
    std::string const tooLong(256, 'k');
    expectBadStream(store, "", tooLong, user("/" + tooLong));
    EXPECT_EQ(valueOf(store, "", tooLong), "(untouched)");
    expectBadStream(store, "", "", user());
    expectBadStream(store, "", ".", user("/."));
    expectBadStream(store, "path", "..", user("/path/.."));
}

TEST_F(CPlainPreferenceTest, AKeyLeadsWhereItsTextLeads) {
    CPreferenceFolder store = userStore();
    expectBadStream(store, "", "folder/key", user("/folder/key"));
    makeFolders(user("/folder"));
    store.setValue(at(""), "folder/key", bytes("1"));
    EXPECT_EQ(valueOf(store, "folder", "key"), "1");
    store.setValue(at("folder"), "../key", bytes("2"));
    EXPECT_EQ(valueOf(store, "", "key"), "2");
    store.setValue(at("folder"), "/key", bytes("3"));
    EXPECT_EQ(valueOf(store, "folder", "key"), "3");
    store.setValue(at("../Other"), "key", bytes("4"));
    EXPECT_EQ(readFile(path("user/Library/Preferences/Other/key")), "4");
    EXPECT_EQ(listTree(user()), (TNames{"folder", "folder/key", "key"}));
}

TEST_F(CPlainPreferenceTest, AnEmptyPathIsTheStoreItself) {
    CPreferenceFolder store = userStore();
    store.setValue(CSystemPrefsPath(), "key", bytes("value"));
    EXPECT_EQ(readFile(user("/key")), "value");
}

TEST_F(CPlainPreferenceTest, AMalformedKeyRaisesWhenItsFoldersStand) {
    CPreferenceFolder store = userStore();
    EXPECT_THROW(store.setValue(at("path"), "k\xFF", bytes("value")), Encoding::TExcEncoding);
    EXPECT_EQ(listTree(user()), TNames{"path"});
    EXPECT_THROW(valueOf(store, "", "k\xFF"), Encoding::TExcEncoding);
    EXPECT_THROW(store.setValue(at("p\xFF"), "key", bytes("value")), Encoding::TExcEncoding);
    // No failure of the file system, so neither logged nor wrapped.
    EXPECT_THROW(store.deleteKey(at("p\xFF")), Encoding::TExcEncoding);
    EXPECT_THROW(store.deleteValue(at(""), "k\xFF"), Encoding::TExcEncoding);
}

// Deleting.

TEST_F(CPlainPreferenceTest, OneValueIsDeleted) {
    CPreferenceFolder store = userStore();
    store.setValue(at("path"), "one", bytes("1"));
    store.setValue(at("path"), "two", bytes("2"));
    store.deleteValue(at("path"), "one");
    store.deleteValue(at("path"), "one");
    store.deleteValue(at("missing"), "one");
    EXPECT_EQ(listTree(user()), (TNames{"path", "path/two"}));
}

TEST_F(CPlainPreferenceTest, AFolderInAValuesPlaceIsDeletedWithAllInIt) {
    CPreferenceFolder store = userStore();
    store.setValue(at("path/inner"), "one", bytes("1"));
    store.deleteValue(at(""), "path");
    EXPECT_EQ(listTree(user()), TNames());
}

TEST_F(CPlainPreferenceTest, APathIsDeletedWithAllInIt) {
    CPreferenceFolder store = userStore();
    store.setValue(at("path/inner"), "one", bytes("1"));
    store.setValue(at("path"), "two", bytes("2"));
    store.setValue(at("other"), "three", bytes("3"));
    store.deleteKey(at("missing"));
    store.deleteKey(at("path"));
    EXPECT_EQ(listTree(user()), (TNames{"other", "other/three"}));
    store.deleteKey(at("other/three"));
    EXPECT_EQ(listTree(user()), TNames{"other"});
    store.deleteKey(CSystemPrefsPath());
    EXPECT_FALSE(pathExists(user()));
}

// In a folder that may not be changed.
class CUndeletableTest : public CPlainPreferenceTest {
  protected:
    void SetUp() override {
        CPlainPreferenceTest::SetUp();
        makeFolders(user("/path"));
        writeFile(user("/path/key"), "value");
        chmod(user("/path").c_str(), 0555);
        chmod(user().c_str(), 0555);
    }

    string reason() const {
        return L"Could not delete file or folder " + Encoding::convert<string>(user("/path/key")) +
               L": Permission denied";
    }
};

TEST_F(CUndeletableTest, AValueThatStaysRaisesAWrapper) {
    CPreferenceFolder store = userStore();
    runAsOrdinaryUser([&] {
        try {
            store.deleteValue(at("path"), "key");
            ADD_FAILURE() << "nothing was raised";
        } catch (FileSys::TExcFileSys const&) {
            ADD_FAILURE() << "the exception is not wrapped";
        } catch (SysInfo::TExcPreferenceFolder const& exc) {
            EXPECT_STREQ(exc.getExcName(), "PreferenceFolder");
            EXPECT_EQ(exc.getInfo().getMessage().getString(true), L"\"" + reason() + L"\"");
            TestSupport::TParameters const parameters =
                TestSupport::parametersOf(exc.getInfo().getMessage());
            ASSERT_EQ(parameters.size(), 6U);
            EXPECT_EQ(parameters[0].first, "__msg__");
            EXPECT_EQ(parameters[0].second, L"Could not @(process) @(type) @(key): @(reason)");
            EXPECT_EQ(parameters[1].first, "__type__");
            EXPECT_EQ(parameters[2].first, "process");
            // deleteValue alone: the inner trace is not taken over.
            EXPECT_EQ(exc.getStackInfo().end() - exc.getStackInfo().begin(), 1);
        }
        EXPECT_EQ(readFile(user("/path/key")), "value");
    });
}

TEST_F(CUndeletableTest, APathThatStaysIsLogged) {
    CPreferenceFolder store = userStore();
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    runAsOrdinaryUser([&] {
        store.deleteKey(at("path/key"));
        ASSERT_EQ(recorder.records().size(), 1U);
        TestSupport::CLogRecord const& record = recorder.records()[0];
        EXPECT_EQ(record.tag, "SysInfoPrefsFolder");
        EXPECT_EQ(record.target, "TgtLogger");
        EXPECT_EQ(record.severity, "SevError");
        EXPECT_EQ(record.expanded, reason());
        // The place of the exception, not of the one who logs it.
        EXPECT_NE(std::get<0>(record.place).find("FileSysOperations"), std::string::npos);
        EXPECT_EQ(readFile(user("/path/key")), "value");
    });
}

// Listing.

TEST_F(CPlainPreferenceTest, TheValuesOfTheStoresFolderAreListedInOrder) {
    CPreferenceFolder store = userStore();
    TNames const keys = {"B", "a", "a b", "b", "\xC3\xA9", "\xF0\x9F\x98\x80"};
    for (auto key = keys.rbegin(); key != keys.rend(); ++key)
        store.setValue(at(""), *key, bytes("value"));
    store.setValue(at("path"), "inner", bytes("value"));
    EXPECT_EQ(store.getValues(), keys);

    std::vector<string> const wide = {L"B", L"a", L"a b", L"b", L"\u00E9", L"\U0001F600"};
    EXPECT_EQ(store.getPaths(), wide);
}

TEST_F(CPlainPreferenceTest, ManyValuesAreListedWholly) {
    CPreferenceFolder const store = userStore();
    TNames keys;
    std::vector<string> wide;
    for (int i = 10000; i < 13000; ++i) {
        keys.push_back(std::to_string(i) + "\xC3\xA9");
        wide.push_back(std::to_wstring(i) + L'\u00E9');
        writeFile(user("/" + keys.back()));
    }
    EXPECT_TRUE(store.getValues() == keys);
    EXPECT_TRUE(store.getPaths() == wide);
}

TEST_F(CPlainPreferenceTest, FoldersAreNoPathsInALists) {
    CPreferenceFolder const store = userStore();
    makeFolders(user("/path/inner"));
    EXPECT_EQ(store.getValues(), TNames());
    EXPECT_TRUE(store.getPaths().empty());
}

} // namespace
