/// Platform strings, and the services whose types belong to this floor.
#ifndef QORN_2SYSTEM_MACOS_H
#define QORN_2SYSTEM_MACOS_H

#include "2System/MacOS/MacOSCFStringConverter.h"
#include "2System/MacOS/MacOSGlue.h"
#include "2System/MacOS/MacOSTempCFString.h"

#endif
