#include "1Base/Streams/StreamsBuffer.h"

namespace Streams {

template class basic_isbufbuf<wchar_t>;
template class basic_isbufstream<wchar_t>;

} // namespace Streams
