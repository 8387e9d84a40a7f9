#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxFile.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxShell.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include <unistd.h>

#include <climits>
#include <cstddef>

namespace MacOS {
namespace Native {
namespace {

std::string textOfFile(char const* path) {
    return readTextFile(path).value_or(std::string());
}

std::string getHostName() {
    // POSIX leaves open whether a name that is cut gets its final zero.
    char name[HOST_NAME_MAX + 1] = {};
    return ::gethostname(name, sizeof name - 1) == 0 ? name : "";
}

// The kernel ends a device tree's texts in a zero and others in a line's end; makers fill up with
// blanks.
std::string firstTextOf(std::string const& file) {
    std::string const text = file.substr(0, file.find('\0'));
    constexpr char const* white = " \t\r\n";
    std::size_t const begin = text.find_first_not_of(white);
    if (begin == std::string::npos)
        return {};
    return text.substr(begin, text.find_last_not_of(white) - begin + 1);
}

} // namespace

std::string getMachineName() {
    std::string const name = assignedValue(textOfFile("/etc/machine-info"), "PRETTY_HOSTNAME");
    return name.empty() ? getHostName() : name;
}

std::string getModelIdentifier() {
    std::string const product = firstTextOf(textOfFile("/sys/class/dmi/id/product_name"));
    return product.empty() ? firstTextOf(textOfFile("/sys/firmware/devicetree/base/model"))
                           : product;
}

} // namespace Native
} // namespace MacOS
