#include "1Base/Streams/StreamsFile.h"

namespace Streams {
namespace Detail {

template class basic_filebufW<char>;
template class CFStreamW<char>;
template class basic_ifstreamW<char>;
template class basic_ofstreamW<char>;
template class basic_fstreamW<char>;

} // namespace Detail
} // namespace Streams
