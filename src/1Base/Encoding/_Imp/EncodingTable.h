/// The table of the named encodings, for the conversion code alone.
#ifndef QORN_1BASE_ENCODINGTABLE_H
#define QORN_1BASE_ENCODINGTABLE_H

#include "1Base/Encoding/EncodingList.h"

#include <CoreFoundation/CoreFoundation.h>

#include <string>

namespace Encoding {

/// The same numbers as ESysEncoding; a value passes from one to the other unchanged.
enum EEncoding : unsigned int {
#define QORN_ENUMERATOR(name, platform) eenc##name,
    QORN_ENCODING_LIST(QORN_ENUMERATOR)
#undef QORN_ENUMERATOR
};

/// The platform's value; kCFStringEncodingUnicode for a number outside the table. eencCurrent asks
/// the platform at each call and so follows the system.
CFStringEncoding findEncoding(EEncoding encoding);

/// The table's name; "unknown encoding" for a number outside the table.
std::string getEncodingName(EEncoding encoding);

} // namespace Encoding

#endif
