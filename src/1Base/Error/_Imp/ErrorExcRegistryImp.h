/// The one registry, for the exceptions.
#ifndef QORN_1BASE_ERROREXCREGISTRYIMP_H
#define QORN_1BASE_ERROREXCREGISTRYIMP_H

namespace Error {

class CExcRegistry;

namespace Detail {

CExcRegistry* exceptionRegistry();

} // namespace Detail
} // namespace Error

#endif
