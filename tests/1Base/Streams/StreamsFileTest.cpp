#include "1Base/Streams/StreamsFile.h"

#include "support/ObjectCount.h"

#include <cstdlib>
#include <filesystem>
#include <iterator>
#include <sstream>
#include <string>

#include <unistd.h>

namespace {

namespace fs = std::filesystem;

using TInput = Streams::Detail::basic_ifstreamW<char>;
using TOutput = Streams::Detail::basic_ofstreamW<char>;
using TBoth = Streams::Detail::basic_fstreamW<char>;

constexpr auto in = static_cast<unsigned int>(std::ios_base::in);
constexpr auto out = static_cast<unsigned int>(std::ios_base::out);
constexpr auto trunc = static_cast<unsigned int>(std::ios_base::trunc);
constexpr auto app = static_cast<unsigned int>(std::ios_base::app);
constexpr auto binary = static_cast<unsigned int>(std::ios_base::binary);

constexpr wchar_t const* wideName = L"caf\u00E9 \u65E5\u672C \U0001F600";
constexpr char const* narrowName = "caf\xC3\xA9 \xE6\x97\xA5\xE6\x9C\xAC \xF0\x9F\x98\x80";

// Each test works in an empty folder of its own and names its files from there, so that the name
// of the temporary folder may be of any bytes.
class CStreamsFileTest : public TestSupport::CObjectCountTest {
  protected:
    void SetUp() override {
        CObjectCountTest::SetUp();
        char const* const parent = std::getenv("TMPDIR");
        bool const entered = parent != nullptr && *parent != 0 && enterNewFolder(parent);
        ASSERT_TRUE(entered || enterNewFolder("/tmp"));
    }

    void TearDown() override {
        fs::current_path(before_);
        fs::remove_all(folder_);
        CObjectCountTest::TearDown();
    }

    static std::string contentOf(char const* name) {
        std::ifstream file(name, std::ios_base::binary);
        EXPECT_TRUE(file.is_open());
        return std::string(std::istreambuf_iterator<char>(file), {});
    }

    static void setContent(char const* name, std::string const& content) {
        std::ofstream(name, std::ios_base::binary) << content;
    }

  private:
    bool enterNewFolder(std::string const& parent) {
        std::string folder = parent + "/streams-XXXXXX";
        if (::mkdtemp(folder.data()) == nullptr)
            return false;
        fs::current_path(folder);
        folder_ = fs::current_path();
        return true;
    }

    fs::path const before_ = fs::current_path();
    fs::path folder_;
};

template <class TStream>
void expectUnopened(TStream const& stream) {
    EXPECT_FALSE(stream.is_open());
    EXPECT_EQ(stream.rdstate(), std::ios_base::failbit);
    EXPECT_EQ(stream.exceptions(), std::ios_base::goodbit);
}

TEST_F(CStreamsFileTest, AWideNameReachesTheFileSystemInUTF8) {
    TOutput const stream(wideName, out | trunc);
    EXPECT_TRUE(stream.is_open());
    EXPECT_TRUE(stream.good());
    EXPECT_EQ(::access(narrowName, F_OK), 0);
}

TEST_F(CStreamsFileTest, WhatWasWrittenIsThereWhenTheStreamIsGone) {
    {
        TOutput stream(wideName, out | trunc | binary);
        stream << "text " << 42 << '\n';
    }
    EXPECT_EQ(contentOf(narrowName), "text 42\n");
}

TEST_F(CStreamsFileTest, AFileOfAWideNameIsRead) {
    setContent(narrowName, "12 abc\r\n\xFF");
    TInput stream(wideName, in | binary);
    int number = 0;
    stream >> number;
    EXPECT_EQ(number, 12);
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(stream), {}), " abc\r\n\xFF");
}

TEST_F(CStreamsFileTest, AFileOfAWideNameIsSoughtIn) {
    setContent(narrowName, "0123456789");
    TInput stream(wideName, in);
    stream.seekg(-3, std::ios_base::end);
    EXPECT_EQ(stream.tellg(), 7);
    EXPECT_EQ(stream.get(), '7');
    stream.seekg(2);
    EXPECT_EQ(stream.get(), '2');
}

