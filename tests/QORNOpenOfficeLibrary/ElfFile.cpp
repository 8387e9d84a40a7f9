#include "QORNOpenOfficeLibrary/ElfFile.h"

#include <algorithm>
#include <cstring>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace BridgeTest {
namespace {

void require(bool condition, char const* message) {
    if (!condition)
        throw std::runtime_error(message);
}

} // namespace

CElfFile::CElfFile(std::string const& name) {
    std::ifstream file(name, std::ios::binary);
    require(file.is_open(), "the file can't be opened");
    bytes_.assign(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
    header_ = readTable<ElfW(Ehdr)>(0, sizeof header_).front();
    require(std::memcmp(header_.e_ident, ELFMAG, SELFMAG) == 0, "no ELF file");
    unsigned char const kind = sizeof(void*) == 8 ? ELFCLASS64 : ELFCLASS32;
    require(header_.e_ident[EI_CLASS] == kind, "an ELF file of another word size");
}

std::set<std::string> CElfFile::definedSymbols() const {
    std::set<std::string> names;
    for (auto const& section : sections(SHT_DYNSYM))
        for (auto const& symbol : readTable<ElfW(Sym)>(section.sh_offset, section.sh_size))
            if (symbol.st_shndx != SHN_UNDEF)
                names.insert(readString(section.sh_link, symbol.st_name));
    return names;
}

std::vector<ElfW(Xword)> CElfFile::values(ElfW(Sxword) tag) const {
    std::vector<ElfW(Xword)> found;
    for (auto const& section : sections(SHT_DYNAMIC))
        for (auto const& entry : readTable<ElfW(Dyn)>(section.sh_offset, section.sh_size))
            if (entry.d_tag == tag)
                found.push_back(entry.d_un.d_val);
    return found;
}

std::vector<std::string> CElfFile::strings(ElfW(Sxword) tag) const {
    auto const dynamic = sections(SHT_DYNAMIC);
    require(dynamic.size() == 1, "no dynamic section");
    std::vector<std::string> found;
    for (auto const value : values(tag))
        found.push_back(readString(dynamic.front().sh_link, value));
    return found;
}

std::vector<ElfW(Word)> CElfFile::segmentFlags(ElfW(Word) type) const {
    std::vector<ElfW(Word)> found;
    for (auto const& segment :
         readTable<ElfW(Phdr)>(header_.e_phoff, header_.e_phnum * sizeof(ElfW(Phdr))))
        if (segment.p_type == type)
            found.push_back(segment.p_flags);
    return found;
}

template <class T>
std::vector<T> CElfFile::readTable(std::size_t offset, std::size_t bytes) const {
    require(offset <= bytes_.size() && bytes <= bytes_.size() - offset, "a table beyond the file");
    std::vector<T> table(bytes / sizeof(T));
    std::memcpy(table.data(), bytes_.data() + offset, table.size() * sizeof(T));
    return table;
}

std::vector<ElfW(Shdr)> CElfFile::sections(ElfW(Word) type) const {
    auto table = readTable<ElfW(Shdr)>(header_.e_shoff, header_.e_shnum * sizeof(ElfW(Shdr)));
    table.erase(
        std::remove_if(table.begin(), table.end(),
                       [type](ElfW(Shdr) const& section) { return section.sh_type != type; }),
        table.end());
    return table;
}

std::string CElfFile::readString(ElfW(Word) stringSection, std::size_t offset) const {
    auto const table = readTable<ElfW(Shdr)>(header_.e_shoff, header_.e_shnum * sizeof(ElfW(Shdr)));
    ElfW(Shdr) const& section = table.at(stringSection);
    auto const text = readTable<char>(section.sh_offset, section.sh_size);
    require(offset < text.size() && text.back() == '\0', "a text beyond its table");
    return text.data() + offset;
}

} // namespace BridgeTest
