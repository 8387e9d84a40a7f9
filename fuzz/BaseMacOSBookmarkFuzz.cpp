// Bytes as a bookmark file.
//
// What must hold: they are refused, or give an absolute path, and what is written of that reads as
// the same bookmark.

#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxBookmarkText.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <optional>
#include <string>
#include <tuple>

namespace {

using MacOS::Native::CBookmark;
using MacOS::Native::CFileIdentity;

void require(bool holds) {
    if (!holds)
        std::abort();
}

auto partsOf(CBookmark const& bookmark) {
    CFileIdentity const identity = bookmark.identity.value_or(CFileIdentity());
    return std::make_tuple(bookmark.path, bookmark.relativePath, bookmark.identity.has_value(),
                           identity.device, identity.inode, identity.birth);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    std::string const text(reinterpret_cast<char const*>(data), size);
    std::optional<CBookmark> const bookmark = MacOS::Native::readBookmark(text);
    if (!bookmark)
        return 0;
    require(bookmark->path.front() == '/');
    std::optional<CBookmark> const again =
        MacOS::Native::readBookmark(MacOS::Native::writeBookmark(*bookmark));
    require(again && partsOf(*again) == partsOf(*bookmark));
    return 0;
}
