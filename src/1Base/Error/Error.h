/// Messages, exceptions, logging and assertions.
#ifndef QORN_1BASE_ERROR_H
#define QORN_1BASE_ERROR_H

#include "1Base/Error/ErrorAssert.h"
#include "1Base/Error/ErrorExc.h"
#include "1Base/Error/ErrorExcChains.h"
#include "1Base/Error/ErrorExcLog.h"
#include "1Base/Error/ErrorExcLogObserver.h"
#include "1Base/Error/ErrorExcRegistry.h"
#include "1Base/Error/ErrorException.h"
#include "1Base/Error/ErrorInfo.h"
#include "1Base/Error/ErrorLogTargets.h"
#include "1Base/Error/ErrorLogging.h"
#include "1Base/Error/ErrorMacros.h"
#include "1Base/Error/ErrorMessage.h"
#include "1Base/Error/ErrorMessageIDs.h"
#include "1Base/Error/ErrorParameter.h"
#include "1Base/Error/ErrorScopeTracer.h"
#include "1Base/Error/ErrorSeverity.h"
#include "1Base/Error/ErrorSystem.h"

#endif
