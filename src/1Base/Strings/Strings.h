/// Text: the string kinds.
#ifndef QORN_1BASE_STRINGS_H
#define QORN_1BASE_STRINGS_H

#include "1Base/Strings/StringsKinds.h"

#endif
