/// The computer's name in the system's configuration.
#ifndef QORN_TESTS_APPLEHEADERS_SYSTEMCONFIGURATION_H
#define QORN_TESTS_APPLEHEADERS_SYSTEMCONFIGURATION_H

#include <CoreFoundation/CoreFoundation.h>

typedef struct __SCDynamicStore const* SCDynamicStoreRef;

extern "C" CFStringRef SCDynamicStoreCopyComputerName(SCDynamicStoreRef store,
                                                      CFStringEncoding* nameEncoding);

#endif
