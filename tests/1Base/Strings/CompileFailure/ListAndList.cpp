// Two sums of parameters do not join: which of them would come first is anybody's guess.

#include "1Base/Strings/StringsParameter.h"

int const value = 1;
auto const parameter = Strings::buildNamedParameter("a", value);
auto const list = parameter + parameter;

#ifdef QORN_WRONG_USE
auto const joined = list + list;
#else
auto const joined = list + parameter;
#endif
