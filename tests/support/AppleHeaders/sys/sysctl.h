/// The kernel's values by number and by name, as in sysctl(3) of macOS.
#ifndef QORN_TESTS_APPLEHEADERS_SYSCTL_H
#define QORN_TESTS_APPLEHEADERS_SYSCTL_H

#include <stddef.h>

#define CTL_KERN 1
#define KERN_OSRELEASE 2

extern "C" {

int sysctl(int* name, unsigned int namelen, void* oldp, size_t* oldlenp, void* newp, size_t newlen);
int sysctlbyname(char const* name, void* oldp, size_t* oldlenp, void* newp, size_t newlen);
}

#endif
