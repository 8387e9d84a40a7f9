/// Operations that change the file system.
///
///     FileSys::copyFile(L"/home/ada/a.txt", L"/home/ada/new/b.txt", false);
///
/// Failures raise TExcFileSpec, or the more special chain of file operations below it; the members'
/// texts say which. Two threads that work on the same paths race as two processes would: a test
/// followed by work is not atomic.
#ifndef QORN_2SYSTEM_FILESYSOPERATIONS_H
#define QORN_2SYSTEM_FILESYSOPERATIONS_H

#include "1Base/Strings/StringsKinds.h"
#include "2System/FileSys/FileSysFileSpec.h"

namespace FileSys {

/// Makes the folder and its missing parents. One that exists is no failure.
void createFolder(CFileSpec const& folder);

/// Deletes a file or folder, a folder that is not empty only with `recursive`. A path that does not
/// exist is no failure.
void deleteFile(CFileSpec const& spec, bool recursive);

/// Sets the hidden flag, whose failure is ignored, and the owner's write permission. Raises
/// TExcStdLibException where the permission can't be changed.
void setFileAttributes(CFileSpec const& spec, bool hidden, bool readOnly);

/// @{
/// Copies a file or a folder with all in it, making missing folders. Where a file is there already
/// and `overwrite` is false, that file stays, and nothing tells the caller. A failure stops the
/// copy where it stands; what was copied stays. Within a folder links are followed, and special
/// files and dangling links are left out. A file onto itself under another name fails and is whole.
void copyFile(CFileSpec const& from, CFileSpec const& to, bool overwrite);
void copyFileToFolder(CFileSpec const& from, CFileSpec const& folder, bool overwrite);
/// @}

/// @{
/// Moves a file or folder. What stands in the place of `to` is deleted first, for good, or without
/// `overwrite` makes the move fail. Across volumes a file is copied and deleted; a folder can't go
/// that way and raises.
void moveFile(CFileSpec const& from, CFileSpec const& to, bool overwrite);
void moveFileToFolder(CFileSpec const& from, CFileSpec const& folder, bool overwrite);
/// @}

/// Whether the file opens with this std::ios_base::openmode. A file that came to be by the attempt
/// is removed again; one that was there is truncated where the mode says so.
bool canOpen(CFileSpec const& spec, unsigned int mode);

/// canOpen() for reading.
bool canRead(CFileSpec const& spec);

/// Writes a bookmark file, which goes on leading to `source` when that is renamed.
void createAliasFile(CFileSpec const& alias, CFileSpec const& source);

/// Finds what a bookmark file leads to. Where it fails `result` is empty, and nothing is raised.
bool resolveAlias(CFileSpec const& alias, CFileSpec& result);

/// Gives a file the extension `type` by renaming it, and returns its new path; an empty type does
/// nothing. Never overwrites.
CFileSpec setFileType(CFileSpec const& spec, Strings::string const& type);

/// Changes `spec` to the first name `stem_number.extension` that does not exist, counting from the
/// number that the name has already, or from 1. False, and nothing changed, where `spec` itself
/// does not exist. The name is not reserved.
///
///     indexFile(spec, 3);   // "a.txt" becomes "a_001.txt"
bool indexFile(CFileSpec& spec, unsigned int digits);

} // namespace FileSys

#endif
