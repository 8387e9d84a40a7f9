/// Loading shared libraries at run time, and naming loaded modules.
#ifndef QORN_2SYSTEM_MODULES_H
#define QORN_2SYSTEM_MODULES_H

#include "2System/Modules/ModulesDyLib.h"
#include "2System/Modules/ModulesExc.h"
#include "2System/Modules/ModulesModuleID.h"

#endif
