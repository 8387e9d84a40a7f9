/// What a bookmark file says: a desktop entry of type Link (freedesktop.org, Desktop Entry
/// Specification), which file managers follow by its URL, with keys of our own that also lead to a
/// file which was renamed or moved.
///
///     [Desktop Entry]
///     Type=Link
///     Name=a b
///     URL=file:///home/ada/a%20b
///     X-QORN-Path=/home/ada/a b
///     X-QORN-RelativePath=../a b
///     X-QORN-Device=65024
///     X-QORN-Inode=10954060
///     X-QORN-BirthTime=1605892483592150083
#ifndef QORN_1BASE_BASEMACOSLINUXBOOKMARKTEXT_H
#define QORN_1BASE_BASEMACOSLINUXBOOKMARKTEXT_H

#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxIdentity.h"

#include <optional>
#include <string>

namespace MacOS {
namespace Native {

struct CBookmark {
    std::string path;         // from the root on
    std::string relativePath; // from the folder of the bookmark file on
    std::optional<CFileIdentity> identity;
};

std::string writeBookmark(CBookmark const& bookmark);

/// Nothing where the text is no bookmark. The absolute path is always there and begins with "/";
/// the rest may be missing.
std::optional<CBookmark> readBookmark(std::string const& text);

} // namespace Native
} // namespace MacOS

#endif
