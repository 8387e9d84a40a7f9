#include "1Base/Strings/StringsParameterList.h"

namespace Strings {

template class CParameterList<wchar_t>;

} // namespace Strings
