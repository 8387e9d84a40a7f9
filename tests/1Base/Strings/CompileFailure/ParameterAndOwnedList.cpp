// An owned list takes a parameter behind it; there is no form that puts one in front.

#include "1Base/Strings/StringsParameterList.h"

int const value = 1;
Strings::CParameterList<wchar_t> const list;

#ifdef QORN_WRONG_USE
auto const joined = Strings::buildNamedParameter("a", value) + list;
#else
auto const joined = list + Strings::buildNamedParameter("a", value);
#endif
