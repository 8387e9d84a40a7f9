/// What every module takes for granted.
#ifndef QORN_1BASE_CONFIG_H
#define QORN_1BASE_CONFIG_H

#include "1Base/Config/ConfigInt.h"

#endif
