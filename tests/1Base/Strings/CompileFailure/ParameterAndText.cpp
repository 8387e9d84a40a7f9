// The sums are of parameters only: a type of one's own keeps its own meaning of "+".

#include "1Base/Strings/StringsParameter.h"

#include <string>

int const value = 1;
auto const parameter = Strings::buildNamedParameter("a", value);

#ifdef QORN_WRONG_USE
auto const joined = parameter + std::string("b");
#else
auto const joined = parameter + Strings::buildNamedParameter("b", value);
#endif
