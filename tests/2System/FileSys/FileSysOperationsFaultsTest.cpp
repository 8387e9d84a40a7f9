// Nothing is lost silently: each operation is run once for each call of the system that it makes,
// and that call fails.

#include "1Base/Error/ErrorException.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/FileSysTempFile.h"

#include "support/FileRoot.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <cerrno>
#include <functional>
#include <ios>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace {

using FileSys::CFileSpec;
using TestSupport::CSystemCalls;
using TestSupport::listTree;
using TestSupport::makeFolders;
using TestSupport::pathExists;
using TestSupport::readFile;
using TestSupport::writeFile;

using TContents = std::map<std::string, std::string>;

// One run: which call failed, and whether the operation said so.
struct CRun {
    std::string function;
    bool raised;
};

class CFaultsTest : public TestSupport::CFileRootTest {
  protected:
    // What is called before each run, with an empty folder.
    using TPrepare = std::function<void()>;
    using TAct = std::function<void()>;
    using TCheck = std::function<void(CRun const&)>;
    using TErrors = std::map<std::string, int>;

    // Calls that fail in every run, by their errors.
    void disable(TErrors const& errors) { disabled_ = errors; }

    void walk(TPrepare const& prepare, TAct const& act, TCheck const& check) {
        std::map<std::string, unsigned int> const counts = callsOf(prepare, act);
        unsigned int failed = 0;
        for (auto const& [function, count] : counts) {
            if (disabled_.count(function) != 0)
                continue;
            for (unsigned int nth = 0; nth <= count; ++nth) {
                SCOPED_TRACE(function + " #" + std::to_string(nth));
                clear();
                prepare();
                CRun const run{function, isRaised(act, function, nth)};
                failed += run.raised ? 1 : 0;
                check(run);
            }
        }
        // Some of the faults show at least.
        EXPECT_GT(failed, 0U);
    }

    TContents contents(std::string const& name) const {
        TContents found;
        for (std::string const& entry : listTree(path(name)))
            found[entry] = isFolder(path(name) + "/" + entry) ? "a folder"
                                                              : readFile(path(name) + "/" + entry);
        return found;
    }

    std::string contentOf(std::string const& name) const {
        return pathExists(path(name)) ? readFile(path(name)) : "missing";
    }

    void makeTree() const {
        makeFolders(path("tree/sub"));
        writeFile(path("tree/a"), content_);
        writeFile(path("tree/sub/b"), "b");
    }

    TContents const& tree() const { return tree_; }

    std::string const& content() const { return content_; }

  private:
    static bool isFolder(std::string const& path) {
        return !listTree(path).empty() || isEmpty(path);
    }

    static bool isEmpty(std::string const& path) {
        return access((path + "/.").c_str(), F_OK) == 0;
    }

    void clear() const {
        for (std::string const& entry : listTree(path()))
            if (entry.find('/') == std::string::npos)
                TestSupport::removeTree(path(entry));
    }

    void failDisabled(CSystemCalls& calls) const {
        for (auto const& [function, error] : disabled_)
            calls.fail(function, error);
    }

    std::map<std::string, unsigned int> callsOf(TPrepare const& prepare, TAct const& act) const {
        clear();
        prepare();
        CSystemCalls calls;
        failDisabled(calls);
        try {
            act();
        } catch (Error::CException const&) {
            // Some operations are walked through on their way to a refusal.
        }
        return calls.counts();
    }

    bool isRaised(TAct const& act, std::string const& function, unsigned int nth) const {
        CSystemCalls calls;
        failDisabled(calls);
        calls.fail(function, EIO, nth);
        try {
            act();
        } catch (Error::CException const&) {
            return true;
        }
        return false;
    }

    TErrors disabled_;
    // More than one piece of what is copied by reading and writing.
    std::string const content_ = std::string(300000, 'c');
    TContents const tree_{{"a", content_}, {"sub", "a folder"}, {"sub/b", "b"}};
};

// Asking and listing answer by what they find, and a fault there is none to them.
bool isQuestion(std::string const& function) {
    static std::set<std::string> const questions = {"statx", "open", "opendir", "openat",
                                                    "readdir"};
    return questions.count(function) != 0;
}

