#include "1Base/BaseMacOS/BaseMacOS.h"

#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"
#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Error/ErrorMacros.h"

#include <string>

namespace MacOS {
namespace {

std::string toNative(Strings::string const& text) {
    return Encoding::convert<std::string>(text);
}

Strings::string fromNative(std::string const& text) {
    return Encoding::convert<Strings::string>(text);
}

// Both enumerations can hold what is none of their values.
TSystemFolderType knownType(TSystemFolderType type) {
    return type >= sftPreferences && type <= sftApplicationSupport ? type : sftDocuments;
}

TSystemFolderDomain knownDomain(TSystemFolderDomain domain) {
    return domain >= sfdLocal && domain <= sfdSystem ? domain : sfdLocal;
}

} // namespace

Strings::string addingPercentEscapes(Strings::string const& text) {
    return fromNative(Native::addingPercentEscapes(toNative(text)));
}

Strings::string getUserName(bool login) {
    return fromNative(Native::getUserName(login));
}

Strings::string getMachineName() {
    return fromNative(Native::getMachineName());
}

Strings::string getModelIdentifier() {
    return fromNative(Native::getModelIdentifier());
}

Strings::string getUserEmailAddress() {
    return fromNative(Native::getUserEmailAddress());
}

bool usesMetricSystem() {
    return Native::usesMetricSystem();
}

bool setHiddenAttribute(Strings::string const& path, bool hidden) {
    return Native::setHiddenAttribute(toNative(path), hidden);
}

bool createBookmarkFile(Strings::string const& source, Strings::string const& bookmark) {
    return Native::createBookmarkFile(toNative(source), toNative(bookmark));
}

bool resolveBookmarkFile(Strings::string const& bookmark, Strings::string& result) {
    std::string path;
    if (!Native::resolveBookmarkFile(toNative(bookmark), path))
        return false;
    result = fromNative(path);
    return true;
}

Strings::string getSpecialFolder(TSystemFolderType type, TSystemFolderDomain domain) {
    std::string path;
    bool const known = Native::getSpecialFolder(knownType(type), knownDomain(domain), path);
    // The text that reports of this failure have always shown.
    ERROR_ASSERT_TEXT(known, "[a count] > 0");
    return fromNative(path);
}

} // namespace MacOS
