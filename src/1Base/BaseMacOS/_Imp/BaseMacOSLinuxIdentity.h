/// What stays of a file when it gets another name.
#ifndef QORN_1BASE_BASEMACOSLINUXIDENTITY_H
#define QORN_1BASE_BASEMACOSLINUXIDENTITY_H

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

/// Looks for a file that has left `path`: in its folder and all below, then in each folder further
/// up and all below that, as long as these are on one device, and until a fixed number of entries
/// was seen. Within a tree the upper levels come first. Empty where it is not found.
std::string findMovedFile(CFileIdentity const& wanted, std::string const& path);

} // namespace Native
} // namespace MacOS

#endif
