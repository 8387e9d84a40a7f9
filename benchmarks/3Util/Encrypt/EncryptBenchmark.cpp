// Digests, cipher and repacking beside other libraries. Every contender keeps what it can use again
// from one message to the next, and must give the same bytes.

#include "3Util/Encrypt/Encrypt.h"

#include "3Util/Encrypt/EncryptPeers.h"
#include "support/Benchmark.h"

#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <iostream>
#include <memory>
#include <random>
#include <string>
#include <utility>

namespace {

using namespace EncryptPeers;

constexpr std::size_t sizes[] = {64, 1000, 1000000};

TByteVector randomBytes(std::size_t length) {
    std::mt19937 random(static_cast<unsigned int>(length));
    TByteVector bytes(length);
    for (unsigned char& byte : bytes)
        byte = static_cast<unsigned char>(random());
    return bytes;
}

// What differs measures other work.
void require(bool holds, std::string const& row, char const* contender) {
    if (holds)
        return;
    std::cerr << row << ": " << contender << " gives other bytes\n";
    std::exit(EXIT_FAILURE);
}

template <class TPeer>
void addMd5(char const* contender, TByteVector const& bytes) {
    std::string const row = "Md5/" + std::to_string(bytes.size());
    auto const peer = std::make_shared<TPeer>();
    require(peer->digest(bytes) == Encrypt::md5(bytes), row, contender);
    Benchmarks::add(row, contender, [peer, bytes] { return peer->digest(bytes); });
}

// A message with a key of its own, changed in place.
template <class TPeer>
void addRC4(char const* contender, TByteVector const& bytes) {
    std::string const row = "RC4/" + std::to_string(bytes.size());
    TByteVector const key = randomBytes(16);
    auto const peer = std::make_shared<TPeer>();
    TByteVector expected = bytes;
    Encrypt::CRC4(key).process(expected);
    TByteVector changed = bytes;
    peer->process(key, changed);
    require(changed == expected, row, contender);
    Benchmarks::add(row, contender, [peer, key, changed = std::make_shared<TByteVector>(bytes)] {
        peer->process(key, *changed);
        return changed->data();
    });
}

void addPeers(TByteVector const& bytes) {
    addMd5<COurMd5>("ours", bytes);
    addRC4<COurRC4>("ours", bytes);
#ifdef QORN_HAVE_OPENSSL
    addMd5<COpenSSLMd5>("openssl", bytes);
    addRC4<COpenSSLRC4>("openssl", bytes);
#endif
#ifdef QORN_HAVE_NETTLE
    addMd5<CNettleMd5>("nettle", bytes);
    addRC4<CNettleRC4>("nettle", bytes);
#endif
#ifdef QORN_HAVE_GCRYPT
    addMd5<CGcryptMd5>("gcrypt", bytes);
    addRC4<CGcryptRC4>("gcrypt", bytes);
#endif
}

// Nobody else repacks. Eight bits are a copy, so there the peers are one of a vector, and one into
// bytes that are ready and warm.
void addCopies(std::string const& row, TByteVector const& bytes) {
    Benchmarks::add(row, "vector", [bytes] { return TByteVector(bytes); });
    Benchmarks::add(row, "memcpy", [bytes, copy = std::make_shared<TByteVector>(bytes)] {
        std::memcpy(copy->data(), bytes.data(), bytes.size());
        benchmark::ClobberMemory();
        return copy->data();
    });
}

void addRepacking(std::size_t size) {
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        std::string const caseName = "/" + std::to_string(bits) + "/" + std::to_string(size);
        TByteVector const bytes = randomBytes(size);
        TByteVector groups = Encrypt::splitBytes(bytes, bits);
        groups.resize(size);
        Benchmarks::add("SplitBytes" + caseName, "ours",
                        [bytes, bits] { return Encrypt::splitBytes(bytes, bits); });
        Benchmarks::add("MergeBytes" + caseName, "ours",
                        [groups, bits] { return Encrypt::mergeBytes(groups, bits); });
        if (bits == 8) {
            addCopies("SplitBytes" + caseName, bytes);
            addCopies("MergeBytes" + caseName, groups);
        }
    }
}

void addBenchmarks() {
    for (std::size_t const size : sizes)
        addPeers(randomBytes(size));
    addRepacking(1000);
    addRepacking(1000000);
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
