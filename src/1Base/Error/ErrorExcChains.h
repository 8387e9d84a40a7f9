/// The chains of the error module itself, and the logger that shares a tag with one of them.
#ifndef QORN_1BASE_ERROREXCCHAINS_H
#define QORN_1BASE_ERROREXCCHAINS_H

#include "1Base/Error/ErrorExc.h"
#include "1Base/Error/ErrorLogging.h"

namespace Error {

TEMPLMETA_TAG_NAME(ErrorAssert);
TEMPLMETA_TAG_NAME(StdLibException);
TEMPLMETA_TAG_NAME(BadAllocException);

/// A failed assertion.
using TExcErrorAssert = TExc<TemplMeta::CTag<CTag_Name_ErrorAssert<char const*>>, CException>;

/// A standard library exception that passed a guarded block.
using TExcStdLibException =
    TExc<TemplMeta::CTag<CTag_Name_StdLibException<char const*>>, CException>;

/// A std::bad_alloc that did.
using TExcBadAllocException =
    TExc<TemplMeta::CTag<CTag_Name_BadAllocException<char const*>>, TExcStdLibException>;

/// The logger of failed assertions.
using TLoggerErrorAssert = CLogger<TemplMeta::CTag<CTag_Name_ErrorAssert<char const*>>,
                                   TStdSeverities, TStdTargets, TLoggerError, TemplMeta::CAnd>;

} // namespace Error

#endif
