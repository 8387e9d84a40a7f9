#include "2System/FileSys/FileSysFileSpec.h"

#include "1Base/Error/ErrorMacros.h"

#include <ostream>
#include <utility>

namespace FileSys {
namespace {

constexpr std::size_t notFound = Strings::string::npos;

std::size_t findLastPathSep(Strings::string const& text) {
    return text.rfind(CFileSpec::getPathSeparator());
}

// The search stops at the last component, so that a folder's dot is never found.
std::size_t findLastExtSep(Strings::string const& text) {
    wchar_t const separators[] = {CFileSpec::getExtensionSeparator(),
                                  CFileSpec::getPathSeparator()};
    std::size_t const position = text.find_last_of(separators, notFound, 2);
    if (position == notFound || text[position] == CFileSpec::getPathSeparator())
        return notFound;
    return position;
}

} // namespace

CFileSpec::CFileSpec(CFileSpec&& other) noexcept : path_(std::move(other.path_)) {
    other.path_.clear();
}

CFileSpec& CFileSpec::operator=(CFileSpec&& other) noexcept {
    if (this != &other) {
        path_ = std::move(other.path_);
        other.path_.clear();
    }
    return *this;
}

CFileSpec& CFileSpec::operator=(Strings::string const& path) {
    path_ = path;
    return *this;
}

CFileSpec& CFileSpec::operator=(wchar_t const* path) {
    path_ = path;
    return *this;
}

CFileSpec CFileSpec::parseUnixPath(Strings::string const& path) {
    return CFileSpec(path);
}

CFileSpec CFileSpec::parseUnixPath(std::string const& path) {
    return CFileSpec(path);
}

Strings::string CFileSpec::getFullName(bool) const {
    return path_;
}

Strings::string CFileSpec::getPath() const {
    ERROR_BLOCK_BEGIN
    std::size_t const position = findLastPathSep(path_);
    if (position == notFound)
        return Strings::string();
    // The root keeps its separator.
    return path_.substr(0, position == 0 ? 1 : position);
    ERROR_BLOCK_END
}

Strings::string CFileSpec::getFile() const {
    ERROR_BLOCK_BEGIN
    std::size_t const position = findLastPathSep(path_);
    return position == notFound ? path_ : path_.substr(position + 1);
    ERROR_BLOCK_END
}

Strings::string CFileSpec::getFileName() const {
    ERROR_BLOCK_BEGIN
    Strings::string const file = getFile();
    return file.substr(0, findLastExtSep(file));
    ERROR_BLOCK_END
}

Strings::string CFileSpec::getFileExtension() const {
    ERROR_BLOCK_BEGIN
    std::size_t const position = findLastExtSep(path_);
    return position == notFound ? Strings::string() : path_.substr(position + 1);
    ERROR_BLOCK_END
}

CFileSpec CFileSpec::getParentFolder() const {
    return CFileSpec(getPath());
}

bool CFileSpec::isSubFolderOf(CFileSpec const& other) const {
    return path_.compare(0, other.path_.size(), other.path_) == 0;
}

void CFileSpec::setFileExtension(Strings::string const& extension, bool replace) {
    ERROR_BLOCK_BEGIN
    std::size_t const position = replace ? findLastExtSep(path_) : notFound;
    if (position != notFound)
        path_.erase(position);
    if (!replace || !extension.empty())
        path_ += getExtensionSeparator() + extension;
    ERROR_BLOCK_END
}

CFileSpec& CFileSpec::operator+=(Strings::string const& name) {
    if (!path_.empty() && !name.empty()) {
        bool const begins = name.front() == getPathSeparator();
        if (begins && path_.back() == getPathSeparator())
            path_.pop_back();
        if (!begins && path_.back() != getPathSeparator())
            path_ += getPathSeparator();
    }
    path_ += name;
    return *this;
}

Strings::string CFileSpec::getForbiddenChars() {
    Strings::string characters;
    for (wchar_t code = 0; code < 32; ++code)
        characters += code;
    return characters + getPathSeparator();
}

bool operator==(CFileSpec const& left, CFileSpec const& right) {
    return left.path_ == right.path_;
}

bool operator<(CFileSpec const& left, CFileSpec const& right) {
    return left.path_ < right.path_;
}

CFileSpec operator+(CFileSpec left, Strings::string const& right) {
    left += right;
    return left;
}

std::basic_ostream<wchar_t>& operator<<(std::basic_ostream<wchar_t>& stream,
                                        CFileSpec const& spec) {
    return stream << spec.getFullName(false);
}

} // namespace FileSys
