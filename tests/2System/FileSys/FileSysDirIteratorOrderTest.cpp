// The order of a walk beside a plain model of it, and walks that are long or deep.

#include "2System/FileSys/FileSysDirIterator.h"

#include "support/FileRoot.h"
#include "support/FolderWalk.h"

#include <gtest/gtest.h>

#include <fcntl.h>
#include <limits.h>
#include <pthread.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <functional>
#include <iterator>
#include <list>
#include <map>
#include <random>
#include <string>
#include <utility>
#include <vector>

namespace {

using FileSys::CDirIterator;
using FileSys::CFileSpec;
using TestSupport::makeFolders;
using TestSupport::makeLink;
using TestSupport::TNames;
using TestSupport::writeFile;

constexpr unsigned int both = TestSupport::filesAndFolders;

// A tree in memory: the entries of each folder by the folder's path, the root's being empty. A link
// to a folder is a folder with the entries of the other.
struct CTree {
    struct CEntry {
        std::string name;
        bool isFolder;
    };
    std::map<std::string, std::vector<CEntry>> folders;
};

// Tells the rules of the walk as they are told to a person, with a list that waits.
class CModel {
  public:
    CModel(CTree const& tree, bool recursive, unsigned int flags, std::string const& extension)
        : tree_(tree), recursive_(recursive), flags_(flags), extension_(extension) {}

    TNames walk() {
        TNames delivered;
        open("");
        while (!waiting_.empty()) {
            CWaiting const front = waiting_.front();
            waiting_.pop_front();
            if (front.isFolder ? wantsFolder(front.path) : wantsFile(front.path))
                delivered.push_back(front.path);
            if (front.isFolder && recursive_)
                open(front.path);
        }
        return delivered;
    }

  private:
    struct CWaiting {
        std::string path;
        bool isFolder;
    };

    bool matches(std::string const& path) const {
        std::string const end = "." + extension_;
        return extension_.empty() ||
               (path.size() >= end.size() && path.substr(path.size() - end.size()) == end);
    }
    bool wantsFile(std::string const& path) const { return flags_ % 2 == 1 && matches(path); }
    bool wantsFolder(std::string const& path) const { return flags_ / 2 == 1 && matches(path); }

    void open(std::string const& folder) {
        TNames files;
        TNames folders;
        for (CTree::CEntry const& entry : tree_.folders.at(folder)) {
            std::string const path = folder.empty() ? entry.name : folder + "/" + entry.name;
            (entry.isFolder ? folders : files).push_back(path);
        }
        std::sort(files.begin(), files.end());
        std::sort(folders.begin(), folders.end());
        for (std::size_t i = files.size(); i > 0; --i)
            waiting_.push_front({files[i - 1], false});
        for (std::string const& path : folders)
            waiting_.push_back({path, true});
    }

    CTree const& tree_;
    bool recursive_;
    unsigned int flags_;
    std::string extension_;
    std::list<CWaiting> waiting_;
};

TNames walk(std::string const& root, CDirIterator::ERecursive recursive, unsigned int flags,
            Strings::string const& extension = Strings::string()) {
    return TestSupport::namesBelow(root,
                                   CDirIterator(CFileSpec(root), extension, recursive, flags));
}

class FileSysDirIteratorOrderTest : public TestSupport::CFileRootTest {
  protected:
    // Fills the folder `name` of the tree and of the disk, sub folders included.
    void grow(std::mt19937& random, CTree& tree, std::string const& name, int depth) const {
        std::vector<CTree::CEntry>& entries = tree.folders[name];
        for (auto count = random() % 7; count > 0; --count) {
            std::string const entry = randomName(random);
            std::string const entryPath = name.empty() ? entry : name + "/" + entry;
            if (TestSupport::pathExists(path(entryPath)))
                continue;
            bool const isFolder = depth > 0 && random() % 2 == 0;
            if (isFolder) {
                makeFolders(path(entryPath));
                grow(random, tree, entryPath, depth - 1);
            } else if (random() % 8 == 0) {
                makeLink("nowhere", path(entryPath));
                continue;
            } else {
                writeFile(path(entryPath));
            }
            entries.push_back({entry, isFolder});
        }
    }

