/// What the tests of the platform's interface compare types with. On macOS they read the
/// framework's own header, so one text says what both declare.
#ifndef QORN_TESTS_CFINTERFACE_H
#define QORN_TESTS_CFINTERFACE_H

#include <CoreFoundation/CoreFoundation.h>

#include <type_traits>

namespace TestSupport {

template <class TExpected, class TActual>
constexpr bool isType = std::is_same_v<TExpected, TActual>;

/// Whether the values of an enumeration are kept in a type.
template <class TEnum, class TExpected>
constexpr bool isKeptIn = std::is_same_v<std::underlying_type_t<TEnum>, TExpected>;

} // namespace TestSupport

#endif
