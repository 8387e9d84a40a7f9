/// The system's services that have no C interface common to all platforms: names, standard
/// folders, the hidden flag, bookmark files, modifier keys.
///
///     MacOS::addingPercentEscapes(L"a b/c");   // "a%20b%2Fc"
///
/// Nothing here raises but assertions and text conversion; a service that fails gives false or an
/// empty text. Nothing is cached. Safe on several threads at once as long as no thread changes the
/// environment; on macOS the e-mail address and the modifier keys are for one thread at a time, and
/// the calling thread has an autorelease pool.
#ifndef QORN_1BASE_BASEMACOS_H
#define QORN_1BASE_BASEMACOS_H

#include "1Base/Config/ConfigInt.h"
#include "1Base/Strings/StringsKinds.h"

namespace MacOS {

/// Any other value counts as sftDocuments.
enum TSystemFolderType : Config::Int32 {
    sftPreferences,
    sftDocuments,
    sftSharedUserData,
    sftDesktop,
    sftLibrary,
    sftPrograms,
    sftFonts,
    sftTemporaryItems,
    sftApplicationSupport
};

/// Any other value counts as sfdLocal.
enum TSystemFolderDomain : Config::Int32 { sfdLocal, sfdUser, sfdSystem };

/// Percent-encodes a text for the value of a URL's query: ASCII letters, digits, "-", ".", "_" and
/// "~" stay (RFC 3986, 2.3), all else becomes the percent form of its UTF-8 bytes.
Strings::string addingPercentEscapes(Strings::string const& text);

/// The login name, or the full name.
Strings::string getUserName(bool login);

/// The name that the machine was given for people to read, otherwise its host name.
Strings::string getMachineName();

/// The machine's model as its maker names it, or empty.
Strings::string getModelIdentifier();

/// The user's first e-mail address, or empty.
Strings::string getUserEmailAddress();

/// Whether the user's locale measures in metres.
bool usesMetricSystem();

/// Sets or clears a file's hidden flag; a link is a file of its own. A file system that can't hold
/// the flag counts as success; false for a missing file or one that may not be changed.
bool setHiddenAttribute(Strings::string const& path, bool hidden);

/// Writes a file that leads to `source` and goes on doing so when that is renamed or moved within
/// its volume. False where the source is missing or the file can't be written.
bool createBookmarkFile(Strings::string const& source, Strings::string const& bookmark);

/// Finds what a bookmark file leads to. Where that is not to be found, or the file is no bookmark,
/// false, and `result` stays as it is.
bool resolveBookmarkFile(Strings::string const& bookmark, Strings::string& result);

/// The path of a standard folder, which need not exist. Temporary items ignore the domain and end
/// in a separator. Fails the check "[a count] > 0" where the system knows no such folder.
Strings::string getSpecialFolder(TSystemFolderType type, TSystemFolderDomain domain);

/// @{
/// The modifier keys at this moment; either side's key counts.
bool isShiftPressed();
bool isControlPressed();
bool isOptionPressed();
bool isCmdPressed();
bool isAlphaLockPressed();
/// @}

} // namespace MacOS

#endif
