/// The border to the system's own services, one function each, with UTF-8 text in and out: one
/// source for each platform stands behind it, and the Objective-C one sees no wide text.
#ifndef QORN_1BASE_BASEMACOSNATIVE_H
#define QORN_1BASE_BASEMACOSNATIVE_H

#include <string>

namespace MacOS {
namespace Native {

std::string addingPercentEscapes(std::string const& text);
std::string getUserName(bool login);
std::string getMachineName();
std::string getModelIdentifier();
std::string getUserEmailAddress();
bool usesMetricSystem();
bool setHiddenAttribute(std::string const& path, bool hidden);
bool createBookmarkFile(std::string const& source, std::string const& bookmark);
bool resolveBookmarkFile(std::string const& bookmark, std::string& result);

/// A known value of TSystemFolderType and one of TSystemFolderDomain give the whole path, with what
/// the type appends to the system's own folder. False where the system knows no such folder.
bool getSpecialFolder(int folder, int domain, std::string& path);

} // namespace Native
} // namespace MacOS

#endif
