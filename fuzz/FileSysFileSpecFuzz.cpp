// Paths by their text alone: what the members of a file specification promise of any two paths.
//
// An input is two texts with a byte FF between them, which stands in no UTF-8.

#include "FuzzTexts.h"

#include "1Base/Error/Error.h"
#include "2System/FileSys/FileSysFileSpec.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

namespace {

using FileSys::CFileSpec;
using FuzzTexts::require;

Strings::string textOf(CFileSpec const& spec) {
    return spec.getFullName(false);
}

bool beginsWith(Strings::string const& text, Strings::string const& prefix) {
    return text.compare(0, prefix.size(), prefix) == 0;
}

bool endsWith(Strings::string const& text, Strings::string const& suffix) {
    return text.size() >= suffix.size() &&
           text.compare(text.size() - suffix.size(), suffix.size(), suffix) == 0;
}

void checkComponents(Strings::string const& path) {
    CFileSpec const spec(path);
    Strings::string const file = spec.getFile();
    Strings::string const extension = spec.getFileExtension();
    require(endsWith(path, file) && file.find(L'/') == Strings::string::npos);
    require(beginsWith(path, spec.getPath()));
    require(spec.getPath().empty() == (path.find(L'/') == Strings::string::npos));
    Strings::string const stem = spec.getFileName();
    require(file == (file == stem ? stem : stem + L'.' + extension));

    CFileSpec renamed(path);
    renamed.setFileExtension(L"x", true);
    require(renamed.getFileExtension() == L"x" && renamed.getFileName() == stem);
    renamed.setFileExtension(Strings::string(), true);
    require(renamed.getFile() == stem);
}

void checkJoin(Strings::string const& left, Strings::string const& right) {
    Strings::string const joined = textOf(CFileSpec(left) + right);
    require(endsWith(joined, right));
    if (left.empty() || right.empty()) {
        require(joined == left + right);
        return;
    }
    std::size_t const seam = joined.size() - right.size();
    bool const hasSeparator = joined[seam] == L'/' || (seam > 0 && joined[seam - 1] == L'/');
    require(hasSeparator);
    require(joined.size() + 1 >= left.size() + right.size());
    require(joined.size() <= left.size() + right.size() + 1);
}

void checkRelations(Strings::string const& left, Strings::string const& right) {
    CFileSpec const a(left);
    CFileSpec const b(right);
    Strings::string const base = textOf(a.getBasePath(b));
    require(beginsWith(left, base));
    require(base.empty() || base.back() == L'/' || left == right);
    require(a.getBasePath(a) == a);

    Strings::string const rest = textOf(a.getRelativePath(b));
    if (a.isSubFolderOf(b))
        require(left == right + rest || left == right + L'/' + rest);
    else
        require(rest == left);
}

void checkAbsolute(Strings::string const& absolute, Strings::string const& relative) {
    bool const climbs = beginsWith(relative, L"..") || beginsWith(relative, L"./..");
    try {
        CFileSpec const result =
            CFileSpec::convertRelativeToAbsolutePath(CFileSpec(absolute), CFileSpec(relative));
        if (beginsWith(relative, L"/"))
            require(textOf(result) == relative);
        else if (!climbs)
            require(endsWith(textOf(result),
                             beginsWith(relative, L"./") ? relative.substr(2) : relative));
    } catch (Error::CException const&) {
        require(climbs);
    }
}

void checkFileName(Strings::string const& text) {
    Strings::string const name = CFileSpec::makeFileName(text);
    require(name.size() <= std::min<std::size_t>(text.size(), 255));
    require(name.find_first_of(CFileSpec::getForbiddenChars()) == Strings::string::npos);
    if (text.size() <= 255)
        require(name.find_last_not_of(L" .") + 1 == name.size());
}

void checkAcrobat(std::string const& bytes, Strings::string const& text) {
    CFileSpec const spec = FileSys::createFileSpecFromAcrobatFileSpec(bytes, 0, 0);
    require(textOf(spec).size() <= text.size());
    bool const isPlain = text.find_first_of(Strings::string(L"\\\0", 2)) == Strings::string::npos;
    if (isPlain)
        require(textOf(spec) == (beginsWith(text, L"/") ? text.substr(1) : text));
}

void check(std::string const& first, std::string const& second) {
    Strings::string const left = Encoding::convert<Strings::string>(first);
    Strings::string const right = Encoding::convert<Strings::string>(second);
    checkComponents(left);
    checkJoin(left, right);
    checkRelations(left, right);
    checkAbsolute(left, right);
    checkFileName(left);
    checkAcrobat(first, left);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    auto const [first, second] = FuzzTexts::twoTexts(data, size);
    if (FuzzTexts::isMarkAlone(first) || FuzzTexts::isMarkAlone(second))
        return 0;
    try {
        Encoding::convert<Strings::string>(first);
        Encoding::convert<Strings::string>(second);
    } catch (Error::CException const&) {
        return 0;
    }
    check(first, second);
    return 0;
}
