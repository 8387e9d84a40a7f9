/// The exceptions and loggers of the file system.
#ifndef QORN_2SYSTEM_FILESYSEXC_H
#define QORN_2SYSTEM_FILESYSEXC_H

#include "1Base/Error/ErrorSystem.h"

namespace FileSys {

TEMPLMETA_TAG_NAME(FileSys);
TEMPLMETA_TAG_NAME(FileSpec);
TEMPLMETA_TAG_NAME(FileInfo);
TEMPLMETA_TAG_NAME(FileSysOp);

/// Everything that deals with files. Never raised itself.
using TExcFileSys = Error::TExc<TemplMeta::CTag<CTag_Name_FileSys<char const*>>, TExcSystem>;

/// A path that does not name what it should.
using TExcFileSpec = Error::TExc<TemplMeta::CTag<CTag_Name_FileSpec<char const*>>, TExcFileSys>;

/// A fact about a file that can't be had. Never raised itself.
using TExcFileInfo = Error::TExc<TemplMeta::CTag<CTag_Name_FileInfo<char const*>>, TExcFileSys>;

/// An act on files that failed. Never raised itself.
using TExcFileSysOp = Error::TExc<TemplMeta::CTag<CTag_Name_FileSysOp<char const*>>, TExcFileSys>;

/// Level one.
using TLoggerFileSysBase =
    Error::CLogger<TemplMeta::CTag<CTag_Name_FileSys<char const*>>, Error::TStdSeverities,
                   Error::TStdTargets, TLoggerSystem, TemplMeta::CAnd>;

/// Level two, used by file operations.
using TLoggerFileSys =
    Error::CLogger<TemplMeta::CTag<CTag_Name_FileSys<char const*>>, Error::TStdSeverities,
                   Error::TStdTargets, TLoggerFileSysBase, TemplMeta::CAnd>;

} // namespace FileSys

#endif
