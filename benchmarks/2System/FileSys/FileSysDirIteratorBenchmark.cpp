// Walking a tree of 100,000 entries in 1,000 folders beside other libraries. Every contender owns
// the path of each entry in its own kind of text and has the siblings in order.

#include "2System/FileSys/FileSysDirIterator.h"

#include "2System/FileSys/FileSysTrees.h"
#include "support/Benchmark.h"

#include <boost/filesystem.hpp>

#ifdef QORN_HAVE_GLIB
#    include <glib.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QDirIterator>
#    include <QString>
#endif

#include <algorithm>
#include <cstddef>
#include <dirent.h>
#include <filesystem>
#include <ftw.h>
#include <string>
#include <vector>

namespace {

constexpr int folderCount = 1000;
constexpr int filesPerFolder = 99;

std::size_t walkOurs(std::string const& root) {
    using FileSys::CDirIterator;
    std::size_t entries = 0;
    for (CDirIterator entry(root, CDirIterator::eRecursive,
                            CDirIterator::eFiles | CDirIterator::eFolders);
         entry != CDirIterator(); ++entry)
        ++entries;
    return entries;
}

template <class TIterator>
std::size_t walkSorted(std::string const& root) {
    using TPath = std::decay_t<decltype(TIterator()->path())>;
    std::vector<TPath> paths;
    for (TIterator entry(root), end; entry != end; ++entry)
        paths.push_back(entry->path());
    std::sort(paths.begin(), paths.end());
    return paths.size();
}

// The least that such a walk takes: the kinds come with the listing, names sort within a folder.
std::size_t walkReaddir(std::string const& folder) {
    std::vector<std::string> files;
    std::vector<std::string> folders;
    DIR* const listing = opendir(folder.c_str());
    while (dirent const* const entry = readdir(listing)) {
        std::string const name = entry->d_name;
        if (entry->d_type == DT_DIR && name != "." && name != "..")
            folders.push_back(folder + "/" + name);
        else if (entry->d_type == DT_REG)
            files.push_back(folder + "/" + name);
    }
    closedir(listing);
    std::sort(files.begin(), files.end());
    std::sort(folders.begin(), folders.end());
    std::size_t entries = files.size() + folders.size();
    for (std::string const& sub : folders)
        entries += walkReaddir(sub);
    return entries;
}

std::vector<std::string>* visited = nullptr;

int visit(char const* path, struct stat const*, int, FTW* place) {
    if (place->level > 0)
        visited->push_back(path);
    return 0;
}

std::size_t walkNftw(std::string const& root) {
    std::vector<std::string> paths;
    visited = &paths;
    nftw(root.c_str(), visit, 16, FTW_PHYS);
    std::sort(paths.begin(), paths.end());
    return paths.size();
}

#ifdef QORN_HAVE_GLIB
std::size_t walkGLib(std::string const& folder) {
    std::vector<std::string> paths;
    std::size_t entries = 0;
    GDir* const listing = g_dir_open(folder.c_str(), 0, nullptr);
    while (char const* const name = g_dir_read_name(listing))
        paths.push_back(folder + "/" + name);
    g_dir_close(listing);
    std::sort(paths.begin(), paths.end());
    entries += paths.size();
    for (std::string const& path : paths) {
        if (g_file_test(path.c_str(), G_FILE_TEST_IS_DIR))
            entries += walkGLib(path);
    }
    return entries;
}
#endif

#ifdef QORN_HAVE_QT
std::size_t walkQt(std::string const& root) {
    std::vector<QString> paths;
    QDirIterator entry(QString::fromStdString(root),
                       QDir::Files | QDir::Dirs | QDir::Hidden | QDir::NoDotAndDotDot,
                       QDirIterator::Subdirectories);
    while (entry.hasNext())
        paths.push_back(entry.next());
    std::sort(paths.begin(), paths.end());
    return paths.size();
}
#endif

void addWalk(char const* contender, Benchmarks::CTree const& tree,
             std::size_t (*walk)(std::string const&)) {
    auto const checked = [=] {
        std::size_t const entries = walk(tree.path());
        if (entries != folderCount * (filesPerFolder + 1)) {
            std::cerr << contender << " finds another number of entries\n";
            std::exit(EXIT_FAILURE);
        }
        return entries;
    };
    Benchmarks::addByWall(
        "FolderWalk/100000", contender, [tree] { tree.path(); }, checked, [] {});
}

void addBenchmarks() {
    Benchmarks::CTree const tree("walk", folderCount, filesPerFolder, 0);
    addWalk("ours", tree, walkOurs);
    addWalk("std", tree, walkSorted<std::filesystem::recursive_directory_iterator>);
    addWalk("boost", tree, walkSorted<boost::filesystem::recursive_directory_iterator>);
    addWalk("readdir", tree, walkReaddir);
    addWalk("nftw", tree, walkNftw);
#ifdef QORN_HAVE_GLIB
    addWalk("glib", tree, walkGLib);
#endif
#ifdef QORN_HAVE_QT
    addWalk("qt", tree, walkQt);
#endif
    Benchmarks::addByWall(
        "FolderWalk/100000", "find:unsorted", [tree] { tree.path(); },
        [tree] {
            return Benchmarks::runProgram({"find", tree.path(), "-mindepth", "1"});
        },
        [] {});
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
