/// The effective user's entry in the system's list of users.
#ifndef QORN_1BASE_BASEMACOSLINUXUSER_H
#define QORN_1BASE_BASEMACOSLINUXUSER_H

#include <string>

namespace MacOS {
namespace Native {

struct CUserEntry {
    std::string login;
    std::string gecos; // full name, office and telephone numbers, parted by commas
    std::string home;
};

/// All empty where the list has no such user.
CUserEntry getUserEntry();

/// The user's home folder: HOME where that is absolute, else what the list of users says; empty
/// where neither names one.
std::string getHomeFolder();

} // namespace Native
} // namespace MacOS

#endif
