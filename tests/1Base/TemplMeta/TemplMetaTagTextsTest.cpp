// Every tag in use with its text. Texts are compared by hosts and written to logs, so a rename is a
// decision.

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Error/Error.h"
#include "1Base/StdUtil/StdUtilExc.h"
#include "1Base/Strings/Strings.h"
#include "2System/FileSys/FileSysExc.h"
#include "2System/Modules/ModulesExc.h"
#include "2System/SysInfo/SysInfoExc.h"
#include "2System/Time/TimeExc.h"

#include <gtest/gtest.h>

#include <type_traits>

namespace {

// The class has neither data nor virtual functions, and says `text` already at compile time.
template <class TName>
void expectText(char const* text) {
    static_assert(std::is_empty_v<TName> && !std::is_polymorphic_v<TName>);
    static_assert(std::is_same_v<decltype(TName::get_tag_name()), char const*>);
    static_assert(std::is_empty_v<TemplMeta::CTag<TName>>);
    constexpr char const* said = TName::get_tag_name();
    constexpr char const* saidByTag = TemplMeta::getTagName<TemplMeta::CTag<TName>>();
    EXPECT_STREQ(said, text);
    EXPECT_STREQ(saidByTag, text);
}

TEST(CTemplMetaTagTextsTest, ATextIsTheTailOfTheClassName) {
    expectText<CTag_Name_System<char const*>>("System");
    expectText<Encoding::CTag_Name_Encoding<char const*>>("Encoding");
    expectText<Strings::Detail::CTag_Name_EncUTF16<char const*>>("EncUTF16");
    expectText<StdUtil::CTag_Name_StreamCast<char const*>>("StreamCast");
    expectText<Error::CTag_Name_Error<char const*>>("Error");
    expectText<Error::CTag_Name_ErrorAssert<char const*>>("ErrorAssert");
    expectText<Error::CTag_Name_StdLibException<char const*>>("StdLibException");
    expectText<Error::CTag_Name_BadAllocException<char const*>>("BadAllocException");
    expectText<Error::CTag_Name_SevDebug<char const*>>("SevDebug");
    expectText<Error::CTag_Name_SevLog<char const*>>("SevLog");
    expectText<Error::CTag_Name_SevInfo<char const*>>("SevInfo");
    expectText<Error::CTag_Name_SevWarn<char const*>>("SevWarn");
    expectText<Error::CTag_Name_SevError<char const*>>("SevError");
    expectText<Error::CTag_Name_SevFatal<char const*>>("SevFatal");
    expectText<Error::CTag_Name_TgtLogger<char const*>>("TgtLogger");
    expectText<Error::CTag_Name_TgtUser<char const*>>("TgtUser");
    expectText<Error::CTag_Name_TgtDebugger<char const*>>("TgtDebugger");
    expectText<FileSys::CTag_Name_FileSys<char const*>>("FileSys");
    expectText<FileSys::CTag_Name_FileSpec<char const*>>("FileSpec");
    expectText<FileSys::CTag_Name_FileInfo<char const*>>("FileInfo");
    expectText<FileSys::CTag_Name_FileSysOp<char const*>>("FileSysOp");
    expectText<Modules::CTag_Name_Modules<char const*>>("Modules");
    expectText<Modules::CTag_Name_DyLib<char const*>>("DyLib");
    expectText<Modules::CTag_Name_DyLibNotFound<char const*>>("DyLibNotFound");
    expectText<Modules::CTag_Name_SymbolNotFound<char const*>>("SymbolNotFound");
    expectText<SysInfo::CTag_Name_SysInfo<char const*>>("SysInfo");
    expectText<SysInfo::CTag_Name_SysInfoSystem<char const*>>("SysInfoSystem");
    expectText<SysInfo::CTag_Name_SystemPrefs<char const*>>("SystemPrefs");
    expectText<SysInfo::CTag_Name_PreferenceFolder<char const*>>("PreferenceFolder");
    expectText<Time::CTag_Name_Time<char const*>>("Time");
    expectText<Time::CTag_Name_TimeDate<char const*>>("TimeDate");
    expectText<Time::CTag_Name_TimeTime<char const*>>("TimeTime");
    expectText<Time::CTag_Name_TimeDateTime<char const*>>("TimeDateTime");
    expectText<Time::CTag_Name_TimeFormatError<char const*>>("TimeFormatError");
}

} // namespace
