# shellcheck shell=bash
# shellcheck source=tests/scripts/support.sh
source "$(dirname -- "${BASH_SOURCE[0]}")/support.sh"

# accepts <file> <include line>
accepts() {
  add_file "$1" <<<"$2"
  commit_all
  expect_success "$root/scripts/check-includes" "$project"
}

# rejects <file> <include line> <what is said of it>
rejects() {
  add_file "$1" <<<"$2"
  commit_all
  expect_failure 123 "$1:1: $3" "$root/scripts/check-includes" "$project"
}

OwnAndLowerFloorsPass() {
  accepts src/2System/FileSys/A.h '#include "2System/FileSys/B.h"'
  accepts src/2System/FileSys/B.h '#include "1Base/Strings/Strings.h"'
  accepts src/QORNOpenOfficeLibrary/C.cpp '#include "2System/FileSys/A.h"'
  accepts src/2System/FileSys/D.h '#include <string>'
}

AnIncludeThatRunsUpwardFails() {
  rejects src/1Base/Strings/A.h '#include "2System/FileSys/FileSys.h"' '1Base includes upward'
}

ThePlatformIncludesNobody() {
  rejects src/0Platform/A.cpp '#include "1Base/Strings/Strings.h"' '0Platform includes upward'
}

NobodyIncludesTheBridge() {
  rejects src/3Util/A.h '#include "QORNOpenOfficeLibrary/QORNOoLibrary.h"' '3Util includes upward'
}

BlanksInTheDirectiveHideNothing() {
  rejects src/1Base/A.h '  #  include   "2System/FileSys/FileSys.h"' '1Base includes upward'
}

TheCurrentFolderIsNoRoot() {
  rejects src/1Base/Strings/A.h '#include "B.h"' '"B.h" is not a path from src/'
}

AStepUpIsNoPathFromTheRoot() {
  rejects src/1Base/Strings/A.h '#include "../Error/Error.h"' '"../Error/Error.h" is not a path'
}

OwnFilesBelongInQuotes() {
  rejects src/1Base/Strings/A.h '#include <1Base/Error/Error.h>' '<1Base/Error/Error.h> belongs in'
}

AnIncludeByMacroFails() {
  rejects src/1Base/Strings/A.h '#include QORN_HEADER' 'an include that cannot be read'
}

AModuleAndItsTestsUseItsPrivateHeaders() {
  accepts src/1Base/Encoding/_Imp/A.cpp '#include "1Base/Encoding/_Imp/Table.h"'
  accepts tests/1Base/Encoding/ATest.cpp '#include "1Base/Encoding/_Imp/Table.h"'
  accepts src/1Base/Encoding/A.h '#include "1Base/Encoding/_Imp/Table.h"'
}

AnotherModuleUsesNoPrivateHeader() {
  rejects src/1Base/Error/A.cpp '#include "1Base/Encoding/_Imp/Table.h"' \
    '1Base/Encoding/_Imp/Table.h is private to 1Base/Encoding'
}

AModuleWhoseNameOnlyBeginsAlikeIsAnother() {
  rejects src/1Base/EncodingMore/A.cpp '#include "1Base/Encoding/_Imp/Table.h"' \
    '1Base/Encoding/_Imp/Table.h is private to 1Base/Encoding'
}

TheTestsOfAnotherModuleUseNoPrivateHeader() {
  rejects tests/1Base/Error/ATest.cpp '#include "1Base/Encoding/_Imp/Table.h"' \
    '1Base/Encoding/_Imp/Table.h is private to 1Base/Encoding'
}

ThePlatformIsOneHeader() {
  accepts src/1Base/A.h '#include <CoreFoundation/CoreFoundation.h>'
  accepts src/0Platform/B.h '#include <CoreFoundation/CFString.h>'
}

APartOfThePlatformFails() {
  rejects src/1Base/A.h '#include <CoreFoundation/CFString.h>' 'the platform is <CoreFoundation/'
}

ThePlatformInQuotesFails() {
  rejects src/1Base/A.h '#include "CoreFoundation/CoreFoundation.h"' 'the platform is'
}

ThePlatformByItsPathFails() {
  rejects src/1Base/A.h '#include "0Platform/CoreFoundation/CFString.h"' 'the platform is'
}

TestsUseTheirSupport() {
  accepts tests/1Base/ATest.cpp '#include "support/ObjectCount.h"'
}

SourcesDoNotUseTheTests() {
  rejects src/1Base/A.cpp '#include "support/ObjectCount.h"' '"support/ObjectCount.h" is not a path'
}

run_case "$@"
