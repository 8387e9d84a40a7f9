/// URLs of files and folders.
///
///     CFURLRef url = CFURLCreateWithFileSystemPath(kCFAllocatorDefault, path,
///                                                  kCFURLPOSIXPathStyle, true);
///     CFStringRef name = CFURLCopyLastPathComponent(url);   // "Dictionary.bundle"
#ifndef QORN_0PLATFORM_CFURL_H
#define QORN_0PLATFORM_CFURL_H

#include <CoreFoundation/CFBase.h>

typedef struct __CFURL const* CFURLRef;

enum CFURLPathStyle : CFIndex { kCFURLPOSIXPathStyle = 0 };

extern "C" {

/// The URL of a path; a relative one counts from the working directory of this moment. Nothing is
/// looked up on the disk. Null for an empty path, for one that no file can have (an embedded zero,
/// an unpaired surrogate), for another path style, and where memory is short. `isDirectory` makes
/// no difference to what is served here.
CFURLRef CFURLCreateWithFileSystemPath(CFAllocatorRef allocator, CFStringRef filePath,
                                       CFURLPathStyle pathStyle, Boolean isDirectory);

/// The text behind the path's last separator, separators at its end aside; "/" for the root.
CFStringRef CFURLCopyLastPathComponent(CFURLRef url);
}

#endif
