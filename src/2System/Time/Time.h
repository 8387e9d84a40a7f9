/// Dates, times of day, and their written forms.
#ifndef QORN_2SYSTEM_TIME_H
#define QORN_2SYSTEM_TIME_H

#include "2System/Time/TimeDate.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/TimeTime.h"

#endif
