// A value is joined to the front of a list; there is no form that appends.

#include "1Base/TemplMeta/TemplMeta.h"

using TList = TemplMeta::CObjList<int, TemplMeta::CNil>;

TList const list(1, TemplMeta::CNil());

#ifdef QORN_WRONG_USE
auto const joined = TemplMeta::CConcatObjList<TList, int>::concat(list, 2);
#else
auto const joined = TemplMeta::CConcatObjList<int, TList>::concat(2, list);
#endif
