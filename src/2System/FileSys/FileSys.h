/// Naming files and folders.
#ifndef QORN_2SYSTEM_FILESYS_H
#define QORN_2SYSTEM_FILESYS_H

#include "2System/FileSys/FileSysFileSpec.h"

#endif
