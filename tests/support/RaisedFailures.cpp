// An exception's own texts are converted while it is raised. What that calls in the platform is no
// business of a test that watches how a conversion failed.

#include "1Base/Encoding/EncodingFailures.h"
#include "1Base/Error/ErrorAssert.h"
#include "support/PlatformCalls.h"

#include <string>

using Encoding::ESysEncoding;
using Error::Detail::CAssertDummy;
using TestSupport::CPlatformPause;

// The linker puts `wrap` in front of the function that `real` names (CMakeLists.txt lists both).
[[noreturn]] void
realConversionError(char const* function, std::string const& error,
                    ESysEncoding encoding) __asm__("__real_" QORN_CONVERSION_ERROR);
[[noreturn]] void
wrapConversionError(char const* function, std::string const& error,
                    ESysEncoding encoding) __asm__("__wrap_" QORN_CONVERSION_ERROR);
void realAssertion(char const* file, unsigned int line, char const* func, char const* date,
                   char const* time, bool doThrow, char const* expr,
                   CAssertDummy) __asm__("__real_" QORN_ASSERTION);
void wrapAssertion(char const* file, unsigned int line, char const* func, char const* date,
                   char const* time, bool doThrow, char const* expr,
                   CAssertDummy) __asm__("__wrap_" QORN_ASSERTION);

void wrapConversionError(char const* function, std::string const& error, ESysEncoding encoding) {
    CPlatformPause const pause;
    realConversionError(function, error, encoding);
}

void wrapAssertion(char const* file, unsigned int line, char const* func, char const* date,
                   char const* time, bool doThrow, char const* expr, CAssertDummy dummy) {
    CPlatformPause const pause;
    realAssertion(file, line, func, date, time, doThrow, expr, dummy);
}
