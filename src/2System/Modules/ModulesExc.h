/// The exceptions of dynamic libraries.
#ifndef QORN_2SYSTEM_MODULESEXC_H
#define QORN_2SYSTEM_MODULESEXC_H

#include "1Base/Error/ErrorSystem.h"

namespace Modules {

TEMPLMETA_TAG_NAME(Modules);
TEMPLMETA_TAG_NAME(DyLib);
TEMPLMETA_TAG_NAME(DyLibNotFound);
TEMPLMETA_TAG_NAME(SymbolNotFound);

/// Everything that deals with modules. Never raised itself.
using TExcModules = Error::TExc<TemplMeta::CTag<CTag_Name_Modules<char const*>>, TExcSystem>;

/// Everything that deals with a dynamic library. Never raised itself.
using TExcDyLib = Error::TExc<TemplMeta::CTag<CTag_Name_DyLib<char const*>>, TExcModules>;

/// A library or bundle that cannot be found or loaded.
using TExcDyLibNotFound =
    Error::TExc<TemplMeta::CTag<CTag_Name_DyLibNotFound<char const*>>, TExcDyLib>;

/// A symbol that a loaded library lacks.
using TExcSymbolNotFound =
    Error::TExc<TemplMeta::CTag<CTag_Name_SymbolNotFound<char const*>>, TExcDyLib>;

} // namespace Modules

#endif
