#include "support/PlatformCalls.h"

#include <utility>

namespace TestSupport {
namespace {

thread_local CPlatformCalls* recorder = nullptr;
thread_local int depth = 0;

} // namespace

/// One call on its way through a wrapper: `forward` says whether the platform gets to see it.
class CPlatformWatch {
  public:
    explicit CPlatformWatch(CPlatformCall details) : call(std::move(details)) { ++depth; }

    ~CPlatformWatch() {
        if (isWatched())
            recorder->calls_.push_back(call);
        --depth;
    }

    CPlatformWatch(CPlatformWatch const&) = delete;
    CPlatformWatch& operator=(CPlatformWatch const&) = delete;

    bool forward() {
        if (!isWatched())
            return true;
        if (recorder->observer_)
            recorder->observer_(call);
        auto const failure = recorder->failures_.find(call.function);
        return failure == recorder->failures_.end() || --failure->second != 0;
    }

    CPlatformCall call;

  private:
    static bool isWatched() { return recorder != nullptr && depth == 1; }
};

CPlatformPause::CPlatformPause() {
    ++depth;
}

CPlatformPause::~CPlatformPause() {
    --depth;
}

CPlatformCalls::CPlatformCalls() {
    recorder = this;
}

CPlatformCalls::~CPlatformCalls() {
    recorder = nullptr;
}

void CPlatformCalls::fail(std::string const& function, int nth) {
    failures_[function] = nth;
}

void CPlatformCalls::observe(std::function<void(CPlatformCall const&)> observer) {
    observer_ = std::move(observer);
}

std::vector<CPlatformCall> CPlatformCalls::of(std::string const& function) const {
    std::vector<CPlatformCall> calls;
    for (CPlatformCall const& call : calls_) {
        if (call.function == function)
            calls.push_back(call);
    }
    return calls;
}

std::vector<std::string> CPlatformCalls::names() const {
    std::vector<std::string> names;
    for (CPlatformCall const& call : calls_)
        names.push_back(call.function);
    return names;
}

} // namespace TestSupport

using TestSupport::CPlatformCall;
using TestSupport::CPlatformWatch;

namespace {

CPlatformCall callOf(char const* function, CFTypeRef object = nullptr) {
    CPlatformCall call;
    call.function = function;
    call.object = object;
    return call;
}

// A call that makes an object, by `make`.
template <class TMake>
auto create(CPlatformCall const& call, TMake const& make) {
    CPlatformWatch watch(call);
    auto const made = watch.forward() ? make() : nullptr;
    watch.call.object = made;
    return made;
}

} // namespace

extern "C" {

CFStringRef __real_CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes,
                                           CFIndex numBytes, CFStringEncoding encoding,
                                           Boolean isExternalRepresentation);
CFStringRef __real_CFStringCreateWithCharacters(CFAllocatorRef allocator, UniChar const* characters,
                                                CFIndex numChars);
CFStringRef __real_CFStringCreateWithPascalString(CFAllocatorRef allocator,
                                                  ConstStr255Param pascalString,
                                                  CFStringEncoding encoding);
CFMutableStringRef __real_CFStringCreateMutableCopy(CFAllocatorRef allocator, CFIndex maxLength,
                                                    CFStringRef string);
CFIndex __real_CFStringGetLength(CFStringRef string);
UniChar const* __real_CFStringGetCharactersPtr(CFStringRef string);
void __real_CFStringGetCharacters(CFStringRef string, CFRange range, UniChar* buffer);
CFIndex __real_CFStringGetBytes(CFStringRef string, CFRange range, CFStringEncoding encoding,
                                UInt8 lossByte, Boolean isExternalRepresentation, UInt8* buffer,
                                CFIndex maxBufLen, CFIndex* usedBufLen);
void __real_CFStringNormalize(CFMutableStringRef string, CFStringNormalizationForm form);
CFComparisonResult __real_CFStringCompareWithOptions(CFStringRef string1, CFStringRef string2,
                                                     CFRange range, CFStringCompareFlags options);
void __real_CFStringUppercase(CFMutableStringRef string, CFLocaleRef locale);
void __real_CFStringLowercase(CFMutableStringRef string, CFLocaleRef locale);
CFLocaleRef __real_CFLocaleCopyCurrent(void);
CFTypeRef __real_CFRetain(CFTypeRef object);
void __real_CFRelease(CFTypeRef object);

CFStringRef __wrap_CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes,
                                           CFIndex numBytes, CFStringEncoding encoding,
                                           Boolean isExternalRepresentation) {
    CPlatformCall call = callOf("CFStringCreateWithBytes");
    call.allocator = allocator;
    call.input = bytes;
    call.inputCount = numBytes;
    call.encoding = encoding;
    call.external = isExternalRepresentation;
    return create(call, [=] {
        return __real_CFStringCreateWithBytes(allocator, bytes, numBytes, encoding,
                                              isExternalRepresentation);
    });
}

