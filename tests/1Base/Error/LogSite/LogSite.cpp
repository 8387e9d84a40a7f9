// One log call, compiled twice: with a severity that a logger up the chain filters, and with one
// that passes.

#include "1Base/Error/ErrorMacros.h"
#include "1Base/Error/ErrorSystem.h"

extern "C" void site(char const* key, int line);

void site(char const* key, int line) {
    ERROR_LOG(TLoggerSystem, Error::TTgtLogger, SITE_SEVERITY, "no @(key) in @(line)",
              ERROR_PARAMS(ERROR_PARAM(key), ERROR_PARAM(line)));
}
