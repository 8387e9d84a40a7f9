// A misspelt name.

#include <ApplicationServices/ApplicationServices.h>

#ifdef QORN_WRONG_USE
#    define kGenericFolderIcon kGenericFoldrIcon
#endif

#include "2System/FileSys/_Imp/FileSysFileSpecIconMac.cpp"
