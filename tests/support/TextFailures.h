/// What a conversion or a check of the text modules ended in.
///
///     TestSupport::conversionFailureOf([] { Encoding::convert<Strings::string>("\xFF"); });
///     // {"CFStringCreateWithBytes", "Could not create string with encoding UTF8", 53}
#ifndef QORN_TESTS_TEXTFAILURES_H
#define QORN_TESTS_TEXTFAILURES_H

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Error/ErrorExcChains.h"

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

/// The value of the parameter `name` of an exception, an ASCII text; empty where it has none. No
/// conversion is called, which a test might be watching.
inline std::string parameterOf(Error::CException const& exc, std::string const& name) {
    std::string value;
    for (auto const& entry : exc.getInfo().getMessage())
        if (entry.getName() == name)
            for (wchar_t const character : entry.getValue())
                value += static_cast<char>(character);
    return value;
}

/// The failure that `call` raises; with empty texts where it raises none.
template <class TCall>
CConversionFailure conversionFailureOf(TCall const& call) {
    try {
        call();
    } catch (Encoding::TExcEncoding const& exc) {
        return {parameterOf(exc, "function"), parameterOf(exc, "error"),
                static_cast<unsigned int>(std::stoul(parameterOf(exc, "eenc")))};
    }
    return {"", "", 0};
}

/// The parameter `name` of the assertion that fails in `call`, as a rule its expression; empty
/// where none does.
template <class TCall>
std::string failedCheckOf(TCall const& call, std::string const& name = "expr") {
    try {
        call();
    } catch (Error::TExcErrorAssert const& exc) {
        return parameterOf(exc, name);
    }
    return "";
}

} // namespace TestSupport

#endif
