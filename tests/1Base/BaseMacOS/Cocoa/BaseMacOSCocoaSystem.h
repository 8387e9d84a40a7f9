/// What GNUstep has no answer to, supplied for tests: address book, computer's name, kernel values,
/// bookmarks and the hidden flag. They keep a record of how they are called.
///
///     TestSupport::CCocoaSystem system;
///     system.addresses = {"ada@example.org"};
///     EXPECT_EQ(MacOS::NativeCocoa::getUserEmailAddress(), "ada@example.org");
#ifndef QORN_TESTS_BASEMACOSCOCOASYSTEM_H
#define QORN_TESTS_BASEMACOSCOCOASYSTEM_H

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace TestSupport {

/// One lives at a time, with a pool for what Cocoa hands back; the calls reach that one.
class CCocoaSystem {
  public:
    CCocoaSystem();
    ~CCocoaSystem();

    CCocoaSystem(CCocoaSystem const&) = delete;
    CCocoaSystem& operator=(CCocoaSystem const&) = delete;

    // What is answered.
    bool hasCard = true;
    std::optional<std::vector<std::string>> addresses = std::vector<std::string>();
    std::optional<std::string> computerName = "Engine";
    std::string model;
    int modelResult = 0;
    bool hasPath = true; ///< whether a URL has a path

    // What was asked.
    std::vector<std::string> calls;
    bool sawStore = false;
    unsigned long creationOptions = 0;
    unsigned long writeOptions = 0;
    unsigned long resolutionOptions = 0;
    bool sawKeys = false;
    bool sawBase = false;
    long pathStyle = -1;
    std::string hiddenPath;
    std::string hiddenKey;
    std::string hiddenValue;

  private:
    void* pool_;
};

// Foundation's own answers, asked with the numbers of its enumerations.
std::vector<std::string> searchPaths(unsigned long directory, unsigned long domainMask);
std::string temporaryDirectory();

/// How many objects of Cocoa are left after a hundred calls, each with a pool of its own.
long objectsLeftBy(std::function<void()> const& call);

} // namespace TestSupport

#endif
