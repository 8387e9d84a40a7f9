/// What the system adds to the standard streams: files by wide path, a stream over a buffer, string
/// streams with a numeric mode, and a few helpers.
#ifndef QORN_1BASE_STREAMS_H
#define QORN_1BASE_STREAMS_H

#include "1Base/Streams/StreamsBuffer.h"
#include "1Base/Streams/StreamsFile.h"
#include "1Base/Streams/StreamsHelpers.h"
#include "1Base/Streams/StreamsString.h"
#include "1Base/Streams/StreamsTypes.h"

#endif