    static std::string randomName(std::mt19937& random) {
        char const* const pieces[] = {"a",
                                      "b",
                                      "B",
                                      ".",
                                      " ",
                                      "-",
                                      "_",
                                      "~",
                                      ".x",
                                      "\xC3\xA9",
                                      "\xEF\xBF\xBD",
                                      "\xF0\x9F\x98\x80"};
        std::string name;
        for (auto count = 1 + random() % 4; count > 0; --count)
            name += pieces[random() % std::size(pieces)];
        // Whatever it is made of, it is no name of the system's own.
        return name == "." || name == ".." ? "dots" : name;
    }
};

TEST_F(FileSysDirIteratorOrderTest, RandomTreesAreWalkedAsTheModelWalksThem) {
    unsigned int const seed = 20211105;
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    std::size_t delivered = 0;
    for (int round = 0; round < 60; ++round) {
        CTree tree;
        grow(random, tree, "", 4);
        for (unsigned int flags = 0; flags < 4; ++flags) {
            for (bool const recursive : {false, true}) {
                for (std::string const extension : {"", "x"}) {
                    TNames const expected = CModel(tree, recursive, flags, extension).walk();
                    ASSERT_EQ(
                        walk(path(),
                             recursive ? CDirIterator::eRecursive : CDirIterator::eNotRecursive,
                             flags, Strings::string(extension.begin(), extension.end())),
                        expected)
                        << "round " << round << ", flags " << flags << ", recursive " << recursive
                        << ", extension " << extension;
                    delivered += expected.size();
                }
            }
        }
        TestSupport::removeTree(path());
        makeFolders(path());
    }
    EXPECT_GT(delivered, 1000U);
}

TEST_F(FileSysDirIteratorOrderTest, ACopyTakenAnywhereGoesOnAsTheModelDoes) {
    std::mt19937 random(7);
    CTree tree;
    grow(random, tree, "", 4);
    grow(random, tree, "", 4);
    TNames const expected = CModel(tree, true, both, "").walk();
    ASSERT_GT(expected.size(), 10U);
    CDirIterator iterator(CFileSpec(path()), CDirIterator::eRecursive, both);
    for (std::size_t taken = 0; taken < expected.size(); ++taken, ++iterator) {
        CDirIterator copy = iterator;
        for (std::size_t i = taken; i < expected.size(); ++i, ++copy)
            ASSERT_EQ(*copy, CFileSpec(path(expected[i]))) << "copied at " << taken;
        ASSERT_EQ(copy, CDirIterator());
    }
}

// Walks that are long or deep, on a volume in memory where there is one: a disk takes minutes to
// make so many entries.
class FileSysDirIteratorSizeTest : public TestSupport::CFileRootTest {
  protected:
    std::string volume() const { return memory_.isThere() ? memory_.path() : path(); }
    std::string below(std::string const& name) const { return volume() + "/" + name; }

  private:
    TestSupport::CSecondVolume memory_{path()};
};

// Runs a body on a thread with a quarter of the mebibyte that a host's threads may have for a
// stack. It holds 26 bytes for each of ten thousand folders: a call each does not fit.
void runOnSmallStack(std::function<void()> const& body) {
    pthread_attr_t attributes;
    ASSERT_EQ(pthread_attr_init(&attributes), 0);
    ASSERT_EQ(pthread_attr_setstacksize(&attributes, std::size_t{1} << 18), 0);
    auto const run = [](void* argument) -> void* {
        (*static_cast<std::function<void()> const*>(argument))();
        return nullptr;
    };
    pthread_t thread;
    auto argument = body;
    ASSERT_EQ(pthread_create(&thread, &attributes, run, &argument), 0);
    ASSERT_EQ(pthread_join(thread, nullptr), 0);
    pthread_attr_destroy(&attributes);
}

TEST_F(FileSysDirIteratorSizeTest, TenThousandEmptyFoldersFitASmallStack) {
    for (int i = 0; i < 10000; ++i)
        ASSERT_EQ(mkdir(below(std::to_string(i)).c_str(), 0777), 0);
    runOnSmallStack([this] {
        EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, CDirIterator::eFiles), TNames());
        EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, both, L"none"), TNames());
        EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, both).size(), 10000U);
    });
}

// A folder that no single call can reach by its path.
class CDeepFolder {
  public:
    // Below a chain of `depth` folders that are all named so.
    CDeepFolder(std::string const& root, std::string const& name, int depth)
        : folder_(open(root.c_str(), O_DIRECTORY | O_RDONLY)) {
        for (int i = 0; i < depth; ++i) {
            int const above = folder_;
            EXPECT_EQ(mkdirat(above, name.c_str(), 0777), 0);
            folder_ = openat(above, name.c_str(), O_DIRECTORY | O_RDONLY);
            close(above);
        }
        EXPECT_GE(folder_, 0);
    }
    CDeepFolder(CDeepFolder const&) = delete;
    CDeepFolder& operator=(CDeepFolder const&) = delete;
    ~CDeepFolder() { close(folder_); }

