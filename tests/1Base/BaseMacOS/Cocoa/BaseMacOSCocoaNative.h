/// The border of the source for Cocoa under a name of its own, so that one program can hold both
/// sides: `MacOS::NativeCocoa` beside the `MacOS::Native` of this system.
#ifndef QORN_TESTS_BASEMACOSCOCOANATIVE_H
#define QORN_TESTS_BASEMACOSCOCOANATIVE_H

#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#undef QORN_1BASE_BASEMACOSNATIVE_H
#define Native NativeCocoa
#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"
#undef Native

#endif
