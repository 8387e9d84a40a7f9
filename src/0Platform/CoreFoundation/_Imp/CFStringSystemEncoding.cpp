#include <CoreFoundation/CFString.h>

extern "C" CFStringEncoding CFStringGetSystemEncoding(void) {
    return kCFStringEncodingMacRoman;
}