TEST_F(CStreamsFileTest, AStreamOfBothDirectionsReadsWhatItWrote) {
    TBoth stream(wideName, in | out | trunc | binary);
    ASSERT_TRUE(stream.is_open());
    stream << "0123456789";
    stream.seekg(4);
    EXPECT_EQ(stream.get(), '4');
    stream.seekp(1);
    stream << 'x';
    stream.seekg(0);
    std::string content;
    stream >> content;
    EXPECT_EQ(content, "0x23456789");
}

TEST_F(CStreamsFileTest, AMissingFileLeavesFailbitAndThrowsNothing) {
    expectUnopened(TInput(L"missing", in));
    expectUnopened(TInput(L"missing", in | binary));
    expectUnopened(TBoth(L"missing", in | out));
    expectUnopened(TOutput(L"missing/file", out | trunc));
    expectUnopened(TInput(L"", in));
    EXPECT_EQ(::access("missing", F_OK), -1);
}

TEST_F(CStreamsFileTest, AnUnopenedStreamReadsAndWritesNothing) {
    TInput input(L"missing", in);
    EXPECT_EQ(input.get(), EOF);
    TOutput output(L"missing/file", out);
    output << "text";
    EXPECT_TRUE(output.fail());
}

TEST_F(CStreamsFileTest, AnInputStreamAddsItsMode) {
    setContent("file", "abc");
    TInput stream(L"file", 0);
    EXPECT_TRUE(stream.is_open());
    EXPECT_EQ(stream.get(), 'a');
}

TEST_F(CStreamsFileTest, AnOutputStreamAddsItsMode) {
    setContent("file", "abc");
    { TOutput(L"file", 0) << "x"; }
    EXPECT_EQ(contentOf("file"), "x");
    { TOutput(L"file", app) << "y"; }
    EXPECT_EQ(contentOf("file"), "xy");
}

TEST_F(CStreamsFileTest, AStreamOfBothDirectionsAddsNoMode) {
    setContent("file", "abc");
    expectUnopened(TBoth(L"file", 0));
    {
        TBoth stream(L"file", in);
        ASSERT_TRUE(stream.is_open());
        EXPECT_EQ(stream.get(), 'a');
        stream.seekp(0);
        stream << 'x' << std::flush;
        EXPECT_TRUE(stream.bad());
    }
    EXPECT_EQ(contentOf("file"), "abc");
    {
        TBoth stream(L"file", out);
        ASSERT_TRUE(stream.is_open());
        EXPECT_EQ(stream.get(), EOF);
    }
    EXPECT_EQ(contentOf("file"), "");
}

TEST_F(CStreamsFileTest, WritingOverTakesTheOldContentAway) {
    setContent("file", "a long content");
    { TOutput(L"file", out | trunc) << "short"; }
    EXPECT_EQ(contentOf("file"), "short");
}

TEST_F(CStreamsFileTest, APathThatIsNoTextThrowsFromConstruction) {
    wchar_t const surrogate[] = {L'a', static_cast<wchar_t>(0xD800), 0};
    wchar_t const beyondUnicode[] = {L'a', static_cast<wchar_t>(0x110000), 0};
    for (wchar_t const* const path : {surrogate, beyondUnicode}) {
        EXPECT_ANY_THROW(TInput(path, in));
        EXPECT_ANY_THROW(TOutput(path, out | trunc));
        EXPECT_ANY_THROW(TBoth(path, in | out | trunc));
    }
    EXPECT_TRUE(fs::is_empty("."));
}

TEST_F(CStreamsFileTest, TheBufferAloneOpensByWidePath) {
    {
        Streams::Detail::basic_filebufW<char> buffer(wideName, out);
        ASSERT_TRUE(buffer.is_open());
        EXPECT_EQ(buffer.sputn("abc", 3), 3);
    }
    EXPECT_EQ(contentOf(narrowName), "abc");
    EXPECT_FALSE(Streams::Detail::basic_filebufW<char>(L"missing", in).is_open());
}

} // namespace
