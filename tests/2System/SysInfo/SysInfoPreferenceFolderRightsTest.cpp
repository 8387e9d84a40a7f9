// The privileged road, with an authorization that records what it is asked.

#include "2System/SysInfo/SysInfoPreferenceFolderCases.h"

#include "2System/FileSys/FileSysExc.h"
#include "2System/SysInfo/SysInfoExc.h"

#include "support/LogRecorder.h"
#include "support/TextFailures.h"

#include <sys/stat.h>
#include <sys/xattr.h>

#include <cstring>
#include <functional>
#include <stdexcept>
#include <vector>

namespace {

using namespace PreferenceTest;

// "isAuthorized", or the tool and its arguments.
using TCalls = std::vector<TNames>;

// Answers yes while `rights` is above 0 and counts it down; runs the tools itself, as far as a
// test needs them, or fails.
class CRecordingAuthorization : public MacOS::CAuthorizationBase {
  public:
    bool isAuthorized() override {
        calls.push_back({"isAuthorized"});
        return rights > 0 && rights-- > 0;
    }
    bool authorize() override {
        calls.push_back({"authorize"});
        return true;
    }
    bool execute(std::string tool, std::vector<std::string> args) override {
        calls.push_back({tool});
        calls.back().insert(calls.back().end(), args.begin(), args.end());
        if (onExecute)
            onExecute();
        if (fails)
            return false;
        if (tool == "/bin/mkdir")
            makeFolders(args.at(1));
        else if (std::rename(args.at(1).c_str(), args.at(2).c_str()) != 0)
            return false;
        return true;
    }

    TCalls calls;
    int rights = 1000;
    bool fails = false;
    std::function<void()> onExecute;
};

TNames const question = {"isAuthorized"};

class CPrivilegedPreferenceTest : public CPreferenceFolderTest {
  protected:
    // The store's folder is there already, and nothing was asked so far.
    CPreferenceFolder store() {
        makeFolders(machine());
        CPreferenceFolder store = machineStore(&authorization);
        EXPECT_EQ(authorization.calls, TCalls());
        return store;
    }

    std::string temporary(std::string const& index = "") {
        return root().temporary() + "/ZLT_CPreferenceFolder_tmp" + index + ".dat";
    }

    TNames mkdir(std::string const& folder) const { return {"/bin/mkdir", "-p", folder}; }
    TNames mv(std::string const& from, std::string const& to) const {
        return {"/bin/mv", "-f", from, to};
    }

