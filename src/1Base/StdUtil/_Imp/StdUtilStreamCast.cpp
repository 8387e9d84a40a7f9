#include "1Base/StdUtil/StdUtilStreamCastFailures.h"

#include "1Base/Error/ErrorMacros.h"
#include "1Base/StdUtil/StdUtilExc.h"

namespace StdUtil {
namespace Detail {

void throwStreamCastError(char const* file, unsigned int line, char const* func, char const* date,
                          char const* time, char const* source, char const* target) {
    throw Error::XExc<TExcStreamCast>(file, line, func, date, time, Error::msgCastFailed,
                                      ERROR_PARAMS(ERROR_PARAM(source), ERROR_PARAM(target)));
}

} // namespace Detail
} // namespace StdUtil
