#include "1Base/Streams/StreamsString.h"

#include <gtest/gtest.h>

namespace {

constexpr auto in = static_cast<unsigned int>(std::ios_base::in);
constexpr auto out = static_cast<unsigned int>(std::ios_base::out);
constexpr auto ate = static_cast<unsigned int>(std::ios_base::ate);

TEST(CStreamsStringTest, AnOutputStreamKeepsWhatIsWritten) {
    Streams::Detail::basic_ostringstream<wchar_t> stream(out);
    stream << L"caf\u00E9 " << 42;
    EXPECT_EQ(stream.str(), L"caf\u00E9 42");
}

TEST(CStreamsStringTest, AnOutputStreamAddsItsMode) {
    Streams::Detail::basic_ostringstream<wchar_t> stream(0);
    stream << 42;
    EXPECT_TRUE(stream.good());
    EXPECT_EQ(stream.str(), L"42");
}

TEST(CStreamsStringTest, TheModeOfAnOutputStreamIsHandedOn) {
    Streams::Detail::basic_ostringstream<wchar_t> overwriting(out);
    overwriting.str(L"abc");
    overwriting << L'x';
    EXPECT_EQ(overwriting.str(), L"xbc");
    Streams::Detail::basic_ostringstream<wchar_t> appending(ate);
    appending.str(L"abc");
    appending << L'x';
    EXPECT_EQ(appending.str(), L"abcx");
}

TEST(CStreamsStringTest, AnInputStreamReadsACopy) {
    std::wstring text = L"12 abc";
    Streams::Detail::basic_istringstream<wchar_t> stream(text, in);
    text = L"99";
    int number = 0;
    std::wstring word;
    stream >> number >> word;
    EXPECT_EQ(number, 12);
    EXPECT_EQ(word, L"abc");
}

TEST(CStreamsStringTest, AnInputStreamAddsItsMode) {
    Streams::Detail::basic_istringstream<wchar_t> stream(L"12", 0);
    int number = 0;
    stream >> number;
    EXPECT_FALSE(stream.fail());
    EXPECT_EQ(number, 12);
}

TEST(CStreamsStringTest, AStreamOfBothDirectionsReadsWhatItWrote) {
    Streams::Detail::basic_stringstream<wchar_t> stream(in | out);
    stream << 42;
    int number = 0;
    stream >> number;
    EXPECT_EQ(number, 42);
}

TEST(CStreamsStringTest, AStreamOfBothDirectionsAddsNoMode) {
    Streams::Detail::basic_stringstream<wchar_t> unwritable(in);
    unwritable << 42;
    EXPECT_TRUE(unwritable.bad());

    Streams::Detail::basic_stringstream<wchar_t> unreadable(out);
    unreadable << 42;
    int number = 0;
    unreadable >> number;
    EXPECT_TRUE(unreadable.fail());

    Streams::Detail::basic_stringstream<wchar_t> neither(0);
    neither << 42;
    EXPECT_TRUE(neither.bad());
}

} // namespace
