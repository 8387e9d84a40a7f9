/// The value that names a file or folder.
///
///     FileSys::CFileSpec spec(L"/home/ada/letter.odt");
///     spec.getParentFolder();   // "/home/ada"
///     spec.getFileName();       // "letter"
///     spec + L"draft";          // "/home/ada/letter.odt/draft"
#ifndef QORN_2SYSTEM_FILESYSFILESPEC_H
#define QORN_2SYSTEM_FILESYSFILESPEC_H

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Strings/StringsKinds.h"

#include <iosfwd>
#include <string>

namespace FileSys {

/// One path text, kept unit for unit as the caller gave it. Nothing is resolved, normalised or
/// looked up on a disk: every operation is a search in the text for the separators. The empty text
/// is the empty specification, and any other text is a valid value. Nothing here fails, but for
/// memory and for a narrow text that is not UTF-8.
class CFileSpec {
  public:
    CFileSpec() = default;
    CFileSpec(wchar_t const* path) : path_(path) {}

    /// A string of any kind; a narrow one is read as UTF-8.
    template <class TChar, class TTraits, class TAlloc>
    CFileSpec(std::basic_string<TChar, TTraits, TAlloc> const& path)
        : path_(Encoding::convert<Strings::string>(path)) {}

    CFileSpec(CFileSpec const&) = default;
    CFileSpec& operator=(CFileSpec const&) = default;

    /// Takes over the text; the source is left empty, which a moved-from string alone is not bound
    /// to be.
    CFileSpec(CFileSpec&& other) noexcept;
    CFileSpec& operator=(CFileSpec&& other) noexcept;

    CFileSpec& operator=(Strings::string const& path);
    CFileSpec& operator=(wchar_t const* path);

    ~CFileSpec() = default;

    /// Says that a text is a POSIX path. That grammar is the class's own, so nothing is parsed.
    static CFileSpec parseUnixPath(Strings::string const& path);
    static CFileSpec parseUnixPath(std::string const& path);

    /// The text. `forSystemCall` is true where it is about to be handed to the operating system,
    /// false where it is compared, logged or shown; here both are the same text.
    Strings::string getFullName(bool forSystemCall) const;

    /// The text in another string kind: std::string, which is UTF-8, goes to POSIX calls.
    template <class TString>
    TString getFullName(bool forSystemCall) const {
        return Encoding::convert<TString>(getFullName(forSystemCall));
    }

    bool empty() const { return path_.empty(); }

    /// The text before the last separator; "/" where that separator is the first character, and
    /// empty where there is none.
    Strings::string getPath() const;

    /// The text behind the last separator; empty where the text ends in one.
    Strings::string getFile() const;

    /// The last component without its extension: empty for ".profile", whose extension is
    /// "profile".
    Strings::string getFileName() const;

    /// The text behind the last dot of the last component; a dot in a folder's name never counts.
    Strings::string getFileExtension() const;

    CFileSpec getParentFolder() const;

    /// True where this text begins with the whole of the other's. It is a prefix of text and knows
    /// no components: "/tmpfoo" is below "/tmp", and a path is below itself. Everything is below
    /// the empty specification.
    bool isSubFolderOf(CFileSpec const& other) const;

    /// With `replace` true the extension becomes `extension`, or goes with its dot where that is
    /// empty. With `replace` false a dot and `extension` are appended, an empty one included.
    void setFileExtension(Strings::string const& extension, bool replace);

    /// Joins with one separator, where each side has at most one at the seam. An empty side adds
    /// none.
    CFileSpec& operator+=(Strings::string const& name);

    static wchar_t getPathSeparator() { return L'/'; }
    static wchar_t getExtensionSeparator() { return L'.'; }

    /// The 33 characters that may not stand in a file name: codes 0 to 31, then "/".
    static Strings::string getForbiddenChars();

  private:
    Strings::string path_;
};

/// Equal texts: case, composition and a trailing separator matter.
bool operator==(CFileSpec const& left, CFileSpec const& right);

/// By code point over the shorter text, then the shorter first.
bool operator<(CFileSpec const& left, CFileSpec const& right);

CFileSpec operator+(CFileSpec left, Strings::string const& right);

std::basic_ostream<wchar_t>& operator<<(std::basic_ostream<wchar_t>& stream, CFileSpec const& spec);

} // namespace FileSys

#endif
