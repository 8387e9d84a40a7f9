/// Text: the string kinds, comparison and case.
#ifndef QORN_1BASE_STRINGS_H
#define QORN_1BASE_STRINGS_H

#include "1Base/Strings/StringsCase.h"
#include "1Base/Strings/StringsCompare.h"
#include "1Base/Strings/StringsKinds.h"

#endif
