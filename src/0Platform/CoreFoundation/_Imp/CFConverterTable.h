/// Reads the tables of an encoding that ICU has a converter for.
///
/// ICU gives its tables away only by converting, so each code is read and each character written
/// once. A lookup in the result costs a tenth of a converter's call, and unlike a converter it may
/// be used by many threads.
#ifndef QORN_0PLATFORM_CFCONVERTERTABLE_H
#define QORN_0PLATFORM_CFCONVERTERTABLE_H

#include "0Platform/CoreFoundation/_Imp/CFDecodeTable.h"

#include <memory>
#include <vector>

namespace CFPlatform {

/// Both directions of one encoding. They differ: some codes are only read.
class ConverterTable {
  public:
    struct Character {
        UInt16 code;
        UniChar unit;
    };

    /// Null where this ICU lacks the converter. Raises std::bad_alloc.
    static std::unique_ptr<ConverterTable const> read(char const* name);

    /// The codes that are read, one-way mappings included. It points into this object.
    DecodeTable decoding() const;

    /// The characters that are written, without ICU's fallbacks to a similar character.
    std::vector<Character> const& characters() const { return characters_; }

  private:
    UInt16 high_[0x80] = {};
    DecodeRow rows_[0x80] = {};
    bool hasRows_ = false;
    std::vector<UInt16> cells_;
    std::vector<Character> characters_;
};

} // namespace CFPlatform

#endif
