#include "support/TestLibraries/TestLibraries.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace fs = std::filesystem;

namespace {

std::vector<std::string> events;

void makeFolderOf(fs::path const& file) {
    if (file.has_parent_path())
        fs::create_directories(file.parent_path());
}

} // namespace

extern "C" __attribute__((visibility("default"))) void qornModuleEvent(char const* event);

void qornModuleEvent(char const* event) {
    events.push_back(event);
}

namespace TestSupport {

void copyLibrary(std::string const& name, std::string const& file) {
    makeFolderOf(file);
    fs::copy_file(libraryFolder() + "/" + name + ".so", file);
}

std::string libraryFolder() {
    return QORN_TEST_LIBRARIES;
}

std::vector<std::string> const& moduleEvents() {
    return events;
}

void writeFile(std::string const& file, std::string const& bytes) {
    makeFolderOf(file);
    std::ofstream(file, std::ios_base::binary) << bytes;
}

std::string readFile(std::string const& file) {
    std::ifstream stream(file, std::ios_base::binary);
    return std::string(std::istreambuf_iterator<char>(stream), {});
}

CEmptyFolder::CEmptyFolder() : before_(fs::current_path()) {
    char const* const parent = std::getenv("TMPDIR");
    folder_ = std::string(parent != nullptr && *parent != '\0' ? parent : "/tmp") + "/qorn-XXXXXX";
    if (::mkdtemp(folder_.data()) == nullptr)
        throw std::runtime_error("no temporary folder");
    fs::current_path(folder_);
    folder_ = fs::current_path();
    events.clear();
}

CEmptyFolder::~CEmptyFolder() {
    fs::current_path(before_);
    fs::remove_all(folder_);
}

} // namespace TestSupport
