// Names and signatures that callers build on: a change here is a decision.

#include "3Util/Encrypt/Encrypt.h"

#include <boost/array.hpp>

#include <cstddef>
#include <string>
#include <type_traits>
#include <vector>

namespace {

using Encrypt::CMd5Creator;
using Encrypt::CRC4;
using Encrypt::TByteVector;
using TDigest = boost::array<unsigned char, 16>;

// Compiles only where exactly this overload is there.
template <class TSignature>
constexpr bool isOverload(TSignature) {
    return true;
}

static_assert(std::is_same_v<TByteVector, std::vector<unsigned char>>);

static_assert(std::is_constructible_v<CMd5Creator, TDigest&>);
static_assert(!std::is_constructible_v<CMd5Creator, TDigest const&>);
static_assert(!std::is_constructible_v<CMd5Creator, TDigest>, "the digest outlives the creator");
static_assert(!std::is_copy_constructible_v<CMd5Creator>);
static_assert(!std::is_copy_assignable_v<CMd5Creator>);
static_assert(!std::is_polymorphic_v<CMd5Creator>);

static_assert(
    isOverload<void (CMd5Creator::*)(unsigned char const*, unsigned long)>(&CMd5Creator::process));
static_assert(isOverload<void (CMd5Creator::*)(char const*)>(&CMd5Creator::process));
static_assert(
    isOverload<void (CMd5Creator::*)(std::vector<unsigned char> const&)>(&CMd5Creator::process));
static_assert(isOverload<void (CMd5Creator::*)(std::string const&)>(&CMd5Creator::process));

static_assert(
    std::is_same_v<decltype(&Encrypt::md5<TByteVector>), TDigest (*)(TByteVector const&)>);
static_assert(
    std::is_same_v<decltype(&Encrypt::md5<std::string>), TDigest (*)(std::string const&)>);

static_assert(std::is_constructible_v<CRC4, unsigned char const*, unsigned long>);
static_assert(std::is_constructible_v<CRC4, TByteVector const&>);
static_assert(std::is_constructible_v<CRC4, std::string const&>);
static_assert(!std::is_copy_constructible_v<CRC4>);
static_assert(!std::is_copy_assignable_v<CRC4>);
static_assert(!std::is_polymorphic_v<CRC4>);

static_assert(
    isOverload<unsigned char* (CRC4::*)(unsigned char*, unsigned long) const>(&CRC4::process));
static_assert(isOverload<TByteVector& (CRC4::*)(TByteVector&) const>(&CRC4::process));
static_assert(isOverload<std::string& (CRC4::*)(std::string&) const>(&CRC4::process));

static_assert(isOverload<TByteVector& (*)(std::string const&, TByteVector&)>(&Encrypt::rc4));
static_assert(isOverload<std::string (*)(std::string const&, std::string const&)>(&Encrypt::rc4));

static_assert(std::is_same_v<decltype(&Encrypt::splitBytes),
                             TByteVector (*)(TByteVector const&, std::size_t)>);
static_assert(std::is_same_v<decltype(&Encrypt::mergeBytes),
                             TByteVector (*)(TByteVector const&, std::size_t)>);

} // namespace
