/// Loading a shared library at run time and finding symbols in it, over both of the platform's
/// loaders: that of bundles and dlopen.
///
///     Modules::CDyLib const library(L"/usr/lib/x86_64-linux-gnu/libm.so.6", 0);
///     auto const cosine = reinterpret_cast<double (*)(double)>(library.getSymbol(L"cos"));
///     cosine(0);   // 1
///
/// There is no lock here: what the loaders guarantee is all there is.
#ifndef QORN_2SYSTEM_MODULESDYLIB_H
#define QORN_2SYSTEM_MODULESDYLIB_H

#include "1Base/Strings/StringsKinds.h"
#include "2System/FileSys/FileSysFileSpec.h"

#include <CoreFoundation/CoreFoundation.h>

#include <utility>

namespace Modules {

/// A loaded library: its bundle and its handle of dlopen. Each loader is always tried, so one
/// library may be held by both; at least one of the two is not null.
using TLibraryRef = std::pair<CFBundleRef, void*>;

/// Nothing reads the flags: symbols are always bound at their first use.
using LoadFlags = unsigned long;

/// Loads a bundle folder, or a library file: its name goes to dlopen as it is, so one without a
/// separator is looked for in the system's folders. The caller owns the result and gives it to
/// unloadLibrary(). Raises TExcDyLibNotFound where neither loader takes it, for whatever reason.
TLibraryRef loadLibrary(FileSys::CFileSpec const& spec, LoadFlags flags);

/// Undoes the load, the bundle before the handle. A loader's failure goes unnoticed.
void unloadLibrary(TLibraryRef library);

/// A library that is loaded as long as the object lives.
class CDyLib {
  public:
    /// Loads as loadLibrary() does, and raises the same.
    CDyLib(FileSys::CFileSpec const& spec, LoadFlags flags);

    CDyLib(CDyLib const&) = delete;
    CDyLib& operator=(CDyLib const&) = delete;

    ~CDyLib();

    /// The address of a symbol, valid as long as this object lives. Where there is a bundle, that
    /// alone is asked, also for what only the handle knows. Raises TExcSymbolNotFound for an
    /// unknown name, and for a symbol whose address is null.
    void* getSymbol(Strings::string const& name) const;

  private:
    TLibraryRef library_;
};

} // namespace Modules

#endif
