/// Makes the codecs of the legacy encodings from what knows their tables.
#ifndef QORN_0PLATFORM_CFCODECTABLEMAKER_H
#define QORN_0PLATFORM_CFCODECTABLEMAKER_H

#include "0Platform/CoreFoundation/_Imp/CFCodecTable.h"

#include <memory>

namespace CFPlatform {

/// Whether a base and its combining mark are written as the composed character where the encoding
/// has it, though it lacks the mark.
enum class Composition { none, canonical };

/// A codec over `table`, whose data is never freed. Raises std::bad_alloc.
std::unique_ptr<TableCodec> makeTableCodec(DecodeTable const& table, Composition composition);

/// The codec of an encoding that ICU has a converter for. Null where this ICU lacks it. Raises
/// std::bad_alloc.
std::unique_ptr<TableCodec> makeConverterCodec(char const* name, Composition composition);

/// The built-in tables: ISO 8859-1 with its C1 controls, and Windows code page 1252 without its
/// unassigned bytes.
extern DecodeTable const tableISOLatin1;
extern DecodeTable const tableWindowsLatin1;

} // namespace CFPlatform

#endif
