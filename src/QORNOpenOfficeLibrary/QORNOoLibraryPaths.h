/// The folders that Java handed over.
///
///     for (FileSys::CFileSpec const& folder : getPaths())
///         folder.getFullName(false);   // L"/home/ada", then L"/home/ada/Desktop", ...
#ifndef QORN_QORNOPENOFFICELIBRARY_QORNOOLIBRARYPATHS_H
#define QORN_QORNOPENOFFICELIBRARY_QORNOOLIBRARYPATHS_H

#include "2System/FileSys/FileSysFileSpec.h"

#include <vector>

/// All folders of the process so far: five for each call of initializeLibrary, in the order of its
/// arguments, empty and equal ones included. Entries are never removed, sorted or compared, and
/// live until the process ends. It is always the same list; a call of initializeLibrary may move
/// its entries in memory, so references into it hold only until the next. There is no lock.
std::vector<FileSys::CFileSpec> const& getPaths();

#endif
