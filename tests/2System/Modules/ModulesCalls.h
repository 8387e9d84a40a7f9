/// Watches the calls into both loaders, and lets single ones fail.
///
///     ModulesTest::CLoaderCalls calls;
///     calls.fail("dlopen");
///     Modules::loadLibrary(spec, 0);
///     calls.all();   // "CFURLCreateWithFileSystemPath file", "CFBundleCreate", ...
#ifndef QORN_TESTS_MODULESCALLS_H
#define QORN_TESTS_MODULESCALLS_H

#include <string>
#include <vector>

namespace ModulesTest {

using TCalls = std::vector<std::string>;

/// Records the calls while it lives, one at a time. What the bundle's loader calls within itself is
/// left out.
class CLoaderCalls {
  public:
    CLoaderCalls();
    ~CLoaderCalls();
    CLoaderCalls(CLoaderCalls const&) = delete;
    CLoaderCalls& operator=(CLoaderCalls const&) = delete;

    /// The calls in order, each by its name and what matters of its arguments:
    ///     CFURLCreateWithFileSystemPath file    or "folder", by the directory flag
    ///     CFBundleCreate
    ///     CFBundleLoadExecutable
    ///     CFBundleGetFunctionPointerForName
    ///     CFBundleUnloadExecutable
    ///     CFRelease url                         or "bundle"; other objects are left out
    ///     dlopen <file> lazy                    or the mode's number
    ///     dlsym <name>
    ///     dlclose
    TCalls const& all() const { return calls_; }

    /// From now on calls of this function answer as in failure, and all but dlclose do not reach
    /// the loader.
    void fail(std::string const& function) { failing_ = function; }

  private:
    friend class CLoaderCall;

    TCalls calls_;
    std::string failing_;
};

/// How many handles of dlopen are open, those of bundles included.
long openHandles();

} // namespace ModulesTest

#endif
