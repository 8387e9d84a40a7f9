// Names and signatures of the module: this unit has only to compile.

#include "1Base/BaseMacOS/BaseMacOS.h"

#include <type_traits>

namespace {

using namespace MacOS;

static_assert(sftPreferences == 0 && sftDocuments == 1 && sftSharedUserData == 2 &&
              sftDesktop == 3 && sftLibrary == 4 && sftPrograms == 5 && sftFonts == 6 &&
              sftTemporaryItems == 7 && sftApplicationSupport == 8);
static_assert(sfdLocal == 0 && sfdUser == 1 && sfdSystem == 2);
static_assert(std::is_same_v<std::underlying_type_t<TSystemFolderType>, Config::Int32>);
static_assert(std::is_same_v<std::underlying_type_t<TSystemFolderDomain>, Config::Int32>);

using TText = Strings::string;

static_assert(std::is_same_v<decltype(addingPercentEscapes), TText(TText const&)>);
static_assert(std::is_same_v<decltype(getUserName), TText(bool)>);
static_assert(std::is_same_v<decltype(getMachineName), TText()>);
static_assert(std::is_same_v<decltype(getModelIdentifier), TText()>);
static_assert(std::is_same_v<decltype(getUserEmailAddress), TText()>);
static_assert(std::is_same_v<decltype(usesMetricSystem), bool()>);
static_assert(std::is_same_v<decltype(setHiddenAttribute), bool(TText const&, bool)>);
static_assert(std::is_same_v<decltype(createBookmarkFile), bool(TText const&, TText const&)>);
static_assert(std::is_same_v<decltype(resolveBookmarkFile), bool(TText const&, TText&)>);
static_assert(
    std::is_same_v<decltype(getSpecialFolder), TText(TSystemFolderType, TSystemFolderDomain)>);
static_assert(std::is_same_v<decltype(isShiftPressed), bool()>);
static_assert(std::is_same_v<decltype(isControlPressed), bool()>);
static_assert(std::is_same_v<decltype(isOptionPressed), bool()>);
static_assert(std::is_same_v<decltype(isCmdPressed), bool()>);
static_assert(std::is_same_v<decltype(isAlphaLockPressed), bool()>);

} // namespace
