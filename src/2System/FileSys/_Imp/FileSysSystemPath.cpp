#include "2System/FileSys/_Imp/FileSysSystemPath.h"

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Encoding/EncodingExc.h"

#include <boost/filesystem/operations.hpp>
#include <boost/system/error_code.hpp>

#include <cstddef>

namespace FileSys {

// A path of ASCII, as most are, is its own UTF-8: with that short way a question costs little more
// than the call of the system.
std::string Detail::toSystemText(CFileSpec const& spec) {
    Strings::string const& text = spec.path_;
    std::string narrow(text.size(), '\0');
    char32_t all = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        all |= static_cast<char32_t>(text[i]);
        narrow[i] = static_cast<char>(text[i]);
    }
    if (all < 0x80)
        return narrow;
    return Encoding::convert<std::string>(text);
}

boost::filesystem::file_type Detail::askType(CFileSpec const& spec) {
    boost::system::error_code error;
    try {
        return boost::filesystem::status(toSystemPath(spec), error).type();
    } catch (Encoding::TExcEncoding const&) {
        // It names nothing.
        return boost::filesystem::file_not_found;
    }
}

} // namespace FileSys
