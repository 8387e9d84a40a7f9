#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"

#include <algorithm>
#include <cstddef>
#include <cstdlib>
#include <memory>
#include <vector>

namespace MacOS {
namespace Native {
namespace {

using TNames = std::vector<std::string>;

// The names between separators, without empty ones and ".".
TNames namesOf(std::string const& path) {
    TNames names;
    for (std::size_t begin = 0; begin < path.size();) {
        std::size_t const end = std::min(path.find('/', begin), path.size());
        std::string name = path.substr(begin, end - begin);
        if (!name.empty() && name != ".")
            names.push_back(std::move(name));
        begin = end + 1;
    }
    return names;
}

std::string fromRoot(TNames const& names) {
    std::string path;
    for (std::string const& name : names)
        path += '/' + name;
    return path.empty() ? "/" : path;
}

} // namespace

std::string joinPath(std::string const& folder, std::string const& tail) {
    return withoutEnd(folder) == "/" ? '/' + tail : withoutEnd(folder) + '/' + tail;
}

std::string folderOf(std::string const& path) {
    std::size_t const separator = path.rfind('/');
    if (separator == std::string::npos)
        return ".";
    return separator == 0 ? "/" : withoutEnd(path.substr(0, separator));
}

std::string nameOf(std::string const& path) {
    return path.substr(path.rfind('/') + 1);
}

std::string withoutEnd(std::string path) {
    while (path.size() > 1 && path.back() == '/')
        path.pop_back();
    return path;
}

std::string realPath(std::string const& path) {
    std::unique_ptr<char, void (*)(void*)> const resolved(::realpath(path.c_str(), nullptr),
                                                          std::free);
    return resolved ? resolved.get() : std::string();
}

std::string absolutePath(std::string const& path) {
    if (path.empty())
        return path;
    TNames const names = namesOf(path);
    if (std::find(names.begin(), names.end(), "..") != names.end())
        return realPath(path);
    if (path.front() == '/')
        return fromRoot(names);
    std::string folder = realPath(".");
    if (folder.empty() || names.empty())
        return folder;
    return joinPath(folder, fromRoot(names).substr(1));
}

std::string relativePath(std::string const& folder, std::string const& path) {
    TNames const from = namesOf(folder);
    TNames const to = namesOf(path);
    auto const parting = std::mismatch(from.begin(), from.end(), to.begin(), to.end());
    std::string relative;
    for (auto name = parting.first; name != from.end(); ++name)
        relative += "../";
    for (auto name = parting.second; name != to.end(); ++name)
        relative += *name + '/';
    return relative.empty() ? "." : withoutEnd(relative);
}

std::string followPath(std::string const& folder, std::string const& relative) {
    TNames names = namesOf(folder);
    for (std::string const& name : namesOf(relative)) {
        if (name != "..")
            names.push_back(name);
        else if (!names.empty())
            names.pop_back();
    }
    return fromRoot(names);
}

} // namespace Native
} // namespace MacOS
