/// The check that all reading of dates and times goes through.
///
///     stream >> std::ws >> year;
///     Time::Detail::checkInputStream(stream, "is", Error::COrigin(ERROR_ORIGIN));
///     // 'Could not read input stream is: End of input data'
#ifndef QORN_2SYSTEM_TIMEINPUT_H
#define QORN_2SYSTEM_TIMEINPUT_H

#include "1Base/Error/ErrorMacros.h"
#include "1Base/Error/ErrorMessage.h"

#include <ios>
#include <istream>

namespace Time {
namespace Detail {

/// Raises TExcTimeDateTime with the caller's origin and message. A message without a parameter
/// "reason" is given one that tells from the state what is wrong with the stream; the stream's name
/// and its state follow as "stream_name" and "is.rdstate()".
[[noreturn]] void raiseBadInput(std::ios_base::iostate state, char const* streamName,
                                Error::COrigin const& origin, Error::CMessage const& message);

/// The same with the message that the stream could not be read.
[[noreturn]] void raiseBadInput(std::ios_base::iostate state, char const* streamName,
                                Error::COrigin const& origin);

/// Does nothing while the stream has not failed. Its end by itself is no failure.
template <class TIStream>
void checkInputStream(TIStream const& stream, char const* streamName,
                      Error::COrigin const& origin) {
    if (stream.fail())
        raiseBadInput(stream.rdstate(), streamName, origin);
}

/// The same with a message of the caller's, which `makeMessage` is called for only when the stream
/// has failed.
template <class TIStream, class TMakeMessage>
void checkInputStream(TIStream const& stream, char const* streamName, Error::COrigin const& origin,
                      TMakeMessage const& makeMessage) {
    if (stream.fail())
        raiseBadInput(stream.rdstate(), streamName, origin, makeMessage());
}

/// Skips white space and reads a number or a character, which stay as they are where the stream
/// has nothing more to give.
template <class TIStream, class TValue>
void extract(TIStream& stream, TValue& value) {
    stream >> std::ws >> value;
}

} // namespace Detail
} // namespace Time

#endif
