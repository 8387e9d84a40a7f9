/// Watches the calls that the code under test makes into the operating system, and lets single ones
/// fail. A program that uses it links qorn_test_system_calls (Linux).
///
///     TestSupport::CSystemCalls calls;
///     calls.fail("rename", EXDEV);          // every call from here
///     calls.fail("unlinkat", EIO, 2);       // the second call from here
///     FileSys::moveFile(from, to, false);
///     calls.count("rename");                // 1
#ifndef QORN_TESTS_SYSTEMCALLS_H
#define QORN_TESTS_SYSTEMCALLS_H

#include <functional>
#include <map>
#include <string>
#include <utility>

namespace TestSupport {

/// Watches this thread's calls while it lives; one at a time on a thread. Only calls of files and
/// of the environment are seen, and of those only what the program's own objects and archives do:
/// not what a shared library does by itself. "copy_file_range" is known by that name although it is
/// called through `syscall`, and a function's variants ("open64", "__openat64_2") by the plain one.
class CSystemCalls {
  public:
    CSystemCalls();
    ~CSystemCalls();
    CSystemCalls(CSystemCalls const&) = delete;
    CSystemCalls& operator=(CSystemCalls const&) = delete;

    /// The `nth` call of `function` from now on, or with 0 each, is not made: it fails with
    /// `error`.
    void fail(std::string const& function, int error, unsigned int nth = 0);

    /// The `nth` call of `function` from now on is made with another path.
    void replacePath(std::string const& function, std::string const& path, unsigned int nth);

    /// Called before each call is made or fails, unwatched itself. The path is empty where the
    /// function has none.
    using TObserver = std::function<void(std::string const& function, std::string const& path)>;
    void observe(TObserver observer) { observer_ = std::move(observer); }

    unsigned int count(std::string const& function) const;

    /// All that were called, and how often.
    std::map<std::string, unsigned int> const& counts() const { return counts_; }

    /// For the functions that stand in front of the system's: the error of a call that is to fail,
    /// or 0, and the path to be taken instead.
    static int errorOf(char const* function, char const*& path);

  private:
    struct CFault {
        int error;
        unsigned int at; // the number of the call; 0: each
    };

    struct CReplacement {
        std::string path;
        unsigned int at;
    };

    int note(std::string const& function, char const*& path);

    std::map<std::string, unsigned int> counts_;
    std::map<std::string, CFault> faults_;
    std::map<std::string, CReplacement> replacements_;
    TObserver observer_;
};

} // namespace TestSupport

#endif
