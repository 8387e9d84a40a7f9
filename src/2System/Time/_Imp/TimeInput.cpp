#include "2System/Time/_Imp/TimeInput.h"

#include "2System/Time/TimeExc.h"

#include <algorithm>

namespace Time {
namespace {

bool hasReason(Error::CMessage const& message) {
    return std::any_of(message.begin(), message.end(),
                       [](auto const& entry) { return entry.getName() == "reason"; });
}

Error::CMessage reasonOf(std::ios_base::iostate state) {
    if (state & std::ios_base::eofbit) {
        char const* const types = "input data";
        return Error::CMessage(Error::msgEndOf, ERROR_PARAMS(ERROR_PARAM(types)));
    }
    char const* const error = "bad input stream";
    return Error::CMessage(Error::msgInternalError, ERROR_PARAMS(ERROR_PARAM(error)));
}

} // namespace

void Detail::raiseBadInput(std::ios_base::iostate state, char const* streamName,
                           Error::COrigin const& origin, Error::CMessage const& message) {
    Strings::CParameterList<wchar_t> params;
    if (!hasReason(message))
        params.add("reason", reasonOf(state));
    params.add("stream_name", streamName);
    params.add("is.rdstate()", static_cast<int>(state));
    throw Error::XExc<TExcTimeDateTime>(origin.getFile(), origin.getLine(), origin.getFunc(),
                                        origin.getDate(), origin.getTime(), message, params);
}

void Detail::raiseBadInput(std::ios_base::iostate state, char const* streamName,
                           Error::COrigin const& origin) {
    char const* const process = "read";
    char const* const type = "input stream";
    char const* const key = streamName;
    raiseBadInput(
        state, streamName, origin,
        Error::CMessage(Error::msgCouldNot,
                        ERROR_PARAMS(ERROR_PARAM(process), ERROR_PARAM(type), ERROR_PARAM(key))));
}

} // namespace Time
