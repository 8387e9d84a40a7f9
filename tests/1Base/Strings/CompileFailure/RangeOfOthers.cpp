// A range that is added is one of entries.

#include "1Base/Strings/StringsParameterList.h"

#include <vector>

void addRange(Strings::CParameterList<wchar_t>& list) {
#ifdef QORN_WRONG_USE
    std::vector<int> const range;
#else
    std::vector<Strings::CParameterList<wchar_t>::CEntry> const range;
#endif
    list.add(range.begin(), range.end());
}
