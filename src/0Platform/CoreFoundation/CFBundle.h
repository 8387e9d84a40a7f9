/// Bundles: folders that hold code and tell about it.
///
///     Dictionary.bundle/Contents/Info.plist         name, version, name of the executable
///     Dictionary.bundle/Contents/Linux/Dictionary   the executable, a shared library
///
///     CFBundleRef bundle = CFBundleCreate(kCFAllocatorDefault, url);
///     void* function = CFBundleGetFunctionPointerForName(bundle, functionName);
///     CFBundleUnloadExecutable(bundle);
///     CFRelease(bundle);
///
/// The executable has the name that Info.plist gives by "CFBundleExecutable", else the folder's
/// name without its extension, and lies in Contents/Linux or, where that has none, Contents/MacOS.
///
/// One bundle may be used on several threads at once, but for the last release.
#ifndef QORN_0PLATFORM_CFBUNDLE_H
#define QORN_0PLATFORM_CFBUNDLE_H

#include <CoreFoundation/CFBase.h>
#include <CoreFoundation/CFURL.h>

typedef struct __CFBundle* CFBundleRef;

extern "C" {

/// Keys of Info.plist: "CFBundleName" and "CFBundleVersion".
extern CFStringRef const kCFBundleNameKey;
extern CFStringRef const kCFBundleVersionKey;

/// The bundle of a folder, whatever lies in that; an Info.plist that is missing or broken counts as
/// empty. Null for what is no folder, and where memory is short. Each call makes a bundle of its
/// own, which shows Info.plist as it is now.
CFBundleRef CFBundleCreate(CFAllocatorRef allocator, CFURLRef bundleURL);

/// The value of a key of Info.plist, in XML or binary form, or null. It belongs to the bundle. Only
/// texts are served, and no translations of them.
CFTypeRef CFBundleGetValueForInfoDictionaryKey(CFBundleRef bundle, CFStringRef key);

/// The executable, or null where there is no such file.
CFURLRef CFBundleCopyExecutableURL(CFBundleRef bundle);

/// Loads the executable unless this bundle has done so, with symbols bound at their first use and
/// kept from other libraries. True where it is loaded then.
Boolean CFBundleLoadExecutable(CFBundleRef bundle);

/// Undoes the one load. The last release does so too.
void CFBundleUnloadExecutable(CFBundleRef bundle);

/// The address of a function, or null; loads the executable where it is not.
void* CFBundleGetFunctionPointerForName(CFBundleRef bundle, CFStringRef functionName);
}

#endif
