// An argument of another type.

#include <ApplicationServices/ApplicationServices.h>

#ifdef QORN_WRONG_USE
#    define kTransformNone context
#endif

#include "2System/FileSys/_Imp/FileSysFileSpecIconMac.cpp"
