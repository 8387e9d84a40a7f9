#include "1Base/Error/ErrorExcLogObserver.h"

#include "1Base/Error/ErrorMacros.h"

#include <cinttypes>
#include <cstdint>
#include <cstdio>

namespace Error {
namespace {

// Printed by hand: a cast through a stream could raise, and the registry is locked.
class CAddress {
  public:
    explicit CAddress(void const* address) {
        std::snprintf(text_, sizeof(text_), "0x%" PRIxPTR,
                      reinterpret_cast<std::uintptr_t>(address));
    }

    char const* text() const { return text_; }

  private:
    char text_[2 + 2 * sizeof(void*) + 1];
};

void logLine(EMsgID id, CExcImplementation const* impl) {
    // One expansion turns the text's "@@(pExc)" into the placeholder that the record answers.
    CMessage const message(id, TemplMeta::CNil());
    CAddress const address(impl);
    char const* const pExc = address.text();
    ERROR_LOG(TLoggerError, TTgtLogger, TSevLog, message.getString(true).c_str(),
              ERROR_PARAM(pExc));
}

} // namespace

void CExcLogObserver::exceptionAdded(CExcImplementation const* impl, CInfo const&) const {
    logLine(msgExceptionAdded, impl);
}

void CExcLogObserver::exceptionRemoved(CExcImplementation const* impl) const {
    logLine(msgExceptionRemoved, impl);
}

} // namespace Error
