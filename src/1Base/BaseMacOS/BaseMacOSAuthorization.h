/// Running commands with rights that the process has not got.
///
///     class CHelper : public MacOS::CAuthorizationBase {
///       public:
///         bool isAuthorized() override { return connection_.isOpen(); }
///         bool execute(Strings::stringUTF8 tool,
///                      std::vector<Strings::stringUTF8> args) override {
///             return connection_.run(tool, args) == 0;
///         }
///     };
#ifndef QORN_1BASE_BASEMACOSAUTHORIZATION_H
#define QORN_1BASE_BASEMACOSAUTHORIZATION_H

#include "1Base/Strings/StringsKinds.h"

#include <vector>

namespace MacOS {

/// Supplied by the host, which alone knows how rights are asked for. What an operation throws
/// passes to the caller.
class CAuthorizationBase {
  public:
    virtual ~CAuthorizationBase() = default;

    /// Whether commands can be run with higher rights now. Must not ask the user.
    virtual bool isAuthorized() = 0;

    /// Obtains the rights, asking the user where need be, and says whether they are there. A host
    /// calls it at a moment of its own choice; the library never does.
    virtual bool authorize() { return false; }

    /// Runs the tool, an absolute path, with these arguments and waits for its end. No shell comes
    /// between: blanks and quotes in an argument are part of it. True where the tool succeeded.
    virtual bool execute(Strings::stringUTF8 tool, std::vector<Strings::stringUTF8> args) = 0;
};

} // namespace MacOS

#endif
