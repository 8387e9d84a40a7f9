#include "support/TestLibraries/TestLibraries.h"

#include <filesystem>

namespace fs = std::filesystem;

namespace {

std::vector<std::string> events;

} // namespace

extern "C" __attribute__((visibility("default"))) void qornModuleEvent(char const* event);

void qornModuleEvent(char const* event) {
    events.push_back(event);
}

namespace TestSupport {

void copyLibrary(std::string const& name, std::string const& file) {
    layFile(file, readFile(libraryFolder() + "/" + name + ".so"));
}

std::string libraryFolder() {
    return QORN_TEST_LIBRARIES;
}

std::vector<std::string> const& moduleEvents() {
    return events;
}

void layFile(std::string const& file, std::string const& content) {
    makeFolders(fs::path(file).parent_path());
    writeFile(file, content);
}

CEmptyFolder::CEmptyFolder() {
    fs::current_path(root_.path());
    events.clear();
}

CEmptyFolder::~CEmptyFolder() {
    fs::current_path("/");
}

} // namespace TestSupport
