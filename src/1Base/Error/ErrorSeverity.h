/// Severities and log targets, as values and as compile-time tags.
#ifndef QORN_1BASE_ERRORSEVERITY_H
#define QORN_1BASE_ERRORSEVERITY_H

#include "1Base/TemplMeta/TemplMetaTag.h"
#include "1Base/TemplMeta/TemplMetaTypeList.h"

namespace Error {

/// From chatter to the end of the process.
enum ESeverity : int {
    SevDebug = 1,
    SevLog = 2,
    SevInfo = 3,
    SevWarn = 4,
    SevError = 5,
    SevFatal = 6
};

/// The severity's name, "SevDebug" for instance; an empty text for any other value.
char const* getSeverityName(ESeverity severity);

TEMPLMETA_TAG_NAME(SevDebug);
TEMPLMETA_TAG_NAME(SevLog);
TEMPLMETA_TAG_NAME(SevInfo);
TEMPLMETA_TAG_NAME(SevWarn);
TEMPLMETA_TAG_NAME(SevError);
TEMPLMETA_TAG_NAME(SevFatal);

TEMPLMETA_TAG_NAME(TgtDebugger);
TEMPLMETA_TAG_NAME(TgtLogger);
TEMPLMETA_TAG_NAME(TgtUser);

/// @{
/// A severity as a type: what a log site says, and what a filter is made of.
using TSevDebug = TemplMeta::CTag<CTag_Name_SevDebug<char const*>>;
using TSevLog = TemplMeta::CTag<CTag_Name_SevLog<char const*>>;
using TSevInfo = TemplMeta::CTag<CTag_Name_SevInfo<char const*>>;
using TSevWarn = TemplMeta::CTag<CTag_Name_SevWarn<char const*>>;
using TSevError = TemplMeta::CTag<CTag_Name_SevError<char const*>>;
using TSevFatal = TemplMeta::CTag<CTag_Name_SevFatal<char const*>>;
/// @}

/// @{
/// Whom a record is for: who debugs, who reads the log, or the program's user.
using TTgtDebugger = TemplMeta::CTag<CTag_Name_TgtDebugger<char const*>>;
using TTgtLogger = TemplMeta::CTag<CTag_Name_TgtLogger<char const*>>;
using TTgtUser = TemplMeta::CTag<CTag_Name_TgtUser<char const*>>;
/// @}

/// @{
/// What a logger lets through as a rule: everything from SevLog up, to the logger and the user.
using TStdSeverities = TemplMeta::CTypeList<
    TSevLog,
    TemplMeta::CTypeList<
        TSevInfo, TemplMeta::CTypeList<
                      TSevWarn, TemplMeta::CTypeList<
                                    TSevError, TemplMeta::CTypeList<TSevFatal, TemplMeta::CNil>>>>>;
using TStdTargets =
    TemplMeta::CTypeList<TTgtLogger, TemplMeta::CTypeList<TTgtUser, TemplMeta::CNil>>;
/// @}

} // namespace Error

#endif
