/// The system's name for the stream that all text is written to.
///
///     void putName(Streams::u_ostream& out);
#ifndef QORN_1BASE_STREAMSTYPES_H
#define QORN_1BASE_STREAMSTYPES_H

#include <iosfwd>

namespace Streams {

/// The wide output stream: it holds text as Strings::string does.
using u_ostream = std::basic_ostream<wchar_t>;

} // namespace Streams

#endif
