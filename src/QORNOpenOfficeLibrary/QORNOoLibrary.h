/// The logic behind the native methods. It is called with platform strings and knows nothing of
/// Java; its callers need to know nothing of the foundation.
///
///     initializeLibraryImplMacOS(home, desktop, documents, temporary, working, true);
///     getPaths().size();   // 5; see QORNOoLibraryPaths.h
#ifndef QORN_QORNOPENOFFICELIBRARY_QORNOOLIBRARY_H
#define QORN_QORNOPENOFFICELIBRARY_QORNOOLIBRARY_H

#include <CoreFoundation/CoreFoundation.h>

/// Appends the five folders to the list behind getPaths(), in this order. The strings stay the
/// caller's. The flag is accepted because the Java signature has it; true and false do the same.
///
/// Raises the conversion failure for a string that can't be read, and a failed check for a null
/// one; either way before anything is appended. Where memory runs out while the five are appended,
/// those that already were stay in the list. Not for two threads at once.
void initializeLibraryImplMacOS(CFStringRef folder1, CFStringRef folder2, CFStringRef folder3,
                                CFStringRef folder4, CFStringRef folder5, bool flag);

/// The result of the native method startSuppressingDialogs: always 0.
int startSuppressingDialogsImpl();

#endif
