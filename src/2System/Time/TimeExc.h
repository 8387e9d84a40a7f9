/// The exceptions and loggers of date and time.
#ifndef QORN_2SYSTEM_TIMEEXC_H
#define QORN_2SYSTEM_TIMEEXC_H

#include "1Base/Error/ErrorSystem.h"

namespace Time {

TEMPLMETA_TAG_NAME(Time);
TEMPLMETA_TAG_NAME(TimeDate);
TEMPLMETA_TAG_NAME(TimeTime);
TEMPLMETA_TAG_NAME(TimeDateTime);
TEMPLMETA_TAG_NAME(TimeFormatError);

/// A date that is none. Never raised itself.
using TExcTimeDate =
    Error::TExc<TemplMeta::CTag<CTag_Name_TimeDate<char const*>>, Error::CException>;

/// A time of day that is none. Never raised itself.
using TExcTimeTime =
    Error::TExc<TemplMeta::CTag<CTag_Name_TimeTime<char const*>>, Error::CException>;

/// A date or time that is none, or that the system cannot tell.
using TExcTimeDateTime =
    Error::TExc<TemplMeta::CTag<CTag_Name_TimeDateTime<char const*>>, TExcTimeDate, TExcTimeTime>;

/// A text that is no date or time of its format.
using TExcTimeFormatError =
    Error::TExc<TemplMeta::CTag<CTag_Name_TimeFormatError<char const*>>, TExcTimeDateTime>;

/// Level one.
using TLoggerTime =
    Error::CLogger<TemplMeta::CTag<CTag_Name_Time<char const*>>, Error::TStdSeverities,
                   Error::TStdTargets, TLoggerSystem, TemplMeta::CAnd>;

/// Level two, used by dates and date-times.
using TLoggerTimeDateTime =
    Error::CLogger<TemplMeta::CTag<CTag_Name_TimeDateTime<char const*>>, Error::TStdSeverities,
                   Error::TStdTargets, TLoggerTime, TemplMeta::CAnd>;

} // namespace Time

#endif
