// The account service (org.freedesktop.Accounts) knows the user's address. It is asked through
// sd-bus, which unlike other libraries of the bus starts no thread and lets every wait be bounded;
// loaded where it is first needed, so that a system without it lacks nothing but the address.

#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include <dlfcn.h>
#include <unistd.h>

#include <chrono>
#include <cstdint>
#include <cstdlib>
#include <memory>

namespace MacOS {
namespace Native {
namespace {

// Enough for a service that the bus has to start first.
constexpr std::chrono::milliseconds patience(500);

constexpr char service[] = "org.freedesktop.Accounts";
constexpr char servicePath[] = "/org/freedesktop/Accounts";
constexpr char userInterface[] = "org.freedesktop.Accounts.User";

// The library's types, known by their addresses only.
struct CBus;
struct CMessage;
struct CError;

// The functions of libsystemd that are called, each as sd-bus(3) and its kin declare it. The
// library stays loaded: it keeps data of the thread.
struct CLibrary {
    CLibrary() {
        void* const library = ::dlopen("libsystemd.so.0", RTLD_LAZY | RTLD_LOCAL);
        if (library == nullptr)
            return;
        isThere = load(library, "sd_bus_open_system", openSystem) &&
                  load(library, "sd_bus_close_unref", closeUnref) &&
                  load(library, "sd_bus_is_ready", isReady) &&
                  load(library, "sd_bus_process", process) && load(library, "sd_bus_wait", wait) &&
                  load(library, "sd_bus_set_method_call_timeout", setMethodCallTimeout) &&
                  load(library, "sd_bus_call_method", callMethod) &&
                  load(library, "sd_bus_message_read", messageRead) &&
                  load(library, "sd_bus_message_unref", messageUnref) &&
                  load(library, "sd_bus_get_property_string", getPropertyString);
    }

    template <class TFunction>
    static bool load(void* library, char const* name, TFunction& function) {
        function = reinterpret_cast<TFunction>(::dlsym(library, name));
        return function != nullptr;
    }

    bool isThere = false;
    int (*openSystem)(CBus** bus) = nullptr;
    CBus* (*closeUnref)(CBus* bus) = nullptr;
    int (*isReady)(CBus* bus) = nullptr;
    int (*process)(CBus* bus, CMessage** message) = nullptr;
    int (*wait)(CBus* bus, std::uint64_t microseconds) = nullptr;
    int (*setMethodCallTimeout)(CBus* bus, std::uint64_t microseconds) = nullptr;
    int (*callMethod)(CBus* bus, char const* destination, char const* path, char const* interface,
                      char const* member, CError* error, CMessage** reply, char const* types,
                      ...) = nullptr;
    int (*messageRead)(CMessage* message, char const* types, ...) = nullptr;
    CMessage* (*messageUnref)(CMessage* message) = nullptr;
    int (*getPropertyString)(CBus* bus, char const* destination, char const* path,
                             char const* interface, char const* member, CError* error,
                             char** value) = nullptr;
};

// A connection of its own to the system bus, with one span of patience for all that is asked.
class CConnection {
  public:
    explicit CConnection(CLibrary const& library) : library_(library) {
        isOpen_ = library_.openSystem(&bus_) >= 0 && waitUntilReady();
    }

    // Closes without sending what is left, which could wait.
    ~CConnection() {
        if (bus_ != nullptr)
            library_.closeUnref(bus_);
    }

    CConnection(CConnection const&) = delete;
    CConnection& operator=(CConnection const&) = delete;

    // Empty where the service doesn't know the user.
    std::string findUser(std::int64_t user) {
        CMessage* reply = nullptr;
        char const* path = nullptr;
        std::string found;
        if (limitNextCall() &&
            library_.callMethod(bus_, service, servicePath, service, "FindUserById", nullptr,
                                &reply, "x", user) >= 0 &&
            library_.messageRead(reply, "o", &path) > 0)
            found = path;
        library_.messageUnref(reply);
        return found;
    }

    std::string getEmail(std::string const& user) {
        char* value = nullptr;
        if (user.empty() || !limitNextCall() ||
            library_.getPropertyString(bus_, service, user.c_str(), userInterface, "Email", nullptr,
                                       &value) < 0)
            return {};
        std::unique_ptr<char, void (*)(void*)> const owner(value, std::free);
        return value;
    }

  private:
    // 0 once the patience is at its end.
    std::uint64_t microsecondsLeft() const {
        auto const left = std::chrono::duration_cast<std::chrono::microseconds>(
            end_ - std::chrono::steady_clock::now());
        return left.count() > 0 ? static_cast<std::uint64_t>(left.count()) : 0;
    }

    // The library's own calls would wait for the bus's greeting without a limit.
    bool waitUntilReady() {
        while (library_.isReady(bus_) == 0) {
            std::uint64_t const left = microsecondsLeft();
            int const progress = library_.process(bus_, nullptr);
            if (left == 0 || progress < 0 || (progress == 0 && library_.wait(bus_, left) < 0))
                return false;
        }
        return library_.isReady(bus_) > 0;
    }

    bool limitNextCall() {
        std::uint64_t const left = microsecondsLeft();
        return isOpen_ && left > 0 && library_.setMethodCallTimeout(bus_, left) >= 0;
    }

    CLibrary const& library_;
    std::chrono::steady_clock::time_point const end_ = std::chrono::steady_clock::now() + patience;
    CBus* bus_ = nullptr;
    bool isOpen_ = false;
};

} // namespace

std::string getUserEmailAddress() {
    static CLibrary const library;
    if (!library.isThere)
        return {};
    CConnection connection(library);
    return connection.getEmail(connection.findUser(::geteuid()));
}

} // namespace Native
} // namespace MacOS
