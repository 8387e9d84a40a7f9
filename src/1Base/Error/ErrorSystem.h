/// The root of everything that deals with the operating system: its exceptions and its logger.
/// They stand in the global namespace, since no module owns them.
#ifndef QORN_1BASE_ERRORSYSTEM_H
#define QORN_1BASE_ERRORSYSTEM_H

#include "1Base/Error/ErrorExc.h"
#include "1Base/Error/ErrorLogging.h"

TEMPLMETA_TAG_NAME(System);

/// Never raised itself: caught, it stands for all failures of files, modules and system facts.
using TExcSystem = Error::TExc<TemplMeta::CTag<CTag_Name_System<char const*>>, Error::CException>;

/// The logger above those of files, system facts and dates.
using TLoggerSystem =
    Error::CLogger<TemplMeta::CTag<CTag_Name_System<char const*>>, Error::TStdSeverities,
                   Error::TStdTargets, Error::CGlobalLogger, TemplMeta::CAnd>;

#endif
