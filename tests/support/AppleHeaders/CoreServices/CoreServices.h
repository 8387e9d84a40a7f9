/// Icon services, as far as they are called. Deprecated since 10.15, as in the framework.
#ifndef QORN_TESTS_APPLEHEADERS_CORESERVICES_H
#define QORN_TESTS_APPLEHEADERS_CORESERVICES_H

#include <CoreFoundation/CoreFoundation.h>

#define QORN_DEPRECATED_ICON __attribute__((deprecated("use NSWorkspace")))

typedef SInt16 OSErr;
typedef SInt32 OSStatus;
typedef UInt32 FourCharCode;
typedef FourCharCode OSType;

enum { noErr = 0 };
enum { kOnSystemDisk = -32768L };

typedef struct OpaqueIconRef* IconRef;
typedef UInt32 IconServicesUsageFlags;

enum { kSystemIconsCreator = 0x6D616373 }; // "macs"
enum { kGenericFolderIcon = 0x666C6472 };  // "fldr"
enum { kIconServicesNormalUsageFlag = 0 };

extern "C" {

OSErr GetIconRef(SInt16 vRefNum, OSType creator, OSType iconType,
                 IconRef* theIconRef) QORN_DEPRECATED_ICON;

OSErr GetIconRefFromTypeInfo(OSType inCreator, OSType inType, CFStringRef inExtension,
                             CFStringRef inMIMEType, IconServicesUsageFlags inUsageFlags,
                             IconRef* outIconRef) QORN_DEPRECATED_ICON;

OSErr ReleaseIconRef(IconRef theIconRef) QORN_DEPRECATED_ICON;
}

#endif
