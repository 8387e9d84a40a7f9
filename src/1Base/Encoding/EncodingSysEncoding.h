/// Names for the encodings that text in bytes can have.
#ifndef QORN_1BASE_ENCODINGSYSENCODING_H
#define QORN_1BASE_ENCODINGSYSENCODING_H

#include "1Base/Encoding/EncodingList.h"

namespace Encoding {

/// `eseCurrent` (0) to `eseUTF16CanonicalComposed` (56). Values outside the list are legal and mean
/// UTF-16 in host order.
enum ESysEncoding : unsigned int {
#define QORN_ENUMERATOR(name, platform) ese##name,
    QORN_ENCODING_LIST(QORN_ENUMERATOR)
#undef QORN_ENUMERATOR
};

} // namespace Encoding

#endif
