/// Additions to the standard library: stream casting, the bounds of arrays, the global locale,
/// singletons.
#ifndef QORN_1BASE_STDUTIL_H
#define QORN_1BASE_STDUTIL_H

#include "1Base/StdUtil/StdUtilArray.h"
#include "1Base/StdUtil/StdUtilExc.h"
#include "1Base/StdUtil/StdUtilLocale.h"
#include "1Base/StdUtil/StdUtilSingleton.h"
#include "1Base/StdUtil/StdUtilStreamCast.h"

#endif
