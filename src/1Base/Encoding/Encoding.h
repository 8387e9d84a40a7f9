/// Conversion between the string kinds, normalisation, and the named legacy encodings.
#ifndef QORN_1BASE_ENCODING_H
#define QORN_1BASE_ENCODING_H

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Encoding/EncodingNormalize.h"
#include "1Base/Encoding/EncodingSysEncoding.h"
#include "1Base/Encoding/EncodingUTF8.h"

#endif
