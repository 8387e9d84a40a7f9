#include "1Base/Error/ErrorSeverity.h"

namespace Error {

char const* getSeverityName(ESeverity severity) {
    switch (severity) {
    case SevDebug:
        return TemplMeta::getTagName<TSevDebug>();
    case SevLog:
        return TemplMeta::getTagName<TSevLog>();
    case SevInfo:
        return TemplMeta::getTagName<TSevInfo>();
    case SevWarn:
        return TemplMeta::getTagName<TSevWarn>();
    case SevError:
        return TemplMeta::getTagName<TSevError>();
    case SevFatal:
        return TemplMeta::getTagName<TSevFatal>();
    }
    return "";
}

} // namespace Error
