#include "1Base/Streams/StreamsString.h"

namespace Streams {
namespace Detail {

template class basic_ostringstream<wchar_t>;
template class basic_istringstream<wchar_t>;
template class basic_stringstream<wchar_t>;

} // namespace Detail
} // namespace Streams
