/// Paths as texts, and their places on the disk.
#ifndef QORN_1BASE_BASEMACOSLINUXPATH_H
#define QORN_1BASE_BASEMACOSLINUXPATH_H

#include <string>

namespace MacOS {
namespace Native {

/// `tail` within `folder`: "/" and "a" is "/a".
std::string joinPath(std::string const& folder, std::string const& tail);

/// All before the last name: "/a/b" is "/a", "/a" is "/", "a" is ".".
std::string folderOf(std::string const& path);

/// All behind the last separator.
std::string nameOf(std::string const& path);

/// The path without separators at its end; "/" stays.
std::string withoutEnd(std::string path);

/// The path with every link resolved; empty where it leads to nothing.
std::string realPath(std::string const& path);

/// The path of an existing file or folder from the root on, without empty parts and ".". Links
/// stay unless ".." stands in the path: only the disk knows what that means behind a link. Empty
/// for the empty path, and where the disk can't be asked.
std::string absolutePath(std::string const& path);

/// How to come from a folder to a path, both as realPath() gives them: "../b" from "/x/a" to
/// "/x/b".
std::string relativePath(std::string const& folder, std::string const& path);

/// The way back: "/x/b" for "../b" from "/x/a".
std::string followPath(std::string const& folder, std::string const& relative);

} // namespace Native
} // namespace MacOS

#endif
