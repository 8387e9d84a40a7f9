#include "3Util/Encrypt/EncryptByteSplit.h"

#include "1Base/Error/ErrorMacros.h"

#include <cstdint>

namespace Encrypt {
namespace {

constexpr std::size_t bitsPerByte = 8;

// Repacks units of `from` bits into units of `to` bits. What is left over stands in the low bits of
// `rest`, `restBits` of it.
struct CRepacked {
    TByteVector units;
    std::uint32_t rest;
    std::size_t restBits;
};

CRepacked repack(TByteVector const& source, std::size_t from, std::size_t to) {
    CRepacked result = {TByteVector(), 0, 0};
    result.units.reserve((source.size() * from + to - 1) / to);
    std::uint32_t const mask = (1U << to) - 1;
    for (unsigned char const unit : source) {
        result.rest = result.rest << from | unit;
        result.restBits += from;
        while (result.restBits >= to) {
            result.restBits -= to;
            result.units.push_back(
                static_cast<unsigned char>(result.rest >> result.restBits & mask));
        }
    }
    return result;
}

void padLast(CRepacked& repacked, std::size_t to) {
    std::uint32_t const mask = (1U << to) - 1;
    repacked.units.push_back(
        static_cast<unsigned char>(repacked.rest << (to - repacked.restBits) & mask));
}

} // namespace

TByteVector splitBytes(TByteVector const& bytes, std::size_t bitsPerGroup) {
    CRepacked result = repack(bytes, bitsPerByte, bitsPerGroup);
    if (result.restBits != 0)
        padLast(result, bitsPerGroup);
    return std::move(result.units);
}

TByteVector mergeBytes(TByteVector const& groups, std::size_t bitsPerGroup) {
    CRepacked result = repack(groups, bitsPerGroup, bitsPerByte);
    if (result.restBits != 0) {
        // With as many bits left as the last group has, or more, it began in this byte: the byte
        // waits for a further group, and there is none.
        ERROR_ASSERT_TEXT(result.restBits < bitsPerGroup, "begin != end");
        padLast(result, bitsPerByte);
    }
    return std::move(result.units);
}

} // namespace Encrypt