class CCopyFaultsTest : public CFaultsTest {
  protected:
    void copyTree() {
        walk([&] { makeTree(); }, [&] { FileSys::copyFile(path("tree"), path("to"), false); },
             [&](CRun const& run) {
                 EXPECT_EQ(contents("tree"), tree());
                 if (run.raised)
                     return;
                 EXPECT_TRUE(isQuestion(run.function));
                 for (auto const& [name, text] : contents("to"))
                     EXPECT_EQ(text, tree().at(name)) << name;
             });
    }

    void copyFile() {
        walk(
            [&] {
                makeTree();
                writeFile(path("to"), "old");
            },
            [&] { FileSys::copyFile(path("tree/a"), path("to"), true); },
            [&](CRun const& run) {
                EXPECT_EQ(contents("tree"), tree());
                EXPECT_TRUE(run.raised || contentOf("to") == content());
            });
    }
};

TEST_F(CCopyFaultsTest, ACopiedTreeLeavesItsSourceAndNoHalfFilesUnsaid) {
    copyTree();
}

TEST_F(CCopyFaultsTest, SoDoesOneThatIsReadAndWritten) {
    disable({{"copy_file_range", ENOSYS}, {"sendfile", ENOSYS}});
    copyTree();
}

TEST_F(CCopyFaultsTest, AnOverwrittenFileIsTheWholeSourceUnlessItSaysSo) {
    copyFile();
}

TEST_F(CCopyFaultsTest, SoIsOneThatIsReadAndWritten) {
    disable({{"copy_file_range", ENOSYS}, {"sendfile", ENOSYS}});
    copyFile();
}

TEST_F(CCopyFaultsTest, AFileThatIsThereStays) {
    walk(
        [&] {
            makeTree();
            writeFile(path("to"), "old");
        },
        [&] { FileSys::copyFile(path("tree/a"), path("to"), false); },
        [&](CRun const&) {
            EXPECT_EQ(contents("tree"), tree());
            EXPECT_EQ(contentOf("to"), "old");
        });
}

TEST_F(CCopyFaultsTest, ASourceIsNeverItsOwnTarget) {
    walk(
        [&] {
            makeTree();
            TestSupport::makeLink("tree/a", path("link"));
        },
        [&] { FileSys::copyFile(path("tree/a"), path("link"), true); },
        [&](CRun const&) { EXPECT_EQ(contents("tree"), tree()); });
}

class CMoveFaultsTest : public CFaultsTest {
  protected:
    // The source stands whole in one place: at the old one where the move says that it failed.
    void expectMoved(CRun const& run) const {
        EXPECT_EQ(contentOf(run.raised ? "from" : "to"), content());
        EXPECT_FALSE(pathExists(path(run.raised ? "to" : "from")));
    }
};

TEST_F(CMoveFaultsTest, AMovedFileIsInOnePlace) {
    walk([&] { writeFile(path("from"), content()); },
         [&] { FileSys::moveFile(path("from"), path("to"), false); },
         [&](CRun const& run) { expectMoved(run); });
}

TEST_F(CMoveFaultsTest, AFileThatIsThereStays) {
    walk(
        [&] {
            writeFile(path("from"), content());
            writeFile(path("to"), "old");
        },
        [&] { FileSys::moveFile(path("from"), path("to"), false); },
        [&](CRun const& run) {
            // A target that can't be asked about is taken for missing.
            bool const isReplaced = run.function == "statx" && !run.raised;
            EXPECT_EQ(contentOf("to"), isReplaced ? content() : "old");
            EXPECT_EQ(contentOf("from"), isReplaced ? "missing" : content());
        });
}

TEST_F(CMoveFaultsTest, AMovedTreeIsInOnePlace) {
    walk([&] { makeTree(); }, [&] { FileSys::moveFile(path("tree"), path("a/to"), false); },
         [&](CRun const& run) { EXPECT_EQ(contents(run.raised ? "tree" : "a/to"), tree()); });
}

TEST_F(CMoveFaultsTest, AFileThatReplacesATreeIsInOnePlace) {
    walk(
        [&] {
            makeTree();
            writeFile(path("from"), content());
        },
        [&] { FileSys::moveFile(path("from"), path("tree"), true); },
        [&](CRun const& run) { EXPECT_EQ(contentOf(run.raised ? "from" : "tree"), content()); });
}

