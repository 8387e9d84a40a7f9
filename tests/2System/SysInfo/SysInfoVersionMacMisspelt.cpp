// A name that the header lacks.

#include <sys/sysctl.h>

#ifdef QORN_WRONG_USE
#    undef KERN_OSRELEASE
#endif

#include "2System/SysInfo/_Imp/SysInfoVersionSourcesMac.cpp"
