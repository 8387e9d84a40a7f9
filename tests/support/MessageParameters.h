/// The parameters of a message as plain values, to compare.
#ifndef QORN_TESTS_MESSAGEPARAMETERS_H
#define QORN_TESTS_MESSAGEPARAMETERS_H

#include "1Base/Strings/StringsMessage.h"

#include <string>
#include <utility>
#include <vector>

namespace TestSupport {

using TParameters = std::vector<std::pair<std::string, Strings::string>>;

/// Names and values in the message's order.
template <class TParameterList>
TParameters parametersOf(Strings::CMessage<wchar_t, TParameterList> const& message) {
    TParameters parameters;
    for (auto const& entry : message)
        parameters.emplace_back(entry.getName(), entry.getValue());
    return parameters;
}

/// The value of the first parameter of that name; empty where there is none.
template <class TParameterList>
Strings::string parameterOf(Strings::CMessage<wchar_t, TParameterList> const& message,
                            std::string const& name) {
    for (auto const& entry : message)
        if (entry.getName() == name)
            return entry.getValue();
    return Strings::string();
}

} // namespace TestSupport

#endif
