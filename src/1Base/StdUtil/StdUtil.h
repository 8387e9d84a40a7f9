/// Additions to the standard library: stream casting and the bounds of arrays.
#ifndef QORN_1BASE_STDUTIL_H
#define QORN_1BASE_STDUTIL_H

#include "1Base/StdUtil/StdUtilArray.h"
#include "1Base/StdUtil/StdUtilStreamCast.h"

#endif
