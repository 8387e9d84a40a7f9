/// Integers as decimal text without a stream, for the time in which the global locale is classic.
#ifndef QORN_1BASE_STDUTILDECIMAL_H
#define QORN_1BASE_STDUTILDECIMAL_H

#include "1Base/Strings/StringsKinds.h"

#include <type_traits>

namespace StdUtil {
namespace Detail {

template <class TType, class... TTypes>
constexpr bool isOneOf = (std::is_same_v<TType, TTypes> || ...);

/// The types that `readDecimal` reads.
template <class TNumber>
constexpr bool isReadAsDecimal = isOneOf<TNumber, short, unsigned short, int, unsigned int, long,
                                         unsigned long, long long, unsigned long long>;

/// The types that a wide stream writes as a decimal number. It has no inserter for signed and
/// unsigned `char`: these go by way of `int` and are no characters there.
template <class TNumber>
constexpr bool isWrittenAsDecimal =
    isReadAsDecimal<TNumber> || isOneOf<TNumber, bool, signed char, unsigned char>;

/// The digits that a stream of the classic locale writes under default flags.
Strings::string writeDecimal(long long number);
Strings::string writeDecimal(unsigned long long number);

/// Reads a number from the beginning of `text` as a stream of the classic locale does under
/// default flags; text behind the number is left alone. A negative number wraps into an unsigned
/// type, as long as its magnitude fits. False, with `number` untouched, where the stream would
/// fail, and in the rare case of white space beyond ASCII or of too many digits to be sure.
template <class TNumber>
bool readDecimal(Strings::string const& text, TNumber& number);

} // namespace Detail
} // namespace StdUtil

#endif
