/// The bytes of an Info.plist, written without the library that reads them.
///
///     TestSupport::xmlInfo({{"CFBundleName", "Demo"}});
#ifndef QORN_TESTS_INFOPLIST_H
#define QORN_TESTS_INFOPLIST_H

#include <map>
#include <string>

namespace TestSupport {

/// Values by key, in UTF-8.
using TInfo = std::map<std::string, std::string>;

/// A property list in XML whose root is `content`, as it is.
std::string xmlPlist(std::string const& content);

/// A dictionary of texts in XML, without anything to escape in it.
std::string xmlInfo(TInfo const& info);

/// The same in binary form (version 00), of at most 100 texts: ASCII as bytes, others in UTF-16.
std::string binaryInfo(TInfo const& info);

} // namespace TestSupport

#endif
