#include "0Platform/CoreFoundation/_Imp/CFCodec.h"
#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"

#include <cstdlib>
#include <cstring>
#include <new>

using namespace CFPlatform;

namespace {

void finalizeNothing(Object&) {}

void finalizeMutable(Object& object) {
    std::free(static_cast<__CFString&>(object).units);
}

void copyUnits(UniChar* target, UniChar const* source, CFIndex count) {
    if (count > 0)
        std::memcpy(target, source, static_cast<std::size_t>(count) * sizeof(UniChar));
}

} // namespace

namespace CFPlatform {

__CFString* createString(CFIndex capacity) {
    std::size_t const bytes =
        sizeof(__CFString) + static_cast<std::size_t>(capacity) * sizeof(UniChar);
    void* const memory = CFObjectAllocate_(bytes);
    if (memory == nullptr)
        return nullptr;
    auto* const units = reinterpret_cast<UniChar*>(static_cast<char*>(memory) + sizeof(__CFString));
    return new (memory) __CFString(finalizeNothing, units, 0);
}

UniChar* allocateUnits(CFIndex count) {
    // Never zero bytes: malloc(0) may answer null, which here means that memory is short.
    void* const memory = std::malloc((static_cast<std::size_t>(count) + 1) * sizeof(UniChar));
    if (memory == nullptr)
        std::abort();
    return static_cast<UniChar*>(memory);
}

void replaceUnits(__CFString& string, UniChar* units, CFIndex count) {
    std::free(string.units);
    string.units = units;
    string.length = count;
}

} // namespace CFPlatform

extern "C" CFStringRef CFStringCreateWithBytes(CFAllocatorRef, UInt8 const* bytes, CFIndex numBytes,
                                               CFStringEncoding encoding, Boolean) {
    Codec const* const codec = findCodec(encoding);
    if (codec == nullptr)
        return nullptr;
    __CFString* const string = createString(codec->maximumUnits(bytes, numBytes));
    if (string == nullptr)
        return nullptr;
    string->length = codec->decode(bytes, numBytes, string->units);
    if (string->length >= 0)
        return string;
    CFRelease(string);
    return nullptr;
}

extern "C" CFStringRef CFStringCreateWithCharacters(CFAllocatorRef, UniChar const* characters,
                                                    CFIndex numChars) {
    __CFString* const string = createString(numChars);
    if (string == nullptr)
        return nullptr;
    copyUnits(string->units, characters, numChars);
    string->length = numChars;
    return string;
}

extern "C" CFStringRef CFStringCreateWithPascalString(CFAllocatorRef allocator,
                                                      ConstStr255Param pascalString,
                                                      CFStringEncoding encoding) {
    return CFStringCreateWithBytes(allocator, pascalString + 1, pascalString[0], encoding, false);
}

extern "C" CFMutableStringRef CFStringCreateMutableCopy(CFAllocatorRef, CFIndex,
                                                        CFStringRef string) {
    void* const memory = CFObjectAllocate_(sizeof(__CFString));
    if (memory == nullptr)
        return nullptr;
    UniChar* const units = allocateUnits(string->length);
    copyUnits(units, string->units, string->length);
    return new (memory) __CFString(finalizeMutable, units, string->length);
}

extern "C" CFIndex CFStringGetLength(CFStringRef string) {
    return string->length;
}

extern "C" UniChar const* CFStringGetCharactersPtr(CFStringRef string) {
    return string->units;
}

extern "C" void CFStringGetCharacters(CFStringRef string, CFRange range, UniChar* buffer) {
    copyUnits(buffer, string->units + range.location, range.length);
}

extern "C" CFIndex CFStringGetBytes(CFStringRef string, CFRange range, CFStringEncoding encoding,
                                    UInt8 lossByte, Boolean, UInt8* buffer, CFIndex maxBufLen,
                                    CFIndex* usedBufLen) {
    Codec const* const codec = findCodec(encoding);
    Encoded encoded = {0, 0};
    if (codec != nullptr)
        encoded = codec->encode(
            {string->units + range.location, range.length, lossByte, buffer, maxBufLen});
    if (usedBufLen != nullptr)
        *usedBufLen = encoded.bytes;
    return encoded.units;
}
