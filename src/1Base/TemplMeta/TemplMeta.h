/// Compile-time building blocks, all of them.
#ifndef QORN_1BASE_TEMPLMETA_H
#define QORN_1BASE_TEMPLMETA_H

#include "1Base/TemplMeta/TemplMetaObjList.h"
#include "1Base/TemplMeta/TemplMetaTag.h"
#include "1Base/TemplMeta/TemplMetaTypeList.h"

#endif
