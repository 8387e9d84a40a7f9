/// The private exceptions and log lines of file specifications.
#ifndef QORN_2SYSTEM_FILESYSFILESPECEXC_H
#define QORN_2SYSTEM_FILESYSFILESPECEXC_H

#include "2System/FileSys/FileSysExc.h"

// Each unit has a type of its own, which only its name tells from the public tag: callers catch one
// of the two parents.
namespace {

TEMPLMETA_TAG_NAME(FileInfo);

using TTagSpecFileInfo = TemplMeta::CTag<CTag_Name_FileInfo<char const*>>;

using TExcSpecFileInfo =
    Error::TExc<TTagSpecFileInfo, FileSys::TExcFileInfo, FileSys::TExcFileSpec>;

using TLoggerSpecFileInfo =
    Error::CLogger<TTagSpecFileInfo, Error::TStdSeverities, Error::TStdTargets,
                   FileSys::TLoggerFileSysBase, TemplMeta::CAnd>;

} // namespace

#endif
