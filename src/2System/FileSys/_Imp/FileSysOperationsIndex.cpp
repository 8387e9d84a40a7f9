#include "1Base/Streams/StreamsString.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include <algorithm>
#include <cstddef>
#include <iomanip>

namespace FileSys {
namespace {

// Of a whole name. The "_" is not counted, so that a name can have one character more.
constexpr std::size_t nameLimit = 1024;

// Without a look at the locale: other scripts' digits are none here.
bool isDigit(wchar_t character) {
    return character >= L'0' && character <= L'9';
}

// A value beyond the number's range wraps.
unsigned int valueOf(Strings::string const& digits) {
    unsigned int value = 0;
    for (wchar_t const digit : digits)
        value = value * 10U + static_cast<unsigned int>(digit - L'0');
    return value;
}

// Takes an index of just so many digits off the stem and returns its number; 1 where the stem has
// none.
unsigned int takeNumber(Strings::string& stem, std::size_t digits) {
    if (stem.size() < digits + 1)
        return 1;
    std::size_t const mark = stem.size() - digits - 1;
    Strings::string const number = stem.substr(mark + 1);
    if (stem[mark] != L'_' || !std::all_of(number.begin(), number.end(), isDigit))
        return 1;
    stem.erase(mark);
    return valueOf(number);
}

Strings::string buildName(Strings::string const& stem, unsigned int number, unsigned int digits,
                          Strings::string const& extension) {
    Streams::Detail::basic_ostringstream<wchar_t> stream(
        static_cast<unsigned int>(std::ios_base::out));
    stream << stem << L'_' << std::setw(static_cast<int>(digits)) << std::setfill(L'0') << number;
    if (!extension.empty())
        stream << CFileSpec::getExtensionSeparator() << extension;
    return stream.str();
}

CFileSpec doIndexFile(CFileSpec const& spec, unsigned int digits) {
    ERROR_BLOCK_BEGIN
    Strings::string stem = spec.getFileName();
    Strings::string const extension = spec.getFileExtension();
    CFileSpec const folder = spec.getParentFolder();
    std::size_t const reserved = digits + extension.size() + (extension.empty() ? 0U : 1U);
    stem.resize(std::min(stem.size(), reserved < nameLimit ? nameLimit - reserved : 0U));
    unsigned int number = takeNumber(stem, digits);
    CFileSpec candidate;
    do {
        candidate = folder + buildName(stem, number, digits, extension);
        ++number;
    } while (candidate.exists());
    return candidate;
    ERROR_BLOCK_END
}

} // namespace

bool indexFile(CFileSpec& spec, unsigned int digits) {
    ERROR_BLOCK_BEGIN
    if (!spec.exists())
        return false;
    spec = doIndexFile(spec, digits);
    return true;
    ERROR_BLOCK_END
}

} // namespace FileSys
