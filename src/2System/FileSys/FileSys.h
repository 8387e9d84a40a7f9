/// Naming files and folders, asking about them, walking and changing them.
#ifndef QORN_2SYSTEM_FILESYS_H
#define QORN_2SYSTEM_FILESYS_H

#include "2System/FileSys/FileSysDirIterator.h"
#include "2System/FileSys/FileSysExc.h"
#include "2System/FileSys/FileSysFileInfo.h"
#include "2System/FileSys/FileSysFileSpec.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/FileSysTempFile.h"

#endif
