#include "2System/Modules/ModulesDyLib.h"

#include "1Base/Error/ErrorMacros.h"
#include "2System/MacOS/MacOSTempCFString.h"
#include "2System/Modules/ModulesExc.h"

#include <dlfcn.h>

namespace Modules {
namespace {

bool isValid(TLibraryRef const& library) {
    return library.first != nullptr || library.second != nullptr;
}

CFBundleRef getBundle(FileSys::CFileSpec const& spec) {
    MacOS::CTempCFString const path(spec.getFullName(false));
    CFURLRef const url = CFURLCreateWithFileSystemPath(kCFAllocatorDefault, path.get(),
                                                       kCFURLPOSIXPathStyle, spec.isFolder());
    if (url == nullptr)
        return nullptr;
    CFBundleRef const bundle = CFBundleCreate(kCFAllocatorDefault, url);
    CFRelease(url);
    return bundle;
}

// Null where there is no bundle, or none that can be loaded.
CFBundleRef loadBundle(FileSys::CFileSpec const& spec) {
    CFBundleRef const bundle = getBundle(spec);
    if (bundle == nullptr || CFBundleLoadExecutable(bundle))
        return bundle;
    CFRelease(bundle);
    return nullptr;
}

TLibraryRef load(FileSys::CFileSpec const& spec) {
    auto const name = spec.getFullName<std::string>(false);
    CFBundleRef const bundle = loadBundle(spec);
    return TLibraryRef(bundle, ::dlopen(name.c_str(), RTLD_LAZY));
}

Strings::CParameterList<wchar_t> notFound(std::string const& type, std::string const& key) {
    return Strings::CParameterList<wchar_t>(ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key)));
}

// Behind the blank stands the loaders' reason, which nobody asks them for. Callers match the key
// with its blank.
Strings::CParameterList<wchar_t> libraryNotFound(FileSys::CFileSpec const& spec) {
    return notFound("dynamic link library", spec.getFullName<std::string>(false) + ' ');
}

void* findSymbol(TLibraryRef const& library, Strings::string const& name) {
    if (library.first != nullptr)
        return CFBundleGetFunctionPointerForName(library.first, MacOS::CTempCFString(name).get());
    if (library.second != nullptr)
        return ::dlsym(library.second, Encoding::convert<std::string>(name).c_str());
    return nullptr;
}

} // namespace

TLibraryRef loadLibrary(FileSys::CFileSpec const& spec, LoadFlags) {
    TLibraryRef const library = load(spec);
    if (!isValid(library))
        ERROR_THROW(TExcDyLibNotFound, Error::msgNotFound, libraryNotFound(spec));
    return library;
}

void unloadLibrary(TLibraryRef library) {
    if (library.first != nullptr) {
        CFBundleUnloadExecutable(library.first);
        CFRelease(library.first);
    }
    if (library.second != nullptr)
        ::dlclose(library.second);
}

CDyLib::CDyLib(FileSys::CFileSpec const& spec, LoadFlags) : library_(load(spec)) {
    if (!isValid(library_))
        ERROR_THROW(TExcDyLibNotFound, Error::msgNotFound, libraryNotFound(spec));
}

CDyLib::~CDyLib() {
    unloadLibrary(library_);
}

void* CDyLib::getSymbol(Strings::string const& name) const {
    void* const symbol = findSymbol(library_, name);
    if (symbol == nullptr)
        ERROR_THROW(TExcSymbolNotFound, Error::msgNotFound,
                    notFound("symbol", Encoding::convert<std::string>(name)));
    return symbol;
}

} // namespace Modules
