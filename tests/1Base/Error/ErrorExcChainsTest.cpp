// Every chain of the system, raised at each of its levels and caught at each level of all of them.

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Error/Error.h"
#include "1Base/StdUtil/StdUtilExc.h"
#include "2System/FileSys/FileSysExc.h"
#include "2System/Modules/ModulesExc.h"
#include "2System/SysInfo/SysInfoExc.h"
#include "2System/Time/TimeExc.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <exception>
#include <ostream>
#include <string>
#include <type_traits>
#include <vector>

// The chains of single files, declared as those files declare them: the tag "FileInfo" is another
// one than the public tag of that name.
namespace {

TEMPLMETA_TAG_NAME(FileInfo);
TEMPLMETA_TAG_NAME(OSFile);

using TExcPrivateFileInfo = Error::TExc<TemplMeta::CTag<CTag_Name_FileInfo<char const*>>,
                                        FileSys::TExcFileInfo, FileSys::TExcFileSpec>;
using TExcOSFile = Error::TExc<TemplMeta::CTag<CTag_Name_OSFile<char const*>>,
                               FileSys::TExcFileSysOp, FileSys::TExcFileSpec>;

// A level: how it is named here, its tag's name, the levels directly above it, and how it is raised
// and caught.
struct CLevel {
    std::string id;
    std::string name;
    std::vector<std::string> parents;
    void (*raise)();
    bool (*catches)(void (*raise)());
};

std::ostream& operator<<(std::ostream& stream, CLevel const& level) {
    return stream << level.id;
}

template <class TExcX>
void raise() {
    ERROR_THROW(TExcX, Error::msgAccessConflict);
}

template <class TExcX>
bool catches(void (*raise)()) {
    try {
        raise();
    } catch (TExcX const&) {
        return true;
    } catch (...) {
    }
    return false;
}

template <class TExcX>
CLevel levelOf(std::string const& id, std::string const& name,
               std::vector<std::string> const& parents) {
    return {id, name, parents, raise<TExcX>, catches<TExcX>};
}

std::vector<CLevel> const& levels() {
    static std::vector<CLevel> const all = {
        levelOf<TExcSystem>("System", "System", {}),
        levelOf<FileSys::TExcFileSys>("FileSys", "FileSys", {"System"}),
        levelOf<FileSys::TExcFileSpec>("FileSpec", "FileSpec", {"FileSys"}),
        levelOf<FileSys::TExcFileInfo>("FileInfo", "FileInfo", {"FileSys"}),
        levelOf<FileSys::TExcFileSysOp>("FileSysOp", "FileSysOp", {"FileSys"}),
        levelOf<TExcPrivateFileInfo>("PrivateFileInfo", "FileInfo", {"FileInfo", "FileSpec"}),
        levelOf<TExcOSFile>("OSFile", "OSFile", {"FileSysOp", "FileSpec"}),
        levelOf<Modules::TExcModules>("Modules", "Modules", {"System"}),
        levelOf<Modules::TExcDyLib>("DyLib", "DyLib", {"Modules"}),
        levelOf<Modules::TExcDyLibNotFound>("DyLibNotFound", "DyLibNotFound", {"DyLib"}),
        levelOf<Modules::TExcSymbolNotFound>("SymbolNotFound", "SymbolNotFound", {"DyLib"}),
        levelOf<SysInfo::TExcSysInfo>("SysInfo", "SysInfo", {"System"}),
        levelOf<SysInfo::TExcSysInfoSystem>("SysInfoSystem", "SysInfoSystem", {"SysInfo"}),
        levelOf<SysInfo::TExcSystemPrefs>("SystemPrefs", "SystemPrefs", {"SysInfo"}),
        levelOf<SysInfo::TExcPreferenceFolder>("PreferenceFolder", "PreferenceFolder",
                                               {"SystemPrefs"}),
        levelOf<Time::TExcTimeDate>("TimeDate", "TimeDate", {}),
        levelOf<Time::TExcTimeTime>("TimeTime", "TimeTime", {}),
        levelOf<Time::TExcTimeDateTime>("TimeDateTime", "TimeDateTime", {"TimeDate", "TimeTime"}),
        levelOf<Time::TExcTimeFormatError>("TimeFormatError", "TimeFormatError", {"TimeDateTime"}),
        levelOf<Encoding::TExcEncoding>("Encoding", "Encoding", {}),
        levelOf<StdUtil::TExcStreamCast>("StreamCast", "StreamCast", {}),
        levelOf<Error::TExcErrorAssert>("ErrorAssert", "ErrorAssert", {}),
        levelOf<Error::TExcStdLibException>("StdLibException", "StdLibException", {}),
        levelOf<Error::TExcBadAllocException>("BadAllocException", "BadAllocException",
                                              {"StdLibException"}),
    };
    return all;
}

CLevel const& levelWithId(std::string const& id) {
    return *std::find_if(levels().begin(), levels().end(),
                         [&id](CLevel const& level) { return level.id == id; });
}

bool isAtOrBelow(CLevel const& level, CLevel const& other) {
    if (level.id == other.id)
        return true;
    return std::any_of(
        level.parents.begin(), level.parents.end(),
        [&other](std::string const& parent) { return isAtOrBelow(levelWithId(parent), other); });
}

class CErrorExcChainsTest : public testing::TestWithParam<CLevel> {};

TEST_P(CErrorExcChainsTest, IsCaughtAtItsLevelAndAllAboveAndAtNoOther) {
    for (CLevel const& other : levels())
        EXPECT_EQ(other.catches(GetParam().raise), isAtOrBelow(GetParam(), other)) << other.id;
}

TEST_P(CErrorExcChainsTest, IsCaughtAtTheRootWithItsOwnName) {
    try {
        GetParam().raise();
        FAIL() << "nothing was raised";
    } catch (Error::CException const& exc) {
        EXPECT_EQ(exc.getExcName(), GetParam().name);
    }
}

TEST_P(CErrorExcChainsTest, IsNoStandardException) {
    EXPECT_FALSE(catches<std::exception>(GetParam().raise));
}

INSTANTIATE_TEST_SUITE_P(All, CErrorExcChainsTest, testing::ValuesIn(levels()),
                         [](auto const& level) { return level.param.id; });

TEST(CErrorExcLevelTest, ALevelMayHaveFiveParents) {
    using TFive = Error::TExc<TemplMeta::CTag<CTag_Name_OSFile<char const*>>, Time::TExcTimeDate,
                              Time::TExcTimeTime, Encoding::TExcEncoding, StdUtil::TExcStreamCast,
                              Error::TExcErrorAssert>;
    EXPECT_TRUE(catches<TFive>(raise<TFive>));
    EXPECT_TRUE(catches<Time::TExcTimeDate>(raise<TFive>));
    EXPECT_TRUE(catches<Time::TExcTimeTime>(raise<TFive>));
    EXPECT_TRUE(catches<Encoding::TExcEncoding>(raise<TFive>));
    EXPECT_TRUE(catches<StdUtil::TExcStreamCast>(raise<TFive>));
    EXPECT_TRUE(catches<Error::TExcErrorAssert>(raise<TFive>));
    EXPECT_TRUE(catches<Error::CException>(raise<TFive>));
    EXPECT_FALSE(catches<TExcSystem>(raise<TFive>));
}

// A lattice has one object of each level: a conversion to it would otherwise be ambiguous.
static_assert(std::is_convertible_v<TExcOSFile*, FileSys::TExcFileSys*>);
static_assert(std::is_convertible_v<TExcPrivateFileInfo*, FileSys::TExcFileSys*>);
static_assert(std::is_convertible_v<Error::XExc<TExcOSFile>*, TExcSystem*>);
static_assert(std::is_convertible_v<Error::XExc<TExcOSFile>*, Error::CException*>);
static_assert(!std::is_same_v<TExcPrivateFileInfo, FileSys::TExcFileInfo>);

} // namespace
