// A list on the left must not be taken for a value: it would be nested silently.

#include "1Base/TemplMeta/TemplMeta.h"

using TList = TemplMeta::CObjList<int, TemplMeta::CNil>;

#ifdef QORN_WRONG_USE
using TJoined = TemplMeta::CConcatObjList<TList, TList>::TResult;
#else
using TJoined = TemplMeta::CConcatObjList<int, TList>::TResult;
#endif

static_assert(TemplMeta::listSizeOf<TJoined> == 2);
