#include "2System/FileSys/FileSysFileSpec.h"

#include "1Base/Error/ErrorMacros.h"
#include "2System/FileSys/_Imp/FileSysFileSpecExc.h"

#include <algorithm>
#include <cstddef>
#include <string>

namespace FileSys {
namespace {

constexpr std::size_t notFound = Strings::string::npos;
constexpr std::size_t longestFileName = 255;

bool areSeparators(wchar_t left, wchar_t right) {
    return left == CFileSpec::getPathSeparator() && right == CFileSpec::getPathSeparator();
}

// Without runs of separators and without one at the end: the root becomes empty.
Strings::string stripSeparators(Strings::string text) {
    text.erase(std::unique(text.begin(), text.end(), areSeparators), text.end());
    if (!text.empty() && text.back() == CFileSpec::getPathSeparator())
        text.pop_back();
    return text;
}

bool beginsWith(Strings::string const& text, Strings::string const& prefix) {
    return text.compare(0, prefix.size(), prefix) == 0;
}

// Two dots are a step upward whatever follows them: of "..x/y" there remains "/y".
constexpr wchar_t stepUp[] = L"..";
constexpr std::size_t stepUpSize = 3;

// What was put in is searched again together with what stood before it.
void replaceAll(Strings::string& text, Strings::string const& from, Strings::string const& to) {
    std::size_t start = 0;
    while ((start = text.find(from, start)) != notFound) {
        text.replace(start, from.size(), to);
        start -= std::min(start, from.size() - 1);
    }
}

Strings::string cutFileName(Strings::string name) {
    std::size_t const size = name.size();
    std::size_t const dot = name.rfind(CFileSpec::getExtensionSeparator());
    std::size_t const excess = size - longestFileName;
    if (dot == notFound || dot <= excess + 1)
        return name.substr(0, longestFileName);
    // The character before the dot stays.
    return name.erase(dot - 1 - excess, excess);
}

} // namespace

CFileSpec CFileSpec::convertRelativeToAbsolutePath(CFileSpec const& absolute,
                                                   CFileSpec const& relative) {
    ERROR_BLOCK_BEGIN
    CFileSpec const fsAbs = parseUnixPath(absolute.getFullName(false));
    CFileSpec fsRel = parseUnixPath(relative.getFullName(false));
    ERROR_LOG(TLoggerSpecFileInfo, Error::TTgtLogger, Error::TSevDebug,
              "convertRelativeToAbsolutePath fsAbs", ERROR_PARAM(fsAbs));
    ERROR_LOG(TLoggerSpecFileInfo, Error::TTgtLogger, Error::TSevDebug,
              "convertRelativeToAbsolutePath fsRel", ERROR_PARAM(fsRel));

    Strings::string rel = fsRel.getFullName(false);
    if (!rel.empty() && rel.front() == getPathSeparator())
        return fsRel;

    Strings::string abs = stripSeparators(fsAbs.getFullName(false));
    if (beginsWith(rel, L"./"))
        rel.erase(0, 2);
    while (beginsWith(rel, stepUp)) {
        if (abs.empty()) {
            std::string const args = "absolute path: " + absolute.getFullName<std::string>(false) +
                                     "relative path: " + relative.getFullName<std::string>(false);
            ERROR_THROW(TExcSpecFileInfo, Error::msgOSCallArgs,
                        ERROR_PARAMS(
                            Error::buildNamedParameter("function", "convertRelativeToAbsolutePath"),
                            Error::buildNamedParameter(
                                "error", "relative path is longer as the absolute one"),
                            ERROR_PARAM(args)));
        }
        abs = CFileSpec(abs).getPath();
        rel.erase(0, stepUpSize);
    }

    CFileSpec fs = CFileSpec(abs) + rel;
    ERROR_LOG(TLoggerSpecFileInfo, Error::TTgtLogger, Error::TSevDebug,
              "convertRelativeToAbsolutePath", ERROR_PARAM(fs));
    return fs;
    ERROR_BLOCK_END
}

CFileSpec CFileSpec::getBasePath(CFileSpec const& other) const {
    ERROR_BLOCK_BEGIN
    Strings::string const& theirs = other.path_;
    std::size_t const common = std::min(path_.size(), theirs.size());
    std::size_t base = 0;
    for (std::size_t i = 0; i < common; ++i) {
        // A separator counts before it is compared.
        if (path_[i] == getPathSeparator())
            base = i + 1;
        if (path_[i] != theirs[i])
            return CFileSpec(path_.substr(0, base));
    }
    if (path_.size() == theirs.size())
        return *this;
    return CFileSpec(path_.substr(0, base));
    ERROR_BLOCK_END
}

CFileSpec CFileSpec::getRelativePath(CFileSpec const& base) const {
    ERROR_BLOCK_BEGIN
    if (!beginsWith(path_, base.path_))
        return *this;
    Strings::string rest = path_.substr(base.path_.size());
    if (!rest.empty() && rest.front() == getPathSeparator())
        rest.erase(0, 1);
    return CFileSpec(rest);
    ERROR_BLOCK_END
}

Strings::string CFileSpec::makeFileName(Strings::string const& text) {
    ERROR_BLOCK_BEGIN
    Strings::string const forbidden = getForbiddenChars();
    Strings::string name = text;
    std::replace_if(
        name.begin(), name.end(),
        [&](wchar_t character) { return forbidden.find(character) != notFound; }, L'_');
    name.erase(name.find_last_not_of(L" .") + 1);
    return name.size() <= longestFileName ? name : cutFileName(name);
    ERROR_BLOCK_END
}

CFileSpec createFileSpecFromAcrobatFileSpec(std::string const& text, int, int) {
    ERROR_BLOCK_BEGIN
    // Two characters that no path has.
    Strings::string const marker(2, L'\0');
    Strings::string path = Encoding::convert<Strings::string>(text);
    replaceAll(path, L"\\\\", marker);
    replaceAll(path, marker, L"\\");
    // A backslash from the step before is consumed as well.
    replaceAll(path, L"\\/", marker);
    replaceAll(path, marker, L"/");
    if (!path.empty() && path.front() == CFileSpec::getPathSeparator())
        path.erase(0, 1);
    return CFileSpec(path);
    ERROR_BLOCK_END
}

} // namespace FileSys
