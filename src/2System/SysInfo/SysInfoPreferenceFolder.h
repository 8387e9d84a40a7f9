/// A small persistent store of named byte values: a folder with a file for each.
///
///     using Prefs = SysInfo::CPreferenceFolder;
///     Prefs prefs(SysInfo::CSystemPrefs::ekUser, SysInfo::CSystemPrefs::erWrite,
///                 SysInfo::CSystemPrefsPath("Acme/Editor"), true, nullptr);
///     prefs.setValue(SysInfo::CSystemPrefsPath("Window"), "size", {80, 25});
///     SysInfo::TByteVector size;
///     prefs.getValue(SysInfo::CSystemPrefsPath("Window"), "size", size);   // {80, 25}
///     // the two bytes of .../Library/Preferences/Acme/Editor/Window/size
#ifndef QORN_2SYSTEM_SYSINFOPREFERENCEFOLDER_H
#define QORN_2SYSTEM_SYSINFOPREFERENCEFOLDER_H

#include "1Base/BaseMacOS/BaseMacOSAuthorization.h"
#include "1Base/Strings/StringsKinds.h"
#include "2System/FileSys/FileSysFileSpec.h"
#include "2System/SysInfo/SysInfoSystemPrefs.h"

#include <string>
#include <vector>

namespace SysInfo {

/// A value's content.
using TByteVector = std::vector<unsigned char>;

/// May be null.
using TAuthorization = MacOS::CAuthorizationBase*;

/// A store below the user's or the machine's preference folder. The file system is all the format
/// there is: a path is a folder, a key is a file's name as it stands (a separator or ".." in it
/// leads where it leads), and a value is that file's whole content. Nothing is read ahead or kept
/// back.
///
/// Keys and paths are UTF-8; a malformed one raises TExcEncoding.
///
/// Writing goes one of two roads:
///
/// - Without an authorization, or while that says no, the file is rewritten in place. A crash in
///   between leaves a short or empty value, and a reader can see one.
/// - With one that says yes the value is written to a file in the temporary folder, which the
///   authorization's "/bin/mv" puts in its place. Where both folders lie on one volume a reader
///   sees the old value or the new one, whole. Two processes that write at the same moment can pick
///   the same temporary file: writers of one temporary folder must take turns, by a lock of their
///   own.
///
/// On both roads the file is hidden and made readable and writable by all. A value that does not
/// fit on the disk is stored short, and nothing tells the caller.
///
/// No locks: an object may be used on several threads as far as the files and the authorization
/// allow.
class CPreferenceFolder {
  public:
    /// @{
    /// See CSystemPrefs.
    using TKind = CSystemPrefs::EKind;
    using TRight = CSystemPrefs::ERight;
    /// @}

    /// Opens the store `path` of the given kind; the right changes nothing here. With `create` a
    /// folder that is missing is made, without it it may stay missing. The authorization is not
    /// owned and must outlive this object. Fails a check for a kind that is none.
    CPreferenceFolder(TKind kind, TRight right, CSystemPrefsPath const& path, bool create,
                      TAuthorization authorization);

    /// Reads a value into `value`, which it returns. Where there is no such file, or it can't be
    /// opened, `value` stays as it is; an empty file makes it empty. A folder reads as an empty
    /// value.
    TByteVector& getValue(CSystemPrefsPath const& path, std::string const& key,
                          TByteVector& value) const;

    /// Writes a value, after the folders that are missing on its path. Raises TExcFileSpec for a
    /// folder that can't be made, TExcPreferenceFolder for a file that can't be opened or hidden,
    /// TExcStdLibException for permissions that can't be changed, as those of another user's file,
    /// whose content has changed by then. Fails a check where the authorization's "/bin/mv" fails;
    /// the temporary file then stays.
    void setValue(CSystemPrefsPath const& path, std::string const& key, TByteVector const& value);

    /// Removes a path with all in it, or all of the store for the empty path. A failure is logged,
    /// and the function returns normally. Never uses the authorization.
    void deleteKey(CSystemPrefsPath const& path);

    /// Removes one value; a missing one is no failure. Raises TExcPreferenceFolder, which wraps the
    /// file system's exception. Never uses the authorization.
    void deleteValue(CSystemPrefsPath const& path, std::string const& key);

    /// The names of the values directly in the store's folder, sorted; none for a missing folder.
    std::vector<Strings::stringUTF8> getValues() const;

    /// The very same names, of values and not of paths, as wide text.
    std::vector<Strings::string> getPaths() const;

  private:
    FileSys::CFileSpec folder_;
    TAuthorization authorization_;
};

} // namespace SysInfo

#endif
