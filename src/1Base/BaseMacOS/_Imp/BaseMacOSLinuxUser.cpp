#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxUser.h"

#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include <pwd.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <vector>

namespace MacOS {
namespace Native {
namespace {

std::string textOf(char const* text) {
    return text != nullptr ? text : "";
}

// The name is upper-cased in ASCII alone, whatever the locale.
std::string capitalized(std::string name) {
    if (!name.empty() && name.front() >= 'a' && name.front() <= 'z')
        name.front() = static_cast<char>(name.front() - 'a' + 'A');
    return name;
}

// The field's first part; "&" stands for the login name with a capital letter (passwd(5)).
std::string getFullName(CUserEntry const& user) {
    std::string name;
    for (char const c : user.gecos.substr(0, user.gecos.find(','))) {
        if (c == '&')
            name += capitalized(user.login);
        else
            name += c;
    }
    return name;
}

} // namespace

CUserEntry getUserEntry() {
    // Names of directory services can be long; the limit only stops a system that never has enough.
    constexpr std::size_t limit = std::size_t{1} << 20;
    for (std::size_t size = 1024; size <= limit; size *= 2) {
        std::vector<char> buffer(size);
        struct passwd entry;
        struct passwd* found = nullptr;
        int const failure = ::getpwuid_r(::geteuid(), &entry, buffer.data(), buffer.size(), &found);
        if (found != nullptr)
            return {textOf(entry.pw_name), textOf(entry.pw_gecos), textOf(entry.pw_dir)};
        if (failure != ERANGE)
            break;
    }
    return {};
}

std::string getHomeFolder() {
    std::string const home = textOf(std::getenv("HOME"));
    return withoutEnd(!home.empty() && home.front() == '/' ? home : getUserEntry().home);
}

std::string getUserName(bool login) {
    CUserEntry const user = getUserEntry();
    return login ? user.login : getFullName(user);
}

} // namespace Native
} // namespace MacOS
