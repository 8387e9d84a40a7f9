#include "1Base/Error/ErrorMacros.h"
#include "1Base/Strings/StringsParameterList.h"
#include "2System/FileSys/FileSysFileSpec.h"

#include "support/ObjectCount.h"

namespace {

using CFileSysParameterTest = TestSupport::CObjectCountTest;

TEST_F(CFileSysParameterTest, AFileSpecificationIsAValueLikeAnyOther) {
    FileSys::CFileSpec const fs(L"/home/ren\u00E9");
    Strings::CParameterList<wchar_t> const list =
        ERROR_PARAMS(ERROR_PARAM(fs), ERROR_PARAM(fs.getFullName(false)));
    ASSERT_EQ(list.size(), 2U);
    EXPECT_EQ(list.begin()->getName(), "fs");
    EXPECT_EQ(list.begin()->getValue(), L"/home/ren\u00E9");
    EXPECT_EQ((list.begin() + 1)->getName(), "fs.getFullName(false)");
    EXPECT_EQ((list.begin() + 1)->getValue(), L"/home/ren\u00E9");
}

} // namespace
