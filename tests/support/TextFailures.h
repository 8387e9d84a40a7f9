/// What a conversion or a check of the text modules ended in.
///
///     TestSupport::conversionFailureOf([] { Encoding::convert<Strings::string>("\xFF"); });
///     // {"CFStringCreateWithBytes", "Could not create string with encoding UTF8", 53}
#ifndef QORN_TESTS_TEXTFAILURES_H
#define QORN_TESTS_TEXTFAILURES_H

#include "1Base/Encoding/EncodingFailures.h"

#include <ostream>
#include <string>

namespace TestSupport {

struct CConversionFailure {
    std::string function;
    std::string error;
    unsigned int eenc;
};

inline bool operator==(CConversionFailure const& left, CConversionFailure const& right) {
    return left.function == right.function && left.error == right.error && left.eenc == right.eenc;
}

inline std::ostream& operator<<(std::ostream& stream, CConversionFailure const& failure) {
    return stream << failure.function << ": " << failure.error << " (" << failure.eenc << ")";
}

/// The failure that `call` raises; with empty texts where it raises none.
template <class TCall>
CConversionFailure conversionFailureOf(TCall const& call) {
    try {
        call();
    } catch (Encoding::Detail::XConversion const& failure) {
        return {failure.function, failure.error, static_cast<unsigned int>(failure.eenc)};
    }
    return {"", "", 0};
}

/// The text of the check that fails in `call`; empty where none does.
template <class TCall>
std::string failedCheckOf(TCall const& call) {
    try {
        call();
    } catch (Encoding::Detail::XCheck const& failure) {
        return failure.what();
    }
    return "";
}

} // namespace TestSupport

#endif
