/// Records the calls that the bridge makes to Java and to the platform, all in one list.
///
///     CRecorder::get().calls();
///     // "GetStringChars 1", "GetStringLength 1", "CFStringCreateWithCharacters 1", ...
///
/// A platform string made of characters is named by its number, in the order in which they are
/// made; a string that a conversion makes of bytes is "hub" and the number of the one read last.
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_RECORDER_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_RECORDER_H

#include <CoreFoundation/CoreFoundation.h>

#include <functional>
#include <map>
#include <string>
#include <vector>

namespace BridgeTest {

using TCalls = std::vector<std::string>;

/// Sees a call before it goes through. True makes it fail in the platform's way: no string comes,
/// nothing is read, no units are shown. It may throw as well.
using THook = std::function<bool(std::string const& call)>;

/// A hook that lets the given occurrence of a call fail, and no other.
THook failAt(std::string const& call, int occurrence = 1);

/// What CFStringCreateWithCharacters was called with.
struct TCreation {
    CFAllocatorRef allocator;
    UniChar const* units;
    CFIndex length;
};

/// The one record of the program; the functions put in front of the platform's write into it.
class CRecorder {
  public:
    static CRecorder& get();

    /// Forgets everything, the hook included, and counts from 1 again.
    void reset();
    void setHook(THook hook);

    TCalls const& calls() const { return calls_; }
    std::vector<TCreation> const& creations() const { return creations_; }

    /// The calls that begin with `prefix`.
    TCalls callsOf(std::string const& prefix) const;

    /// Releases the strings that were made and not released so far; their number.
    long releaseLeft();

    /// Appends a call; what the hook says of it.
    bool add(std::string const& call);

    /// The same as add() with a string's name behind the function's. Reading a numbered string
    /// makes it the one read last.
    bool addRead(char const* function, CFTypeRef string);

    /// Names a string that was made; null is let through.
    CFStringRef addMade(CFStringRef string, std::string const& name);
    void addCreation(TCreation const& creation) { creations_.push_back(creation); }
    void addRelease(CFTypeRef string);

    std::string nextNumber() const { return std::to_string(creations_.size()); }
    std::string hubName() const { return "hub " + readLast_; }

  private:
    TCalls calls_;
    std::vector<TCreation> creations_;
    std::map<CFTypeRef, std::string> names_;
    std::string readLast_;
    THook hook_;
};

} // namespace BridgeTest

#endif
