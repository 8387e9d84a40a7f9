#include "QORNOpenOfficeLibrary/Recorder.h"
#include "QORNOpenOfficeLibrary/Heap.h"

#include <algorithm>
#include <utility>

using BridgeTest::CRecorder;

extern "C" {

CFStringRef __real_CFStringCreateWithCharacters(CFAllocatorRef, UniChar const*, CFIndex);
CFStringRef __real_CFStringCreateWithBytes(CFAllocatorRef, UInt8 const*, CFIndex, CFStringEncoding,
                                           Boolean);
UniChar const* __real_CFStringGetCharactersPtr(CFStringRef);
CFIndex __real_CFStringGetBytes(CFStringRef, CFRange, CFStringEncoding, UInt8, Boolean, UInt8*,
                                CFIndex, CFIndex*);
void __real_CFRelease(CFTypeRef);

CFStringRef __wrap_CFStringCreateWithCharacters(CFAllocatorRef allocator, UniChar const* units,
                                                CFIndex length) {
    BridgeTest::CHeapPause const pause;
    CRecorder& recorder = CRecorder::get();
    recorder.addCreation({allocator, units, length});
    std::string const number = recorder.nextNumber();
    if (recorder.add("CFStringCreateWithCharacters " + number))
        return nullptr;
    // A length below zero is only recorded: there is no such string.
    return recorder.addMade(
        __real_CFStringCreateWithCharacters(allocator, units, std::max<CFIndex>(length, 0)),
        number);
}

CFStringRef __wrap_CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes,
                                           CFIndex count, CFStringEncoding encoding,
                                           Boolean external) {
    BridgeTest::CHeapPause const pause;
    CRecorder& recorder = CRecorder::get();
    std::string const name = recorder.hubName();
    if (recorder.add("CFStringCreateWithBytes " + name))
        return nullptr;
    return recorder.addMade(
        __real_CFStringCreateWithBytes(allocator, bytes, count, encoding, external), name);
}

UniChar const* __wrap_CFStringGetCharactersPtr(CFStringRef string) {
    BridgeTest::CHeapPause const pause;
    bool const fails = CRecorder::get().addRead("CFStringGetCharactersPtr ", string);
    return fails ? nullptr : __real_CFStringGetCharactersPtr(string);
}

CFIndex __wrap_CFStringGetBytes(CFStringRef string, CFRange range, CFStringEncoding encoding,
                                UInt8 lossByte, Boolean external, UInt8* buffer, CFIndex size,
                                CFIndex* used) {
    BridgeTest::CHeapPause const pause;
    if (!CRecorder::get().addRead("CFStringGetBytes ", string))
        return __real_CFStringGetBytes(string, range, encoding, lossByte, external, buffer, size,
                                       used);
    *used = 0;
    return 0;
}

void __wrap_CFRelease(CFTypeRef string) {
    BridgeTest::CHeapPause const pause;
    CRecorder::get().addRelease(string);
    __real_CFRelease(string);
}
}

namespace BridgeTest {

THook failAt(std::string const& call, int occurrence) {
    return [call, occurrence, seen = 0](std::string const& made) mutable {
        return made == call && ++seen == occurrence;
    };
}

CRecorder& CRecorder::get() {
    static CRecorder recorder;
    return recorder;
}

void CRecorder::reset() {
    *this = CRecorder();
}

void CRecorder::setHook(THook hook) {
    hook_ = std::move(hook);
}

TCalls CRecorder::callsOf(std::string const& prefix) const {
    TCalls found;
    std::copy_if(
        calls_.begin(), calls_.end(), std::back_inserter(found),
        [&prefix](std::string const& call) { return call.compare(0, prefix.size(), prefix) == 0; });
    return found;
}

long CRecorder::releaseLeft() {
    long const count = static_cast<long>(names_.size());
    for (auto const& entry : names_)
        __real_CFRelease(entry.first);
    names_.clear();
    return count;
}

bool CRecorder::add(std::string const& call) {
    calls_.push_back(call);
    return hook_ && hook_(call);
}

bool CRecorder::addRead(char const* function, CFTypeRef string) {
    std::string const& name = names_[string];
    if (name.compare(0, 3, "hub") != 0)
        readLast_ = name;
    return add(function + name);
}

CFStringRef CRecorder::addMade(CFStringRef string, std::string const& name) {
    if (string != nullptr)
        names_[string] = name;
    return string;
}

void CRecorder::addRelease(CFTypeRef string) {
    auto const entry = names_.find(string);
    add("CFRelease " + (entry == names_.end() ? "unknown" : entry->second));
    if (entry != names_.end())
        names_.erase(entry);
}

} // namespace BridgeTest
