// MD5 by its published suite, at the borders of its blocks, and what a creator promises.

#include "3Util/Encrypt/EncryptMd5.h"

#include "3Util/Encrypt/EncryptTestBytes.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <memory>
#include <string>

namespace {

using Encrypt::CMd5Creator;
using Encrypt::md5;
using Encrypt::TByteVector;
using Encrypt::TMd5Digest;
using EncryptTest::bytesOf;
using EncryptTest::hexOf;

// Longer than three blocks, without a period that blocks share.
TByteVector sampleBytes() {
    TByteVector bytes;
    for (unsigned int i = 0; i < 201; ++i)
        bytes.push_back(static_cast<unsigned char>(i * 37 + i / 64));
    return bytes;
}

// The digest of what `feed` processes with a creator.
template <class TFeed>
std::string digestOf(TFeed const& feed) {
    TMd5Digest digest;
    {
        CMd5Creator creator(digest);
        feed(creator);
    }
    return hexOf(digest);
}

std::string const digestOfNothing = "d41d8cd98f00b204e9800998ecf8427e";

TEST(EncryptMd5Test, GivesTheDigestsOfTheSuiteOfRFC1321) {
    EXPECT_EQ(hexOf(md5(std::string())), digestOfNothing);
    EXPECT_EQ(hexOf(md5(std::string("a"))), "0cc175b9c0f1b6a831c399e269772661");
    EXPECT_EQ(hexOf(md5(std::string("abc"))), "900150983cd24fb0d6963f7d28e17f72");
    EXPECT_EQ(hexOf(md5(std::string("message digest"))), "f96b697d7cb7938d525a2f31aaf161d0");
    EXPECT_EQ(hexOf(md5(std::string("abcdefghijklmnopqrstuvwxyz"))),
              "c3fcd3d76192e4007dfb496cca67e13b");
    EXPECT_EQ(
        hexOf(md5(std::string("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789"))),
        "d174ab98d277d9f5a5611c2c9f419d9f");
    EXPECT_EQ(hexOf(md5(std::string("1234567890123456789012345678901234567890"
                                    "1234567890123456789012345678901234567890"))),
              "57edf4a22be3c955ac49da2e2107b67a");
}

// From `md5sum`. The length of the text stands in the last eight bytes of a block, and a text that
// leaves no room for it gets one block more.
TEST(EncryptMd5Test, FillsUpTheLastBlockAtEveryBorder) {
    struct {
        std::size_t length;
        char const* digest;
    } const texts[] = {
        {54, "eced9e0b81ef2bba605cbc5e2e76a1d0"},  {55, "ef1772b6dff9a122358552954ad0df65"},
        {56, "3b0c8ac703f828b04c6c197006d17218"},  {57, "652b906d60af96844ebd21b674f35e93"},
        {63, "b06521f39153d618550606be297466d5"},  {64, "014842d480b571495a4a0363793f7367"},
        {65, "c743a45e0d2e6a95cb859adae0248435"},  {119, "8a7bd0732ed6a28ce75f6dabc90e1613"},
        {120, "5f61c0ccad4cac44c75ff505e1f1e537"}, {121, "f6acfca2d47c87f2b14ca038234d3614"},
        {127, "020406e1d05cdc2aa287641f7ae2cc39"}, {128, "e510683b3f5ffe4093d021808bc6ff70"},
        {129, "b325dc1c6f5e7a2b7cf465b9feab7948"}};
    for (auto const& text : texts)
        EXPECT_EQ(hexOf(md5(std::string(text.length, 'a'))), text.digest) << text.length;
}

TEST(EncryptMd5Test, DigestsTheTerminatingZeroOfAPlainText) {
    EXPECT_EQ(digestOf([](CMd5Creator& creator) { creator.process(""); }),
              "93b885adfe0da089cdf634904fd59f71");
    EXPECT_EQ(digestOf([](CMd5Creator& creator) { creator.process("abc"); }),
              "147a664a2ca9410911e61986d3f0d52a");
}

TEST(EncryptMd5Test, DigestsTheTerminatingZeroOfEachPlainText) {
    EXPECT_EQ(digestOf([](CMd5Creator& creator) {
                  creator.process("ab");
                  creator.process("c");
              }),
              hexOf(md5(bytesOf("61 62 00 63 00"))));
}

TEST(EncryptMd5Test, DigestsTheCharactersOfAStringAlone) {
    EXPECT_EQ(digestOf([](CMd5Creator& creator) { creator.process(std::string("abc")); }),
              "900150983cd24fb0d6963f7d28e17f72");
    EXPECT_EQ(hexOf(md5(std::string("abc\0", 4))), "147a664a2ca9410911e61986d3f0d52a");
    EXPECT_EQ(hexOf(md5(std::string("\x80\xFF\0\x7F", 4))), hexOf(md5(bytesOf("80 FF 00 7F"))));
}

TEST(EncryptMd5Test, AddsNothingForNoBytes) {
    EXPECT_EQ(digestOf([](CMd5Creator&) {}), digestOfNothing);
    EXPECT_EQ(hexOf(md5(TByteVector())), digestOfNothing);
    EXPECT_EQ(digestOf([](CMd5Creator& creator) {
                  creator.process(nullptr, 0);
                  creator.process(TByteVector());
                  creator.process(std::string("ab"));
                  creator.process(nullptr, 0);
                  creator.process(TByteVector());
                  creator.process(std::string());
                  creator.process(bytesOf("63"));
                  creator.process(nullptr, 0);
              }),
              "900150983cd24fb0d6963f7d28e17f72");
}

TEST(EncryptMd5Test, WritesTheDigestWhenTheCreatorEnds) {
    TMd5Digest digest;
    digest.fill(0xAA);
    TMd5Digest const untouched = digest;
    auto creator = std::make_unique<CMd5Creator>(digest);
    creator->process(std::string("abc"));
    EXPECT_EQ(digest, untouched);
    creator.reset();
    EXPECT_EQ(hexOf(digest), "900150983cd24fb0d6963f7d28e17f72");
}

TEST(EncryptMd5Test, GivesTheDigestOfTheWholeHoweverItIsCut) {
    TByteVector const bytes = sampleBytes();
    std::string const expected = hexOf(md5(bytes));
    for (std::size_t first = 0; first <= bytes.size(); ++first) {
        EXPECT_EQ(digestOf([&](CMd5Creator& creator) {
                      creator.process(bytes.data(), first);
                      creator.process(bytes.data() + first, bytes.size() - first);
                  }),
                  expected)
            << first;
    }
    EXPECT_EQ(digestOf([&](CMd5Creator& creator) {
                  for (unsigned char const& byte : bytes)
                      creator.process(&byte, 1);
              }),
              expected);
}

TEST(EncryptMd5Test, KeepsTwoCreatorsApart) {
    TMd5Digest first;
    TMd5Digest second;
    {
        CMd5Creator one(first);
        CMd5Creator other(second);
        one.process(std::string("a"));
        other.process(std::string("message "));
        one.process(std::string("bc"));
        other.process(std::string("digest"));
    }
    EXPECT_EQ(hexOf(first), "900150983cd24fb0d6963f7d28e17f72");
    EXPECT_EQ(hexOf(second), "f96b697d7cb7938d525a2f31aaf161d0");
}

TEST(EncryptMd5Test, ReadsDataAtEveryAlignment) {
    TByteVector const bytes = sampleBytes();
    std::string const expected = hexOf(md5(bytes));
    for (std::size_t shift = 0; shift < 16; ++shift) {
        TByteVector shifted(shift);
        shifted.insert(shifted.end(), bytes.begin(), bytes.end());
        EXPECT_EQ(digestOf([&](CMd5Creator& creator) {
                      creator.process(shifted.data() + shift, bytes.size());
                  }),
                  expected)
            << shift;
    }
}

TEST(EncryptMd5Test, WritesTheDigestAtEveryAlignment) {
    struct {
        char before;
        TMd5Digest digest;
        char behind;
    } record = {'<', TMd5Digest(), '>'};
    static_assert(sizeof(record) == 18, "the digest stands at an odd address or at its neighbour");
    { CMd5Creator(record.digest).process(std::string("abc")); }
    EXPECT_EQ(hexOf(record.digest), "900150983cd24fb0d6963f7d28e17f72");
    EXPECT_EQ(record.before, '<');
    EXPECT_EQ(record.behind, '>');
}

} // namespace
