/// An observer of the exception registry that logs what comes and goes.
///
///     static Error::CExcLogObserver const observer;
///     Error::CExcImplementation::accessRegistry()->registerObserver(&observer);
///     // "Exception 0x5581c0de added to the exception registry."
#ifndef QORN_1BASE_ERROREXCLOGOBSERVER_H
#define QORN_1BASE_ERROREXCLOGOBSERVER_H

#include "1Base/Error/ErrorExcRegistry.h"

namespace Error {

/// Logs the catalogue's two lines through the logger of the error module, for TTgtLogger at SevLog.
/// The exception is told by its address, as the parameter "pExc".
///
/// It logs under the registry's lock, which is the one order of the two locks that is allowed; so
/// a log target that raises an exception of the family ends in a deadlock.
class CExcLogObserver : public CExcRegistry::CObserver {
  public:
    void exceptionAdded(CExcImplementation const* impl, CInfo const& info) const override;
    void exceptionRemoved(CExcImplementation const* impl) const override;
};

} // namespace Error

#endif
