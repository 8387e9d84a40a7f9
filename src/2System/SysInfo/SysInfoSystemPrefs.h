/// What all stores of preferences have in common.
///
///     SysInfo::CSystemPrefsPath const path("Acme/Editor");
///     path.get();   // "Acme/Editor"
#ifndef QORN_2SYSTEM_SYSINFOSYSTEMPREFS_H
#define QORN_2SYSTEM_SYSINFOSYSTEMPREFS_H

#include "1Base/Config/ConfigInt.h"

#include <string>
#include <utility>

namespace SysInfo {

/// What a store is asked for by: whose it is, and what for.
class CSystemPrefs {
  public:
    /// Whose preferences: all users' of the machine, or the user's own.
    enum EKind : Config::Int32 { ekMachine, ekUser };

    /// What the store is opened for.
    enum ERight : Config::Int32 { erRead, erWrite };
};

/// A relative path within a store, in UTF-8, such as a maker's and a program's name. Kept as it is
/// given: nothing is checked, ".." included. The empty one is the store itself.
class CSystemPrefsPath {
  public:
    /// The store itself.
    CSystemPrefsPath() = default;

    /// Keeps a copy.
    explicit CSystemPrefsPath(std::string path) : path_(std::move(path)) {}

    /// The path as it was given.
    std::string get() const { return path_; }

  private:
    std::string path_;
};

} // namespace SysInfo

#endif
