/// The exception of failed conversions.
#ifndef QORN_1BASE_ENCODINGEXC_H
#define QORN_1BASE_ENCODINGEXC_H

#include "1Base/Error/ErrorExc.h"

namespace Encoding {

TEMPLMETA_TAG_NAME(Encoding);

/// A conversion that the platform refused, with the message msgOSCall and the parameters "eenc",
/// "function" and "error".
using TExcEncoding =
    Error::TExc<TemplMeta::CTag<CTag_Name_Encoding<char const*>>, Error::CException>;

} // namespace Encoding

#endif
