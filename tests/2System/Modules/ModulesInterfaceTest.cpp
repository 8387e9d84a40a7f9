// Names, values and signatures of the module: this unit has only to compile.

#include "2System/Modules/Modules.h"

#include <cstdint>
#include <type_traits>
#include <utility>

namespace {

using Modules::CDyLib;
using Modules::CModuleID;

static_assert(std::is_same_v<Modules::TLibraryRef, std::pair<__CFBundle*, void*>>);
static_assert(std::is_same_v<Modules::LoadFlags, unsigned long>);
static_assert(std::is_same_v<decltype(Modules::loadLibrary),
                             Modules::TLibraryRef(FileSys::CFileSpec const&, Modules::LoadFlags)>);
static_assert(std::is_same_v<decltype(Modules::unloadLibrary), void(Modules::TLibraryRef)>);

static_assert(std::is_constructible_v<CDyLib, FileSys::CFileSpec const&, Modules::LoadFlags>);
static_assert(
    std::is_same_v<decltype(&CDyLib::getSymbol), void* (CDyLib::*)(Strings::string const&) const>);
static_assert(!std::is_default_constructible_v<CDyLib>);
static_assert(!std::is_copy_constructible_v<CDyLib> && !std::is_copy_assignable_v<CDyLib>);
static_assert(!std::is_move_constructible_v<CDyLib> && !std::is_move_assignable_v<CDyLib>);
static_assert(std::is_nothrow_destructible_v<CDyLib> && !std::is_polymorphic_v<CDyLib>);
static_assert(sizeof(CDyLib) == sizeof(Modules::TLibraryRef));

static_assert(std::is_same_v<Modules::ModuleID_t, CModuleID>);
static_assert(std::is_constructible_v<CModuleID, CFBundleRef>);
static_assert(std::is_constructible_v<CModuleID, std::int32_t, CFBundleRef>);
static_assert(!std::is_default_constructible_v<CModuleID>);
static_assert(!std::is_convertible_v<CFBundleRef, CModuleID>);
static_assert(std::is_copy_constructible_v<CModuleID> && std::is_copy_assignable_v<CModuleID>);
static_assert(std::is_same_v<decltype(&CModuleID::getType), std::int32_t (CModuleID::*)() const>);
static_assert(std::is_same_v<decltype(&CModuleID::getBundle), CFBundleRef (CModuleID::*)() const>);

static_assert(std::is_base_of_v<Modules::TExcDyLib, Modules::TExcDyLibNotFound>);
static_assert(std::is_base_of_v<Modules::TExcDyLib, Modules::TExcSymbolNotFound>);
static_assert(std::is_base_of_v<Modules::TExcModules, Modules::TExcDyLib>);
static_assert(std::is_base_of_v<TExcSystem, Modules::TExcModules>);
static_assert(!std::is_base_of_v<Modules::TExcDyLibNotFound, Modules::TExcSymbolNotFound>);

} // namespace
