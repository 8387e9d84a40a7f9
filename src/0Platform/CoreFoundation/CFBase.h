/// Basic types of CoreFoundation, and reference counting.
#ifndef QORN_0PLATFORM_CFBASE_H
#define QORN_0PLATFORM_CFBASE_H

typedef unsigned char Boolean;
typedef unsigned char UInt8;
typedef signed char SInt8;
typedef unsigned short UInt16;
typedef signed short SInt16;
typedef unsigned int UInt32;
typedef signed int SInt32;
typedef UInt16 UniChar;
typedef unsigned char* StringPtr;
typedef unsigned char const* ConstStringPtr;
typedef unsigned char Str255[256];
typedef unsigned char const* ConstStr255Param;

typedef long CFIndex;
typedef unsigned long CFOptionFlags;
typedef void const* CFTypeRef;
typedef struct __CFAllocator const* CFAllocatorRef;
typedef struct __CFString const* CFStringRef;
typedef struct __CFString* CFMutableStringRef;

enum CFComparisonResult : CFIndex {
    kCFCompareLessThan = -1L,
    kCFCompareEqualTo = 0,
    kCFCompareGreaterThan = 1
};

struct CFRange {
    CFIndex location;
    CFIndex length;
};

inline CFRange CFRangeMake(CFIndex location, CFIndex length) {
    CFRange const range = {location, length};
    return range;
}

extern "C" {

/// The allocator behind every object: the C library's heap. It is null, as in the framework, and
/// no other allocator exists here.
extern CFAllocatorRef const kCFAllocatorDefault;

/// The release of the framework whose behaviour is shown (the one of macOS 10.15). No constant: the
/// framework declares it so.
extern double kCFCoreFoundationVersionNumber;

/// Adds one owner and returns the object. A null object ends the process.
CFTypeRef CFRetain(CFTypeRef object);

/// Takes one owner away and frees the object with the last. A null object ends the process.
void CFRelease(CFTypeRef object);

/// The number of owners.
CFIndex CFGetRetainCount(CFTypeRef object);
}

#endif
