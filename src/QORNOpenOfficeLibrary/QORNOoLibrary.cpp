#include "QORNOpenOfficeLibrary/QORNOoLibrary.h"
#include "QORNOpenOfficeLibrary/QORNOoLibraryPaths.h"

#include "2System/MacOS/MacOSCFStringConverter.h"

namespace {

std::vector<FileSys::CFileSpec> gPaths;

void initializeLibraryImpl(FileSys::CFileSpec const& folder1, FileSys::CFileSpec const& folder2,
                           FileSys::CFileSpec const& folder3, FileSys::CFileSpec const& folder4,
                           FileSys::CFileSpec const& folder5, bool) {
    gPaths.push_back(folder1);
    gPaths.push_back(folder2);
    gPaths.push_back(folder3);
    gPaths.push_back(folder4);
    gPaths.push_back(folder5);
}

} // namespace

void initializeLibraryImplMacOS(CFStringRef folder1, CFStringRef folder2, CFStringRef folder3,
                                CFStringRef folder4, CFStringRef folder5, bool flag) {
    // One statement each: the order in which a call's arguments are evaluated is open.
    FileSys::CFileSpec const spec1(MacOS::GetStringFromCFString(folder1));
    FileSys::CFileSpec const spec2(MacOS::GetStringFromCFString(folder2));
    FileSys::CFileSpec const spec3(MacOS::GetStringFromCFString(folder3));
    FileSys::CFileSpec const spec4(MacOS::GetStringFromCFString(folder4));
    FileSys::CFileSpec const spec5(MacOS::GetStringFromCFString(folder5));
    initializeLibraryImpl(spec1, spec2, spec3, spec4, spec5, flag);
}

int startSuppressingDialogsImpl() {
    return 0;
}

std::vector<FileSys::CFileSpec> const& getPaths() {
    return gPaths;
}