CFStringRef __wrap_CFStringCreateWithCharacters(CFAllocatorRef allocator, UniChar const* characters,
                                                CFIndex numChars) {
    CPlatformCall call = callOf("CFStringCreateWithCharacters");
    call.allocator = allocator;
    call.input = characters;
    call.inputCount = numChars;
    return create(
        call, [=] { return __real_CFStringCreateWithCharacters(allocator, characters, numChars); });
}

CFStringRef __wrap_CFStringCreateWithPascalString(CFAllocatorRef allocator,
                                                  ConstStr255Param pascalString,
                                                  CFStringEncoding encoding) {
    CPlatformCall call = callOf("CFStringCreateWithPascalString");
    call.allocator = allocator;
    call.input = pascalString;
    call.encoding = encoding;
    return create(call, [=] {
        return __real_CFStringCreateWithPascalString(allocator, pascalString, encoding);
    });
}

CFMutableStringRef __wrap_CFStringCreateMutableCopy(CFAllocatorRef allocator, CFIndex maxLength,
                                                    CFStringRef string) {
    CPlatformCall call = callOf("CFStringCreateMutableCopy");
    call.allocator = allocator;
    call.capacity = maxLength;
    call.source = string;
    return create(call,
                  [=] { return __real_CFStringCreateMutableCopy(allocator, maxLength, string); });
}

CFIndex __wrap_CFStringGetLength(CFStringRef string) {
    CPlatformWatch watch(callOf("CFStringGetLength", string));
    return watch.call.result = watch.forward() ? __real_CFStringGetLength(string) : 0;
}

UniChar const* __wrap_CFStringGetCharactersPtr(CFStringRef string) {
    CPlatformWatch watch(callOf("CFStringGetCharactersPtr", string));
    return watch.forward() ? __real_CFStringGetCharactersPtr(string) : nullptr;
}

void __wrap_CFStringGetCharacters(CFStringRef string, CFRange range, UniChar* buffer) {
    CPlatformWatch watch(callOf("CFStringGetCharacters", string));
    watch.call.range = range;
    watch.call.buffer = buffer;
    if (watch.forward())
        __real_CFStringGetCharacters(string, range, buffer);
}

CFIndex __wrap_CFStringGetBytes(CFStringRef string, CFRange range, CFStringEncoding encoding,
                                UInt8 lossByte, Boolean isExternalRepresentation, UInt8* buffer,
                                CFIndex maxBufLen, CFIndex* usedBufLen) {
    CPlatformWatch watch(callOf("CFStringGetBytes", string));
    CPlatformCall& call = watch.call;
    call.range = range;
    call.encoding = encoding;
    call.lossByte = lossByte;
    call.external = isExternalRepresentation;
    call.buffer = buffer;
    call.room = maxBufLen;
    if (watch.forward())
        call.result =
            __real_CFStringGetBytes(string, range, encoding, lossByte, isExternalRepresentation,
                                    buffer, maxBufLen, &call.used);
    if (buffer != nullptr)
        call.written.assign(reinterpret_cast<char const*>(buffer),
                            static_cast<std::size_t>(call.used));
    if (usedBufLen != nullptr)
        *usedBufLen = call.used;
    return call.result;
}

void __wrap_CFStringNormalize(CFMutableStringRef string, CFStringNormalizationForm form) {
    CPlatformWatch watch(callOf("CFStringNormalize", string));
    watch.call.form = form;
    if (watch.forward())
        __real_CFStringNormalize(string, form);
}

CFComparisonResult __wrap_CFStringCompareWithOptions(CFStringRef string1, CFStringRef string2,
                                                     CFRange range, CFStringCompareFlags options) {
    CPlatformWatch watch(callOf("CFStringCompareWithOptions", string1));
    watch.call.source = string2;
    watch.call.range = range;
    watch.call.options = options;
    CFComparisonResult const result =
        watch.forward() ? __real_CFStringCompareWithOptions(string1, string2, range, options)
                        : kCFCompareEqualTo;
    watch.call.result = result;
    return result;
}

void __wrap_CFStringUppercase(CFMutableStringRef string, CFLocaleRef locale) {
    CPlatformWatch watch(callOf("CFStringUppercase", string));
    watch.call.locale = locale;
    if (watch.forward())
        __real_CFStringUppercase(string, locale);
}

void __wrap_CFStringLowercase(CFMutableStringRef string, CFLocaleRef locale) {
    CPlatformWatch watch(callOf("CFStringLowercase", string));
    watch.call.locale = locale;
    if (watch.forward())
        __real_CFStringLowercase(string, locale);
}

CFLocaleRef __wrap_CFLocaleCopyCurrent(void) {
    CPlatformWatch watch(callOf("CFLocaleCopyCurrent"));
    CFLocaleRef const made = watch.forward() ? __real_CFLocaleCopyCurrent() : nullptr;
    watch.call.object = made;
    return made;
}

CFTypeRef __wrap_CFRetain(CFTypeRef object) {
    CPlatformWatch watch(callOf("CFRetain", object));
    return watch.forward() ? __real_CFRetain(object) : object;
}

void __wrap_CFRelease(CFTypeRef object) {
    CPlatformWatch watch(callOf("CFRelease", object));
    if (watch.forward())
        __real_CFRelease(object);
}
}
