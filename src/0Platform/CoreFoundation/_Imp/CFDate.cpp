#include "0Platform/CoreFoundation/_Imp/CFCreate.h"
#include "0Platform/CoreFoundation/_Imp/CFDateObject.h"

using namespace CFPlatform;

CFTimeInterval const kCFAbsoluteTimeIntervalSince1970 = 978307200.0;

extern "C" CFDateRef CFDateCreate(CFAllocatorRef, CFAbsoluteTime at) {
    return createObject<__CFDate>(at);
}

extern "C" CFAbsoluteTime CFDateGetAbsoluteTime(CFDateRef date) {
    return date->time;
}
