/// Stands between the glue and the system: answers some calls itself, and lets others fail. The
/// program puts the functions listed in CMakeLists.txt behind it at link time (Linux).
///
///     TestSupport::CSystemCalls system;
///     system.fail("rename", EIO);              // the next one
///     system.redirect("/etc/machine-info", path("machine-info"));
#ifndef QORN_TESTS_BASEMACOSSYSTEMCALLS_H
#define QORN_TESTS_BASEMACOSSYSTEMCALLS_H

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

struct statx;

namespace TestSupport {

struct CUserEntry {
    std::string login;
    std::string gecos;
    std::string home;
};

/// While an object lives, calls are as it says; otherwise, and by default, they are the system's.
class CSystemCalls {
  public:
    CSystemCalls();
    ~CSystemCalls();

    CSystemCalls(CSystemCalls const&) = delete;
    CSystemCalls& operator=(CSystemCalls const&) = delete;

    /// The `nth` call of the function from now on does nothing but fail. A write fails in the
    /// middle, as on a full disk, unless it is interrupted (EINTR).
    void fail(std::string const& function, int error, unsigned nth = 1) {
        failures_[function] = {error, nth};
    }

    /// Opening `path` opens another file.
    void redirect(std::string const& path, std::string const& other) { files_[path] = other; }

    /// The list of users holds this one, or nobody. The entry needs a buffer of `room` bytes.
    void setUser(std::optional<CUserEntry> const& user, std::size_t room = 0);

    void setHostName(std::string const& name) { hostName_ = name; }

    /// Runs before each rename with its two paths.
    std::function<void(std::string const&, std::string const&)> onRename;

    /// Changes what statx gives for a name.
    std::function<void(std::string const&, struct statx&)> onStatx;

    /// The effective users that were asked for, and the lines of the system's log.
    std::vector<unsigned> usersAsked;
    std::vector<std::string> logged;

    // For the functions in front of the system's.
    static CSystemCalls* current();
    bool takeFailure(std::string const& function);
    std::string fileFor(std::string const& path) const;
    std::optional<std::string> const& hostName() const { return hostName_; }
    bool hasUsers() const { return hasUsers_; }
    std::optional<CUserEntry> const& user() const { return user_; }
    std::size_t userRoom() const { return userRoom_; }

  private:
    struct CFailure {
        int error;
        unsigned left; // the calls up to it
    };

    std::map<std::string, CFailure> failures_;
    std::map<std::string, std::string> files_;
    std::optional<std::string> hostName_;
    bool hasUsers_ = false;
    std::optional<CUserEntry> user_;
    std::size_t userRoom_ = 0;
};

} // namespace TestSupport

#endif
