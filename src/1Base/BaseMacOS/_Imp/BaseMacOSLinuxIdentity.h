/// What stays of a file when it gets another name.
#ifndef QORN_1BASE_BASEMACOSLINUXIDENTITY_H
#define QORN_1BASE_BASEMACOSLINUXIDENTITY_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>

namespace MacOS {
namespace Native {

struct CFileIdentity {
    std::uint64_t device = 0;
    std::uint64_t inode = 0;
    std::optional<std::uint64_t> birth; // nanoseconds since 1970, where the file system keeps them
};

/// A link is a file of its own here. Nothing where there is no such file.
std::optional<CFileIdentity> identityOf(std::string const& path);

/// Looks for a file that has left `path`, an absolute one: in its folder, or the nearest one above
/// that is still there, and all below, then in each folder further up and all below that. It stays
/// on that folder's device and ends after `entryLimit` entries. Within a tree the upper levels come
/// first. The result has no links in its folders, and is empty where nothing was found.
std::string findMovedFile(CFileIdentity const& wanted, std::string const& path,
                          std::size_t entryLimit);

} // namespace Native
} // namespace MacOS

#endif