TEST_F(CMoveFaultsTest, AFileAcrossVolumesIsInOnePlaceAtLeast) {
    for (bool const isRead : {false, true}) {
        disable({{"rename", EXDEV}});
        if (isRead)
            disable({{"rename", EXDEV}, {"copy_file_range", ENOSYS}, {"sendfile", ENOSYS}});
        walk(
            [&] {
                writeFile(path("from"), content());
                writeFile(path("to"), "old");
            },
            [&] { FileSys::moveFile(path("from"), path("to"), true); },
            [&](CRun const& run) {
                bool const stays = contentOf("from") == content();
                bool const arrived = contentOf("to") == content();
                EXPECT_TRUE(stays || arrived);
                EXPECT_TRUE(run.raised || arrived);
            });
    }
}

TEST_F(CMoveFaultsTest, ARenamedFileIsInOnePlace) {
    walk([&] { writeFile(path("from.txt"), content()); },
         [&] { FileSys::setFileType(path("from.txt"), L"pdf"); },
         [&](CRun const& run) {
             EXPECT_EQ(contentOf(run.raised ? "from.txt" : "from.pdf"), content());
         });
}

using CDeleteFaultsTest = CFaultsTest;

TEST_F(CDeleteFaultsTest, NothingBesideTheTreeIsDeleted) {
    walk(
        [&] {
            makeTree();
            makeFolders(path("gone/sub"));
            writeFile(path("gone/sub/file"), "text");
            TestSupport::makeLink("../../tree", path("gone/sub/link"));
        },
        [&] { FileSys::deleteFile(path("gone"), true); },
        [&](CRun const& run) {
            EXPECT_EQ(contents("tree"), tree());
            // A tree that can't even be asked about is as good as missing.
            bool const isWhole = pathExists(path("gone/sub/link"));
            EXPECT_TRUE(run.raised || !pathExists(path("gone")) ||
                        (run.function == "statx" && isWhole));
        });
}

class CHarmlessFaultsTest : public CFaultsTest {
  protected:
    // The operation changes nothing that was there.
    void walkHarmless(TAct const& act) {
        walk([&] { makeTree(); },
             [&] {
                 act();
                 // The walk wants a fault that shows.
                 FileSys::createFolder(path("done"));
             },
             [&](CRun const&) { EXPECT_EQ(contents("tree"), tree()); });
    }
};

TEST_F(CHarmlessFaultsTest, Asking) {
    walkHarmless([&] {
        FileSys::canRead(path("tree/a"));
        CFileSpec spec(path("tree/a"));
        FileSys::indexFile(spec, 3);
    });
}

TEST_F(CHarmlessFaultsTest, TryingToOpen) {
    for (std::ios_base::openmode const mode :
         {std::ios_base::in, std::ios_base::in | std::ios_base::out,
          std::ios_base::out | std::ios_base::app})
        walkHarmless([&] { FileSys::canOpen(path("tree/a"), static_cast<unsigned int>(mode)); });
}

TEST_F(CHarmlessFaultsTest, ChangingAttributes) {
    walkHarmless([&] {
        FileSys::setFileAttributes(path("tree/a"), true, true);
        FileSys::setFileAttributes(path("tree/a"), false, false);
    });
}

TEST_F(CHarmlessFaultsTest, MakingAliases) {
    walkHarmless([&] { FileSys::createAliasFile(path("alias"), path("tree/a")); });
}

TEST_F(CHarmlessFaultsTest, MakingTemporaryFilesAndFolders) {
    walkHarmless([&] {
        FileSys::createTempFile(path("hint"));
        FileSys::createTempFolder(path("hint"));
    });
}

using CTemporaryFaultsTest = CFaultsTest;

TEST_F(CTemporaryFaultsTest, AFailureLeavesNothing) {
    std::string made;
    walk([&] { made.clear(); },
         [&] { made = FileSys::createTempFile(path("hint")).getFullName<std::string>(false); },
         [&](CRun const& run) {
             EXPECT_EQ(run.raised, made.empty());
             EXPECT_TRUE(made.empty() || pathExists(made));
             EXPECT_TRUE(!run.raised || listTree(path()).empty());
         });
}

TEST_F(CTemporaryFaultsTest, AnOwnerThatCannotDeleteLeavesTheFileAlone) {
    makeTree();
    CSystemCalls calls;
    calls.fail("unlinkat", EIO);
    { FileSys::CTempFile const owner{CFileSpec(path("tree/a"))}; }
    EXPECT_EQ(contents("tree"), tree());
}

} // namespace
