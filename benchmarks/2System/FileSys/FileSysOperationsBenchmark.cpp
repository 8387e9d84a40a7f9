// Copying trees, asking about paths and making temporary files, beside the system's own programs
// and other libraries. Each copy goes to a fresh target.

#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/FileSysTempFile.h"

#include "2System/FileSys/FileSysTrees.h"
#include "support/Benchmark.h"

#include <boost/filesystem.hpp>

#ifdef QORN_HAVE_GLIB
#    include <glib.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QFileInfo>
#    include <QString>
#    include <QTemporaryDir>
#    include <QTemporaryFile>
#endif

#include <fcntl.h>
#include <filesystem>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using Benchmarks::scratch;

template <class TCopy>
void addCopy(std::string const& row, char const* contender, Benchmarks::CTree const& tree,
             TCopy copy) {
    std::string const to = scratch() / "copy";
    auto const clear = [to] { std::filesystem::remove_all(to); };
    Benchmarks::addByWall(
        row, contender,
        [=] {
            tree.path();
            clear();
        },
        [=] {
            copy(tree.path(), to);
            return 0;
        },
        clear);
}

void addCopies(std::string const& row, Benchmarks::CTree const& from) {
    addCopy(row, "ours", from, [](std::string const& source, std::string const& target) {
        FileSys::copyFile(source, target, false);
    });
    addCopy(row, "std", from, [](std::string const& source, std::string const& target) {
        std::filesystem::copy(source, target, std::filesystem::copy_options::recursive);
    });
    addCopy(row, "cp", from, [](std::string const& source, std::string const& target) {
        Benchmarks::runProgram({"cp", "-r", source, target});
    });
    if (Benchmarks::runProgram({"rsync", "--version"}) == 0) {
        addCopy(row, "rsync", from, [](std::string const& source, std::string const& target) {
            Benchmarks::runProgram({"rsync", "-r", "--whole-file", source + "/", target});
        });
    }
}

template <class TAsk>
void addQuestion(std::string const& row, char const* contender, std::string const& path, TAsk ask) {
    Benchmarks::add(row, contender, [path, ask] { return ask(path); });
}

void addExists(std::string const& name, std::string const& path) {
    std::string const row = "FileExists/" + name;
    FileSys::CFileSpec const spec(path);
    Benchmarks::add(row, "ours", [spec] { return spec.exists(); });
    addQuestion(row, "stat", path, [](std::string const& text) {
        struct stat found;
        return stat(text.c_str(), &found) == 0;
    });
    addQuestion(row, "std", path, [](std::string const& text) {
        std::error_code error;
        return std::filesystem::exists(text, error);
    });
    addQuestion(row, "boost", path, [](std::string const& text) {
        boost::system::error_code error;
        return boost::filesystem::exists(text, error);
    });
#ifdef QORN_HAVE_GLIB
    addQuestion(row, "glib", path, [](std::string const& text) {
        return g_file_test(text.c_str(), G_FILE_TEST_EXISTS) != FALSE;
    });
#endif
#ifdef QORN_HAVE_QT
    QString const wide = QString::fromStdString(path);
    Benchmarks::add(row, "qt", [wide] { return QFileInfo::exists(wide); });
#endif
}

void addIsFolder(std::string const& path) {
    FileSys::CFileSpec const spec(path);
    Benchmarks::add("FileIsFolder", "ours", [spec] { return spec.isFolder(); });
    addQuestion("FileIsFolder", "stat", path, [](std::string const& text) {
        struct stat found;
        return stat(text.c_str(), &found) == 0 && S_ISDIR(found.st_mode);
    });
    addQuestion("FileIsFolder", "std", path, [](std::string const& text) {
        std::error_code error;
        return std::filesystem::is_directory(text, error);
    });
#ifdef QORN_HAVE_QT
    QString const wide = QString::fromStdString(path);
    Benchmarks::add("FileIsFolder", "qt", [wide] { return QFileInfo(wide).isDir(); });
#endif
}

void addTemporaryFile(std::string const& folder) {
    std::string const row = "TemporaryFile";
    FileSys::CFileSpec const hint(folder);
    Benchmarks::add(row, "ours", [hint] {
        std::string const path = FileSys::createTempFile(hint).getFullName<std::string>(true);
        return unlink(path.c_str());
    });
    Benchmarks::add(row, "mkstemp", [folder] {
        std::string path = folder + "/XXXXXX";
        int const file = mkstemp(path.data());
        fchmod(file, 0644);
        close(file);
        return unlink(path.c_str());
    });
#ifdef QORN_HAVE_QT
    QString const pattern = QString::fromStdString(folder + "/XXXXXX");
    Benchmarks::add(row, "qt", [pattern] {
        QTemporaryFile file(pattern);
        return file.open();
    });
#endif
#ifdef QORN_HAVE_GLIB
    Benchmarks::add(row, "glib", [folder] {
        std::string path = folder + "/XXXXXX";
        int const file = g_mkstemp_full(path.data(), O_RDWR, 0644);
        close(file);
        return unlink(path.c_str());
    });
#endif
}

// A name of its own for the hint, and the folder removed again.
void addTemporaryFolder(std::string const& folder) {
    std::string const row = "TemporaryFolder";
    std::string const name = folder + "/name";
    FileSys::CFileSpec const hint(name);
    Benchmarks::add(row, "ours", [hint] {
        std::string const path = FileSys::createTempFolder(hint).getFullName<std::string>(true);
        return rmdir(path.c_str());
    });
    Benchmarks::add(row, "mkdtemp", [name] {
        std::string path = name + "-XXXXXX";
        mkdtemp(path.data());
        return rmdir(path.c_str());
    });
#ifdef QORN_HAVE_QT
    QString const pattern = QString::fromStdString(name + "-XXXXXX");
    Benchmarks::add(row, "qt", [pattern] {
        QTemporaryDir made(pattern);
        return made.isValid();
    });
#endif
#ifdef QORN_HAVE_GLIB
    Benchmarks::add(row, "glib", [name] {
        std::string path = name + "-XXXXXX";
        g_mkdtemp(path.data());
        return rmdir(path.c_str());
    });
#endif
}

void addBenchmarks() {
    addCopies("TreeCopy/20000x1KiB", Benchmarks::CTree("small", 200, 100, 1024));
    addCopies("TreeCopy/4x512MiB", Benchmarks::CTree("large", 1, 4, std::size_t(512) << 20));
    std::string const folder = Benchmarks::CTree("single", 1, 1, 1).path() + "/folder0";
    addExists("present", folder + "/file0.txt");
    addExists("missing", folder + "/none.txt");
    addIsFolder(folder);
    addTemporaryFile(folder);
    addTemporaryFolder(folder);
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
