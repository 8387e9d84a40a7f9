// A library has one owner: a copy would unload it twice.

#include "2System/Modules/ModulesDyLib.h"

void use(Modules::CDyLib const& library) {
#ifdef QORN_WRONG_USE
    Modules::CDyLib const copy(library);
#else
    Modules::CDyLib const& copy(library);
#endif
    copy.getSymbol(L"symbol");
}
