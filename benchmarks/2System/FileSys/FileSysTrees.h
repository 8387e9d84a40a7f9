/// Folders full of files for the benchmarks of the file system, in the temporary folder and gone
/// with the program.
#ifndef QORN_BENCHMARKS_FILESYSTREES_H
#define QORN_BENCHMARKS_FILESYSTREES_H

#include <cstddef>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <initializer_list>
#include <iostream>
#include <spawn.h>
#include <string>
#include <sys/wait.h>
#include <vector>

extern char** environ;

namespace Benchmarks {

/// A folder of its own, removed with all in it.
class CScratch {
  public:
    CScratch() {
        char const* const parent = std::getenv("TMPDIR");
        std::string name = std::string(parent && *parent ? parent : "/tmp") + "/qorn-XXXXXX";
        if (!mkdtemp(name.data())) {
            std::cerr << "cannot make " << name << "\n";
            std::exit(EXIT_FAILURE);
        }
        path_ = name;
    }
    CScratch(CScratch const&) = delete;
    CScratch& operator=(CScratch const&) = delete;
    ~CScratch() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }

    std::string operator/(std::string const& name) const { return (path_ / name).string(); }

  private:
    std::filesystem::path path_;
};

/// One for the whole program.
inline CScratch const& scratch() {
    static CScratch const folder;
    return folder;
}

/// `folders` folders with `files` files of `bytes` bytes each, made when first asked for: a program
/// that only lists its benchmarks makes none. Copies are one tree.
class CTree {
  public:
    CTree(std::string name, int folders, int files, std::size_t bytes)
        : root_(scratch() / name), folders_(folders), files_(files), bytes_(bytes) {}

    std::string const& path() const {
        if (!std::filesystem::exists(root_))
            make();
        return root_;
    }

  private:
    void make() const {
        std::string const content(bytes_, 'q');
        for (int folder = 0; folder < folders_; ++folder) {
            std::string const path = root_ + "/folder" + std::to_string(folder);
            std::filesystem::create_directories(path);
            for (int file = 0; file < files_; ++file)
                std::ofstream(path + "/file" + std::to_string(file) + ".txt") << content;
        }
    }

    std::string root_;
    int folders_;
    int files_;
    std::size_t bytes_;
};

/// Runs a program of the system to its end, its output thrown away.
inline int runProgram(std::initializer_list<std::string> command) {
    std::vector<std::string> words(command);
    std::vector<char*> arguments;
    for (std::string& word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, 1, "/dev/null", 1, 0);
    pid_t process = 0;
    int status = posix_spawnp(&process, arguments[0], &actions, nullptr, arguments.data(), environ);
    posix_spawn_file_actions_destroy(&actions);
    if (status == 0)
        waitpid(process, &status, 0);
    return status;
}

} // namespace Benchmarks

#endif
