/// Paths as the operating system takes them, and its answer to what they name.
#ifndef QORN_2SYSTEM_FILESYSSYSTEMPATH_H
#define QORN_2SYSTEM_FILESYSSYSTEMPATH_H

#include "2System/FileSys/FileSysFileSpec.h"

#include <boost/filesystem/file_status.hpp>
#include <boost/filesystem/path.hpp>

#include <string>

namespace FileSys {
namespace Detail {

/// The text in UTF-8. Raises TExcEncoding where it has no such form.
std::string toSystemText(CFileSpec const& spec);

/// Never made from wide text, which would go by the C locale.
inline boost::filesystem::path toSystemPath(CFileSpec const& spec) {
    return boost::filesystem::path(toSystemText(spec));
}

/// What the path names or leads to. Raises nothing: status_error where that can't be told.
boost::filesystem::file_type askType(CFileSpec const& spec);

} // namespace Detail
} // namespace FileSys

#endif
