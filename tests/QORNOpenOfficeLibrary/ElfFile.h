/// What a shared library says of itself to the dynamic linker (System V ABI, chapters 4 and 5).
///
///     CElfFile const file("libQORNOpenOffice.jnilib");
///     file.definedSymbols();   // "Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion", ...
///     file.strings(DT_NEEDED);   // "libstdc++.so.6", ...
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_ELFFILE_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_ELFFILE_H

#include <link.h>

#include <set>
#include <string>
#include <vector>

namespace BridgeTest {

/// A whole ELF file of this machine's kind in memory. Raises std::runtime_error for a file that
/// can't be read, is no such file, or points outside itself.
class CElfFile {
  public:
    explicit CElfFile(std::string const& name);

    /// The names in the dynamic symbol table that the file defines: what `nm -D --defined-only`
    /// shows.
    std::set<std::string> definedSymbols() const;

    /// The values of the dynamic entries with this tag.
    std::vector<ElfW(Xword)> values(ElfW(Sxword) tag) const;

    /// The same for entries that point to a text.
    std::vector<std::string> strings(ElfW(Sxword) tag) const;

    /// The flags of the program headers of this type, one entry each.
    std::vector<ElfW(Word)> segmentFlags(ElfW(Word) type) const;

  private:
    template <class T>
    std::vector<T> readTable(std::size_t offset, std::size_t bytes) const;
    std::vector<ElfW(Shdr)> sections(ElfW(Word) type) const;
    std::string readString(ElfW(Word) stringSection, std::size_t offset) const;

    std::vector<char> bytes_;
    ElfW(Ehdr) header_;
};

} // namespace BridgeTest

#endif
