/// Watches the calls that the code under test makes into the platform's strings and locales, and
/// lets single ones fail. A program that uses it links qorn_test_platform_calls (Linux).
///
///     TestSupport::CPlatformCalls calls;
///     calls.fail("CFStringGetBytes", 2);    // the second call from here answers 0
///     Encoding::convert<std::string>(text);
///     calls.names();                        // "CFStringCreateWithBytes", "CFStringGetLength" ...
#ifndef QORN_TESTS_PLATFORMCALLS_H
#define QORN_TESTS_PLATFORMCALLS_H

#include <CoreFoundation/CoreFoundation.h>

#include <functional>
#include <map>
#include <string>
#include <vector>

namespace TestSupport {

/// One call. Fields that the function has no argument for keep their first value.
struct CPlatformCall {
    std::string function;
    CFAllocatorRef allocator = nullptr;
    CFTypeRef object = nullptr; // what is worked on; a Create function: what it made
    CFTypeRef source = nullptr; // what is copied from, or compared with
    CFTypeRef locale = nullptr;
    CFOptionFlags options = 0;   // of a comparison
    void const* input = nullptr; // bytes or units given
    CFIndex inputCount = 0;      // their number
    CFStringEncoding encoding = 0;
    UInt8 lossByte = 0;
    bool external = false;
    CFRange range = {0, 0};
    void const* buffer = nullptr; // where the call writes
    CFIndex room = 0;             // maxBufLen
    CFIndex capacity = -1;        // of a mutable copy
    CFIndex form = -1;            // of a normalisation
    CFIndex result = 0;           // a number that the function returned
    CFIndex used = 0;             // usedBufLen after the call
    std::string written;          // what CFStringGetBytes left in the buffer
};

/// Records every call into the platform while it lives, in order. What the platform calls within
/// itself is left out, and what other threads call. One at a time on a thread.
class CPlatformCalls {
  public:
    CPlatformCalls();
    ~CPlatformCalls();
    CPlatformCalls(CPlatformCalls const&) = delete;
    CPlatformCalls& operator=(CPlatformCalls const&) = delete;

    /// The `nth` call of `function` from now on does not reach the platform: a Create or
    /// Copy function and CFStringGetCharactersPtr answer null, all others do nothing and answer 0.
    void fail(std::string const& function, int nth = 1);

    /// Called before each call is passed on.
    void observe(std::function<void(CPlatformCall const&)> observer);

    std::vector<CPlatformCall> const& all() const { return calls_; }
    std::vector<CPlatformCall> of(std::string const& function) const;
    std::vector<std::string> names() const;

  private:
    friend class CPlatformWatch;

    std::vector<CPlatformCall> calls_;
    std::map<std::string, int> failures_;
    std::function<void(CPlatformCall const&)> observer_;
};

/// While it lives, this thread's calls reach the platform unwatched and unharmed.
class CPlatformPause {
  public:
    CPlatformPause();
    ~CPlatformPause();
    CPlatformPause(CPlatformPause const&) = delete;
    CPlatformPause& operator=(CPlatformPause const&) = delete;
};

} // namespace TestSupport

#endif