    CRecordingAuthorization authorization;
};

// Folders.

TEST_F(CPrivilegedPreferenceTest, TheStoresFolderIsMadeByTheTool) {
    machineStore(&authorization);
    EXPECT_EQ(authorization.calls, (TCalls{question, mkdir(machine())}));
    EXPECT_TRUE(pathExists(machine()));
}

TEST_F(CPrivilegedPreferenceTest, AFolderThatIsThereOrNotToBeMadeAsksNothing) {
    machineStore(&authorization, false);
    EXPECT_FALSE(pathExists(machine()));
    makeFolders(machine());
    machineStore(&authorization, true);
    EXPECT_EQ(authorization.calls, TCalls());
}

TEST_F(CPrivilegedPreferenceTest, AFailedMkdirSaysNothing) {
    authorization.fails = true;
    machineStore(&authorization);
    EXPECT_EQ(authorization.calls, (TCalls{question, mkdir(machine())}));
    EXPECT_EQ(listTree(path()), TNames());
}

TEST_F(CPrivilegedPreferenceTest, WithoutRightsTheFolderIsMadePlainly) {
    authorization.rights = 0;
    machineStore(&authorization);
    EXPECT_EQ(authorization.calls, TCalls{question});
    EXPECT_TRUE(pathExists(machine()));
}

// Writing.

TEST_F(CPrivilegedPreferenceTest, AValueIsWrittenToATemporaryFileAndMoved) {
    CPreferenceFolder target = store();
    target.setValue(at("Window/Main"), "size", bytes("value"));
    EXPECT_EQ(authorization.calls, (TCalls{question, mkdir(machine("/Window/Main")), question,
                                           mv(temporary(), machine("/Window/Main/size"))}));
    EXPECT_EQ(readFile(machine("/Window/Main/size")), "value");
    EXPECT_EQ(listTree(root().temporary()), TNames());
}

TEST_F(CPrivilegedPreferenceTest, NoFolderIsMadeWhereOneIs) {
    CPreferenceFolder target = store();
    target.setValue(at(""), "key", bytes("value"));
    EXPECT_EQ(authorization.calls, (TCalls{question, question, mv(temporary(), machine("/key"))}));
}

TEST_F(CPrivilegedPreferenceTest, TheTemporaryFileIsCompleteWhenItIsMoved) {
    mode_t const mask = umask(0077);
    CPreferenceFolder target = store();
    bool const canHide = setxattr(root().temporary().c_str(), "user.probe", "1", 1, 0) == 0;
    std::string const content = binaryContent(100000);
    int moved = 0;
    authorization.onExecute = [&] {
        ++moved;
        EXPECT_TRUE(readFile(temporary()) == content);
        struct stat status;
        EXPECT_EQ(stat(temporary().c_str(), &status), 0);
        EXPECT_EQ(status.st_mode & 07777U, 0666U);
        EXPECT_EQ(getxattr(temporary().c_str(), "user.hidden", nullptr, 0) > 0, canHide);
    };
    target.setValue(at(""), "key", bytes(content));
    EXPECT_EQ(moved, 1);
    EXPECT_TRUE(readFile(machine("/key")) == content);
    umask(mask);
}

TEST_F(CPrivilegedPreferenceTest, AValueOfAnySizeIsWholeWhenItIsMovedAndBehindIt) {
    CPreferenceFolder target = store();
    for (std::size_t const size : valueSizes) {
        std::string const content = binaryContent(size);
        bool wasWhole = false;
        authorization.onExecute = [&] { wasWhole = readFile(temporary()) == content; };
        target.setValue(at(""), "key", bytes(content));
        EXPECT_TRUE(wasWhole) << size;
        EXPECT_TRUE(readFile(machine("/key")) == content) << size;
        EXPECT_TRUE(valueOf(target, "", "key") == content) << size;
        EXPECT_EQ(listTree(root().temporary()), TNames());
    }
}

TEST_F(CPrivilegedPreferenceTest, TheValuesFileIsAnotherOneAfterwards) {
    CPreferenceFolder target = store();
    writeFile(machine("/key"), "old");
    EXPECT_EQ(link(machine("/key").c_str(), path("link").c_str()), 0);
    target.setValue(at(""), "key", bytes("new"));
    EXPECT_EQ(readFile(path("link")), "old");
    EXPECT_EQ(readFile(machine("/key")), "new");
}

TEST_F(CPrivilegedPreferenceTest, ATakenTemporaryNameIsLeftAlone) {
    CPreferenceFolder target = store();
    writeFile(temporary(), "another's");
    target.setValue(at(""), "one", bytes("1"));
    writeFile(temporary("_0001"), "another's");
    target.setValue(at(""), "two", bytes("2"));
    EXPECT_EQ(authorization.calls,
              (TCalls{question, question, mv(temporary("_0001"), machine("/one")), question,
                      question, mv(temporary("_0002"), machine("/two"))}));
    EXPECT_EQ(readFile(temporary()), "another's");
    EXPECT_EQ(readFile(temporary("_0001")), "another's");
}

TEST_F(CPrivilegedPreferenceTest, TheTemporaryFolderIsTheOneOfTheMoment) {
    CPreferenceFolder target = store();
    makeFolders(path("other"));
    root().environment().set("TMPDIR", path("other") + "/");
    target.setValue(at(""), "key", bytes("value"));
    EXPECT_EQ(authorization.calls.back(),
              mv(path("other/ZLT_CPreferenceFolder_tmp.dat"), machine("/key")));
}

TEST_F(CPrivilegedPreferenceTest, ArgumentsAreUTF8AndNotQuoted) {
    CPreferenceFolder target = store();
    std::string const name = " a 'b' \"c\" $HOME\n\xC3\xA9\xF0\x9F\x98\x80";
    target.setValue(at(name), name, bytes("value"));
    EXPECT_EQ(authorization.calls, (TCalls{question, mkdir(machine("/" + name)), question,
                                           mv(temporary(), machine("/" + name + "/" + name))}));
}

TEST_F(CPrivilegedPreferenceTest, AFailedMkdirShowsWhenTheFileIsMoved) {
    CPreferenceFolder target = store();
    authorization.fails = true;
    EXPECT_THROW(target.setValue(at("path"), "key", bytes("value")), Error::TExcErrorAssert);
    EXPECT_EQ(authorization.calls, (TCalls{question, mkdir(machine("/path")), question,
                                           mv(temporary(), machine("/path/key"))}));
}

TEST_F(CPrivilegedPreferenceTest, AFailedMoveFailsACheckAndLeavesTheTemporaryFile) {
    CPreferenceFolder target = store();
    writeFile(machine("/key"), "old");
    authorization.fails = true;
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevFatal> const installed(recorder);
    try {
        target.setValue(at(""), "key", bytes("new"));
        FAIL() << "nothing was raised";
    } catch (Error::TExcErrorAssert const& exc) {
        EXPECT_EQ(TestSupport::parameterOf(exc, "expr"),
                  "auth->execute( Encoding::convert<Strings::stringUTF8,std::string>(\"/bin/mv\"), "
                  "args)");
        // writeFile_ and setValue.
        EXPECT_EQ(exc.getStackInfo().end() - exc.getStackInfo().begin(), 2);
    }
    EXPECT_EQ(recorder.records().size(), 1U);
    EXPECT_EQ(readFile(machine("/key")), "old");
    EXPECT_EQ(readFile(temporary()), "new");

    authorization.fails = false;
    target.setValue(at(""), "key", bytes("newer"));
    EXPECT_EQ(authorization.calls.back(), mv(temporary("_0001"), machine("/key")));
    EXPECT_EQ(readFile(temporary()), "new");
}

TEST_F(CPrivilegedPreferenceTest, ATemporaryFileThatCannotBeWrittenStopsTheWrite) {
    CPreferenceFolder target = store();
    root().environment().set("TMPDIR", path("missing"));
    EXPECT_THROW(target.setValue(at(""), "key", bytes("value")), SysInfo::TExcPreferenceFolder);
    EXPECT_EQ(authorization.calls, (TCalls{question, question}));
    EXPECT_FALSE(pathExists(machine("/key")));
}

TEST_F(CPrivilegedPreferenceTest, WithoutRightsAllIsAsWithoutAnAuthorization) {
    authorization.rights = 0;
    CPreferenceFolder target = store();
    target.setValue(at("path"), "key", bytes("value"));
    EXPECT_EQ(authorization.calls, (TCalls{question, question}));
    EXPECT_EQ(readFile(machine("/path/key")), "value");
    EXPECT_EQ(listTree(root().temporary()), TNames());
    EXPECT_EQ(valueOf(target, "path", "key"), "value");
    target.deleteValue(at("path"), "key");
    target.deleteKey(at("path"));
    EXPECT_EQ(listTree(machine()), TNames());
}

TEST_F(CPrivilegedPreferenceTest, RightsThatEndBetweenTheStepsAreNotedAtOnce) {
    CPreferenceFolder target = store();
    authorization.rights = 1;
    target.setValue(at("path"), "key", bytes("value"));
    EXPECT_EQ(authorization.calls, (TCalls{question, mkdir(machine("/path")), question}));
    EXPECT_EQ(readFile(machine("/path/key")), "value");
}

TEST_F(CPrivilegedPreferenceTest, ReadingListingAndDeletingAskNothing) {
    CPreferenceFolder target = store();
    makeFolders(machine("/path"));
    writeFile(machine("/path/key"), "value");
    writeFile(machine("/key"), "value");
    EXPECT_EQ(valueOf(target, "path", "key"), "value");
    EXPECT_EQ(target.getValues(), TNames{"key"});
    EXPECT_EQ(target.getPaths(), std::vector<Strings::string>{L"key"});
    target.deleteValue(at("path"), "key");
    target.deleteKey(at("path"));
    target.deleteKey(at(""));
    EXPECT_EQ(authorization.calls, TCalls());
    EXPECT_FALSE(pathExists(machine()));
}

TEST_F(CPrivilegedPreferenceTest, WhatTheAuthorizationThrowsPasses) {
    CPreferenceFolder target = store();
    authorization.onExecute = [] { throw 7; };
    EXPECT_THROW(target.setValue(at(""), "key", bytes("value")), int);
    authorization.onExecute = [] { throw std::runtime_error("the helper has gone"); };
    EXPECT_THROW(target.setValue(at(""), "key", bytes("value")), Error::TExcStdLibException);
    EXPECT_EQ(readFile(temporary()), "value");
    EXPECT_EQ(readFile(temporary("_0001")), "value");
}

// Hosts implement the class in units of their own: its table of operations keeps its order. What a
// pointer to a virtual function holds is the Itanium C++ ABI's: 1 and the place in the table, in
// which the destructor takes two.
TEST(CAuthorizationBaseTest, TheOperationsStandInAFixedOrder) {
    auto const placeOf = [](auto member) {
        std::size_t place = 0;
        std::memcpy(&place, &member, sizeof(place));
        return (place - 1) / sizeof(void*);
    };
    EXPECT_EQ(placeOf(&MacOS::CAuthorizationBase::isAuthorized), 2U);
    EXPECT_EQ(placeOf(&MacOS::CAuthorizationBase::authorize), 3U);
    EXPECT_EQ(placeOf(&MacOS::CAuthorizationBase::execute), 4U);
}

TEST(CAuthorizationBaseTest, WithoutAWayToObtainThemThereAreNoRights) {
    class CPlain : public MacOS::CAuthorizationBase {
        bool isAuthorized() override { return true; }
        bool execute(std::string, std::vector<std::string>) override { return true; }
    };
    CPlain plain;
    MacOS::CAuthorizationBase& base = plain;
    EXPECT_FALSE(base.authorize());
}

} // namespace
