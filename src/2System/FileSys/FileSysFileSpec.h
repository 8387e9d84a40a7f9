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
#include <list>
#include <string>

namespace FileSys {

class CFileInfo;
class CFileSpec;

namespace Detail {
std::string toSystemText(CFileSpec const& spec);
}

/// One path text, kept unit for unit as the caller gave it. Nothing is resolved, normalised or
/// looked up on a disk but where a member says so: every other operation is a search in the text
/// for the separators. The empty text is the empty specification, and any other text is a valid
/// value. But for the members that say so nothing fails, save for memory and for a narrow text that
/// is not UTF-8.
class CFileSpec {
  public:
    /// The empty specification.
    CFileSpec() = default;

    /// A zero-terminated text, not null.
    CFileSpec(wchar_t const* path) : path_(path) {}

    /// A string of any kind; a narrow one is read as UTF-8.
    template <class TChar, class TTraits, class TAlloc>
    CFileSpec(std::basic_string<TChar, TTraits, TAlloc> const& path)
        : path_(Encoding::convert<Strings::string>(path)) {}

    /// @{
    /// A copy of the text.
    CFileSpec(CFileSpec const&) = default;
    CFileSpec& operator=(CFileSpec const&) = default;
    /// @}

    /// @{
    /// Takes over the text; the source is left empty, which a moved-from string alone is not bound
    /// to be.
    CFileSpec(CFileSpec&& other) noexcept;
    CFileSpec& operator=(CFileSpec&& other) noexcept;
    /// @}

    /// @{
    /// Takes a copy of the text, which is not null.
    CFileSpec& operator=(Strings::string const& path);
    CFileSpec& operator=(wchar_t const* path);
    /// @}

    ~CFileSpec() = default;

    /// @{
    /// Says that a text is a POSIX path. That grammar is the class's own, so nothing is parsed.
    static CFileSpec parseUnixPath(Strings::string const& path);
    static CFileSpec parseUnixPath(std::string const& path);
    /// @}

    /// The text. `forSystemCall` is true where it is about to be handed to the operating system,
    /// false where it is compared, logged or shown; here both are the same text.
    Strings::string getFullName(bool forSystemCall) const;

    /// The text in another string kind: std::string, which is UTF-8, goes to POSIX calls.
    template <class TString>
    TString getFullName([[maybe_unused]] bool forSystemCall) const {
        return Encoding::convert<TString>(path_);
    }

    /// Whether the text is empty.
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

    /// What getPath() gives, as a specification.
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

    /// `relative` made absolute against `absolute`, by its text alone: each ".." that it begins
    /// with climbs one component ("..x" does too), one leading "./" goes, anything further inside
    /// stays. An absolute `relative` comes back unchanged. The root loses its separator: "/" with
    /// "x" is "x". Raises the chain of file information below TExcFileInfo and TExcFileSpec where
    /// it climbs above the start.
    ///
    ///     convertRelativeToAbsolutePath(L"/a/b", L"../c");   // "/a/c"
    static CFileSpec convertRelativeToAbsolutePath(CFileSpec const& absolute,
                                                   CFileSpec const& relative);

    /// The folder that both texts have in common, with its trailing separator; this path itself
    /// where both are equal. A separator here counts as common also where the other text has
    /// another character: "/a/b" against "/a_c" gives "/a/".
    CFileSpec getBasePath(CFileSpec const& other) const;

    /// This text without the prefix `base` and one separator behind it; unchanged where `base` is
    /// no prefix. It knows no components: "/a/bc" against "/a/b" gives "c".
    CFileSpec getRelativePath(CFileSpec const& base) const;

    /// A legal file name of at most 255 characters: forbidden characters become "_", blanks and
    /// dots at the end go, an overlong stem is cut before its last character so that the extension
    /// survives.
    static Strings::string makeFileName(Strings::string const& text);

    /// The process's working directory; empty where it can't be had or takes more than 1023 bytes.
    static CFileSpec getCurrentWorkingDir();

    /// @{
    /// Neither raises; what can't be looked up is not there.
    bool exists() const;
    bool isFolder() const;
    /// @}

    /// Bytes; 0 for a folder and on failure.
    unsigned long long getFileSize() const;

    /// Raises the chain of file information where the path does not exist.
    CFileInfo getFileInfo() const;

    /// Whether the path lies in one of the temporary folders, by isSubFolderOf().
    bool isTemporary() const;

    /// Draws the file's icon: three bytes a pixel in `rgb`, one in `alpha`, row by row. A width of
    /// 0 is set to 512, and the height to the width. False, with both texts empty, where there is
    /// no icon or nothing to draw it with. On macOS for one thread at a time.
    bool getIcon(std::string& rgb, std::string& alpha, int& width, int& height) const;

    /// @{
    /// One character each, the same on every system.
    static wchar_t getPathSeparator() { return L'/'; }
    static wchar_t getExtensionSeparator() { return L'.'; }
    /// @}

    /// The 33 characters that may not stand in a file name: codes 0 to 31, then "/".
    static Strings::string getForbiddenChars();

  private:
    friend std::string Detail::toSystemText(CFileSpec const& spec);
    friend bool operator==(CFileSpec const& left, CFileSpec const& right);
    friend bool operator<(CFileSpec const& left, CFileSpec const& right);

    Strings::string path_;
};

/// Equal texts: case, composition and a trailing separator matter.
bool operator==(CFileSpec const& left, CFileSpec const& right);

/// By code point over the shorter text, then the shorter first.
bool operator<(CFileSpec const& left, CFileSpec const& right);

/// A copy, joined as by operator+=().
CFileSpec operator+(CFileSpec left, Strings::string const& right);

/// A path from the file specification of a PDF (ISO 32000, 7.11.2): backslash escapes resolved, and
/// without its leading separator. The two numbers change nothing here.
CFileSpec createFileSpecFromAcrobatFileSpec(std::string const& text, int a, int b);

/// Removes all but the first of equal entries, and with `removeMissing` those that do not exist.
void cleanFileSpecList(std::list<CFileSpec>& specs, bool removeMissing);

/// Writes the text.
std::basic_ostream<wchar_t>& operator<<(std::basic_ostream<wchar_t>& stream, CFileSpec const& spec);

} // namespace FileSys

#endif