    void makeFolder(char const* name) const { EXPECT_EQ(mkdirat(folder_, name, 0777), 0); }
    void makeLink(char const* target, char const* name) const {
        EXPECT_EQ(symlinkat(target, folder_, name), 0);
    }
    void makeFile(char const* name) const {
        int const file = openat(folder_, name, O_CREAT | O_WRONLY, 0666);
        EXPECT_GE(file, 0);
        close(file);
    }

  private:
    int folder_;
};

TEST_F(FileSysDirIteratorSizeTest, AChainOfTenThousandFoldersFitsASmallStack) {
    static constexpr std::size_t depth = 10000;
    { CDeepFolder const bottom(volume(), "d", depth); }
    runOnSmallStack([this] {
        EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, CDirIterator::eFiles), TNames());
        std::size_t delivered = 0;
        std::size_t length = volume().size();
        for (CDirIterator entry(CFileSpec(volume()), CDirIterator::eRecursive, both);
             entry != CDirIterator(); ++entry, ++delivered) {
            length += 2;
            ASSERT_EQ(entry->getFullName(false).size(), length);
        }
        EXPECT_EQ(delivered, depth);
    });
}

TEST_F(FileSysDirIteratorSizeTest, BeyondTheLongestPathEntriesAreWhatTheyAreElsewhere) {
    std::string const name(150, 'n');
    CDeepFolder const bottom(volume(), name, 40);
    bottom.makeFile("file.x");
    bottom.makeFolder("folder.x");
    bottom.makeFile("folder.x/inside");
    bottom.makeLink("file.x", "to file");
    bottom.makeLink("folder.x", "to folder");
    bottom.makeLink("missing", "to nothing");
    bottom.makeLink("file.x/none", "through a file");
    bottom.makeLink("/dev/null", "to a device");

    TNames const all = walk(volume(), CDirIterator::eRecursive, both);
    ASSERT_GT(all.size(), 40U);
    std::string const folder = all[39];
    ASSERT_GT(folder.size(), static_cast<std::size_t>(PATH_MAX));
    EXPECT_FALSE(CFileSpec(below(folder)).exists()) << "a single question does not reach it";
    TNames expected;
    for (char const* const entry :
         {"file.x", "to file", "folder.x", "folder.x/inside", "to folder", "to folder/inside"})
        expected.push_back(folder + "/" + entry);
    EXPECT_EQ(TNames(all.begin() + 40, all.end()), expected);
    EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, both, L"x"),
              (TNames{expected[0], expected[2]}));
}

// The walk goes from one to the other and back at each level.
TEST_F(FileSysDirIteratorSizeTest, TwoDeepChainsAreNotMixedUp) {
    constexpr int depth = 60;
    TNames expected;
    for (char const* const chain : {"a", "b"}) {
        makeFolders(below(chain));
        CDeepFolder const bottom(below(chain), std::string(150, *chain), depth);
        bottom.makeFile(chain);
        std::string path = chain;
        for (int i = 0; i < depth; ++i)
            path += "/" + std::string(150, *chain);
        expected.push_back(path + "/" + chain);
    }
    EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, CDirIterator::eFiles), expected);
}

// The system ends it where all is within one path. Behind that it would begin anew with each piece.
TEST_F(FileSysDirIteratorSizeTest, ACycleOfLinksEndsWhateverTheLengthOfItsNames) {
    for (std::size_t const length : {1U, 150U, 250U}) {
        std::string const name(length, 'n');
        makeFolders(below(name));
        makeLink("..", below(name + "/up"));
        // The folder itself, then forty times the link and the folder behind it.
        EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, both).size(), 81U) << length;
        TestSupport::removeTree(below(name));
    }
}

TEST_F(FileSysDirIteratorSizeTest, ALinkInACircleEndsAListingBeyondTheLongestPathToo) {
    CDeepFolder const bottom(volume(), std::string(200, 'n'), 30);
    bottom.makeLink("loop", "loop");
    EXPECT_EQ(walk(volume(), CDirIterator::eRecursive, both).size(), 30U);
}

TEST_F(FileSysDirIteratorSizeTest, AHundredThousandFilesComeInOrder) {
    TNames expected;
    for (int i = 0; i < 100000; ++i) {
        std::string const name = std::to_string(i);
        int const file = open(below(name).c_str(), O_CREAT | O_WRONLY, 0666);
        ASSERT_GE(file, 0);
        close(file);
        expected.push_back(name);
    }
    std::sort(expected.begin(), expected.end());
    TNames const names = walk(volume(), CDirIterator::eNotRecursive, CDirIterator::eFiles);
    EXPECT_TRUE(names == expected);
    EXPECT_EQ(names.size(), 100000U);
}

} // namespace
