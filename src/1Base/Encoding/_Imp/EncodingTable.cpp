#include "1Base/Encoding/_Imp/EncodingTable.h"

namespace Encoding {

CFStringEncoding findEncoding(EEncoding encoding) {
    switch (encoding) {
#define QORN_PLATFORM_VALUE(name, platform)                                                        \
    case eenc##name:                                                                               \
        return static_cast<CFStringEncoding>(platform);
        QORN_ENCODING_LIST(QORN_PLATFORM_VALUE)
#undef QORN_PLATFORM_VALUE
    }
    return kCFStringEncodingUnicode;
}

std::string getEncodingName(EEncoding encoding) {
    switch (encoding) {
#define QORN_NAME(name, platform)                                                                  \
    case eenc##name:                                                                               \
        return #name;
        QORN_ENCODING_LIST(QORN_NAME)
#undef QORN_NAME
    }
    return "unknown encoding";
}

} // namespace Encoding
