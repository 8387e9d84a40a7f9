/// The logic behind the native methods. It knows platform strings and the foundation, and nothing
/// of Java.
#ifndef QORN_QORNOOLIBRARY_H
#define QORN_QORNOOLIBRARY_H

#include "2System/FileSys/FileSysFileSpec.h"

#include <CoreFoundation/CoreFoundation.h>

#include <vector>

/// Appends the five folders to the list behind getPaths(), in this order; entries are never
/// removed, sorted or compared. The strings stay the caller's. The flag is accepted and changes
/// nothing: the Java signature has it. Raises the conversion failure for a text that can't be
/// converted, and then the list is as it was. Not for two threads at once.
void initializeLibraryImplMacOS(CFStringRef folder1, CFStringRef folder2, CFStringRef folder3,
                                CFStringRef folder4, CFStringRef folder5, bool flag);

/// The result of the native method: always 0.
int startSuppressingDialogsImpl();

/// All folders that were handed over so far, five a call.
std::vector<FileSys::CFileSpec> const& getPaths();

#endif
