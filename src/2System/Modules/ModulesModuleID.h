/// The name of a loaded module, for questions about it.
#ifndef QORN_2SYSTEM_MODULESMODULEID_H
#define QORN_2SYSTEM_MODULESMODULEID_H

#include "1Base/Config/ConfigInt.h"

#include <CoreFoundation/CoreFoundation.h>

namespace Modules {

/// Type 0 says that the module is given by its bundle; nobody answers questions about another
/// type. The bundle is not owned: it lives at least as long as the id is used.
class CModuleID {
  public:
    /// @{
    /// Keeps the bundle without retaining it; the type is 0 where none is given.
    explicit CModuleID(CFBundleRef bundle) : CModuleID(0, bundle) {}
    CModuleID(Config::Int32 type, CFBundleRef bundle) : type_(type), bundle_(bundle) {}
    /// @}

    /// @{
    /// What the constructor was given.
    Config::Int32 getType() const { return type_; }
    CFBundleRef getBundle() const { return bundle_; }
    /// @}

  private:
    Config::Int32 type_;
    CFBundleRef bundle_;
};

/// As the functions of SysInfo take it.
using ModuleID_t = CModuleID;

} // namespace Modules

#endif
