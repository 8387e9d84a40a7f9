/// The exception of failed casts.
#ifndef QORN_1BASE_STDUTILEXC_H
#define QORN_1BASE_STDUTILEXC_H

#include "1Base/Error/ErrorExc.h"

namespace StdUtil {

TEMPLMETA_TAG_NAME(StreamCast);

/// A cast that the stream refused, with the message msgCastFailed and the parameters "source" and
/// "target": the compiler's raw names of the types.
using TExcStreamCast =
    Error::TExc<TemplMeta::CTag<CTag_Name_StreamCast<char const*>>, Error::CException>;

} // namespace StdUtil

#endif
