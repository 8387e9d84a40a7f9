// The ready-made log targets.

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Error/Error.h"

#include "support/LogRecorder.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <fcntl.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <utility>

// Writing as the system does it, or as a test wants it.
static ssize_t (*writeInstead)(int descriptor, void const* bytes, size_t count) = nullptr;

extern "C" {
ssize_t __real_write(int descriptor, void const* bytes, size_t count);
ssize_t __wrap_write(int descriptor, void const* bytes, size_t count);

ssize_t __wrap_write(int descriptor, void const* bytes, size_t count) {
    return writeInstead != nullptr ? writeInstead(descriptor, bytes, count)
                                   : __real_write(descriptor, bytes, count);
}
}

namespace {

using Error::CFileLogTarget;
using Error::CMessage;
using Error::CStreamLogTarget;
using TestSupport::CInstalledTarget;

// Hands a record to a target without logging.
void write(Error::CLogTarget const& target, char const* severity, std::string const& text,
           Strings::CParameterList<wchar_t> const& params = Strings::CParameterList<wchar_t>()) {
    target.write(
        "/build/A", 7, "f()", "Apr 29 2021", "08:35:23", "FileSys", "TgtLogger", severity,
        CMessage(Error::msgPlainMessage, params + Strings::buildNamedParameter("__msg__", text)));
}

std::string lineOf(std::string const& text) {
    return "[SevWarn] FileSys: " + text + " (/build/A #7)\n";
}

using CStreamLogTargetTest = TestSupport::CErrorTest;

TEST_F(CStreamLogTargetTest, ARecordIsALineOfItsFields) {
    std::ostringstream stream;
    CStreamLogTarget const target(stream);
    write(target, "SevWarn", "no folder @(key)", Strings::buildNamedParameter("key", "/tmp/a"));
    EXPECT_EQ(stream.str(), "[SevWarn] FileSys: no folder /tmp/a (/build/A #7)\n");
}

TEST_F(CStreamLogTargetTest, LineBreaksWithinATextAreBlanks) {
    std::ostringstream stream;
    CStreamLogTarget const target(stream);
    write(target, "SevWarn", "\none\n\ntwo\n");
    EXPECT_EQ(stream.str(), lineOf(" one  two "));
}

TEST_F(CStreamLogTargetTest, TextsAreUTF8) {
    std::ostringstream stream;
    CStreamLogTarget const target(stream);
    write(target, "SevWarn", "caf\xC3\xA9 \xF0\x9F\x98\x80");
    EXPECT_EQ(stream.str(), lineOf("caf\xC3\xA9 \xF0\x9F\x98\x80"));
}

TEST_F(CStreamLogTargetTest, ATextThatIsNoUnicodeIsWrittenAllTheSame) {
    std::ostringstream stream;
    CStreamLogTarget const target(stream);
    Strings::CParameterList<wchar_t> params;
    params.add("a", Strings::string{static_cast<wchar_t>(0xD800), L'|'});
    params.add("b", Strings::string{static_cast<wchar_t>(0xDFFF), static_cast<wchar_t>(0x110000)});
    params.add("c", Strings::string{static_cast<wchar_t>(0xD7FF), static_cast<wchar_t>(0x10FFFF)});
    write(target, "SevWarn", "@(a)@(b)@(c)", params);
    EXPECT_EQ(stream.str(), lineOf("\xEF\xBF\xBD|\xEF\xBF\xBD\xEF\xBF\xBD"
                                   "\xED\x9F\xBF\xF4\x8F\xBF\xBF"));
}

TEST_F(CStreamLogTargetTest, AByteOrderMarkAndAnEmptyTextAreTexts) {
    std::ostringstream stream;
    CStreamLogTarget const target(stream);
    Strings::CParameterList<wchar_t> params;
    params.add("mark", L"\uFEFF");
    write(target, "SevWarn", "@(mark)", params);
    write(target, "SevWarn", "");
    EXPECT_EQ(stream.str(), lineOf("\xEF\xBB\xBF") + lineOf(""));
}

TEST_F(CStreamLogTargetTest, RecordsBelowTheLeastSeverityArePassedOver) {
    char const* const names[] = {"SevDebug", "SevLog",   "SevInfo",
                                 "SevWarn",  "SevError", "SevFatal"};
    for (int least = Error::SevDebug; least <= Error::SevFatal; ++least) {
        std::ostringstream stream;
        CStreamLogTarget const target(stream, static_cast<Error::ESeverity>(least));
        std::string expected;
        for (int severity = Error::SevDebug; severity <= Error::SevFatal; ++severity) {
            write(target, names[severity - 1], "m");
            if (severity >= least)
                expected += std::string("[") + names[severity - 1] + "] FileSys: m (/build/A #7)\n";
        }
        EXPECT_EQ(stream.str(), expected) << least;
    }
}

TEST_F(CStreamLogTargetTest, EachLineIsFlushed) {
    class CFlushCount : public std::stringbuf {
      public:
        int count = 0;

      private:
        int sync() override {
            ++count;
            return 0;
        }
    } buffer;
    std::ostream stream(&buffer);
    CStreamLogTarget const target(stream);
    write(target, "SevWarn", "m");
    EXPECT_EQ(buffer.count, 1);
    write(target, "SevWarn", "m");
    EXPECT_EQ(buffer.count, 2);
}

TEST_F(CStreamLogTargetTest, AFailedStreamIsLeftAsItIs) {
    std::ostringstream stream;
    CStreamLogTarget const target(stream);
    stream.setstate(std::ios_base::badbit);
    EXPECT_NO_THROW(write(target, "SevWarn", "lost"));
    stream.clear();
    write(target, "SevWarn", "kept");
    EXPECT_EQ(stream.str(), lineOf("kept"));
}

TEST_F(CStreamLogTargetTest, ALogCallArrives) {
    std::ostringstream stream;
    CStreamLogTarget const target(stream);
    CInstalledTarget<Error::TTgtLogger, Error::TSevWarn> const installed(target);
    using Error::TLoggerError, Error::TTgtLogger, Error::TSevWarn;
    int const count = 3;
    unsigned int const line = __LINE__ + 1;
    ERROR_LOG(TLoggerError, TTgtLogger, TSevWarn, "@(count) left", ERROR_PARAM(count));
    EXPECT_EQ(stream.str(), std::string("[SevWarn] Error: 3 left (") + __FILE__ + " #" +
                                std::to_string(line) + ")\n");
}

// A folder of its own for each test.
class CFileLogTargetTest : public TestSupport::CErrorTest {
  protected:
    void SetUp() override {
        CErrorTest::SetUp();
        ASSERT_NE(::mkdtemp(folder_.data()), nullptr);
    }
    void TearDown() override {
        for (char const* const name : {name_.c_str(), "other"})
            ::unlink((folder_ + "/" + name).c_str());
        EXPECT_EQ(::rmdir(folder_.c_str()), 0);
        CErrorTest::TearDown();
    }

    std::string path() const { return folder_ + "/" + name_; }
    std::wstring widePath() const { return Encoding::convert<std::wstring>(path()); }

    std::string contents() const {
        std::ifstream stream(path(), std::ios_base::binary);
        return std::string(std::istreambuf_iterator<char>(stream), {});
    }

  private:
    static std::string temporaryFolder() {
        char const* const folder = std::getenv("TMPDIR");
        return folder != nullptr && *folder != 0 ? folder : "/tmp";
    }

    std::string folder_ = temporaryFolder() + "/logXXXXXX";
    std::string name_ = "caf\xC3\xA9 \xE2\x82\xAC.log";
};

TEST_F(CFileLogTargetTest, AMissingFileIsMadeUnderItsWideName) {
    CFileLogTarget const target(widePath().c_str());
    EXPECT_TRUE(target.is_open());
    EXPECT_EQ(contents(), "");
    EXPECT_EQ(::access(path().c_str(), F_OK), 0);
}

TEST_F(CFileLogTargetTest, LinesAreAppended) {
    std::ofstream(path()) << "before\n";
    CFileLogTarget const target(widePath().c_str());
    write(target, "SevWarn", "one");
    EXPECT_EQ(contents(), "before\n" + lineOf("one"));
    {
        CFileLogTarget const second(widePath().c_str());
        write(second, "SevWarn", "two");
    }
    write(target, "SevWarn", "three");
    EXPECT_EQ(contents(), "before\n" + lineOf("one") + lineOf("two") + lineOf("three"));
}

TEST_F(CFileLogTargetTest, RecordsBelowTheLeastSeverityArePassedOver) {
    CFileLogTarget const target(widePath().c_str(), Error::SevWarn);
    write(target, "SevInfo", "one");
    write(target, "SevWarn", "two");
    EXPECT_EQ(contents(), lineOf("two"));
}

TEST_F(CFileLogTargetTest, AFileThatCanNotBeOpenedLosesItsRecords) {
    CFileLogTarget const target((widePath() + L"/missing/file").c_str());
    EXPECT_FALSE(target.is_open());
    EXPECT_NO_THROW(write(target, "SevWarn", "lost"));
}

TEST_F(CFileLogTargetTest, APathThatIsNoTextRaisesTheConversionFailure) {
    wchar_t const path[] = {L'/', static_cast<wchar_t>(0xD800), 0};
    try {
        CFileLogTarget const target(path);
        FAIL();
    } catch (Error::CException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "Encoding");
    }
}

TEST_F(CFileLogTargetTest, TheFileIsNotHandedToOtherPrograms) {
    int const next = ::dup(0);
    ::close(next);
    CFileLogTarget const target(widePath().c_str());
    // The lowest free descriptor is the target's.
    EXPECT_EQ(::fcntl(next, F_GETFD), FD_CLOEXEC);
}

TEST_F(CFileLogTargetTest, AFullDiskLosesRecordsAndRaisesNothing) {
    CFileLogTarget const target(L"/dev/full");
    if (!target.is_open())
        GTEST_SKIP() << "no /dev/full here";
    EXPECT_NO_THROW(write(target, "SevWarn", "lost"));
    EXPECT_NO_THROW(write(target, "SevWarn", "lost"));
}

// Lets files grow to `size` and no further while it lives.
class CFileSizeLimit {
  public:
    explicit CFileSizeLimit(std::size_t size) : handler_(std::signal(SIGXFSZ, SIG_IGN)) {
        ::getrlimit(RLIMIT_FSIZE, &old_);
        rlimit limit = old_;
        limit.rlim_cur = size;
        ::setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~CFileSizeLimit() {
        ::setrlimit(RLIMIT_FSIZE, &old_);
        std::signal(SIGXFSZ, handler_);
    }
    CFileSizeLimit(CFileSizeLimit const&) = delete;
    CFileSizeLimit& operator=(CFileSizeLimit const&) = delete;

  private:
    void (*handler_)(int);
    rlimit old_ = {};
};

TEST_F(CFileLogTargetTest, ALineThatWasCutOffIsEndedOnceThereIsRoom) {
    CFileLogTarget const target(widePath().c_str());
    write(target, "SevWarn", "whole");
    std::string const torn = lineOf("torn").substr(0, 10);
    {
        CFileSizeLimit const limit(lineOf("whole").size() + torn.size());
        write(target, "SevWarn", "torn");
        write(target, "SevWarn", "lost");
    }
    EXPECT_EQ(contents(), lineOf("whole") + torn);
    write(target, "SevWarn", "whole again");
    write(target, "SevWarn", "and again");
    EXPECT_EQ(contents(),
              lineOf("whole") + torn + "\n" + lineOf("whole again") + lineOf("and again"));
}

TEST_F(CFileLogTargetTest, ALineIsOneWriteThatASignalMayInterrupt) {
    static int calls;
    calls = 0;
    CFileLogTarget const target(widePath().c_str());
    writeInstead = [](int descriptor, void const* bytes, size_t count) -> ssize_t {
        if (++calls < 3) {
            errno = EINTR;
            return -1;
        }
        return __real_write(descriptor, bytes, count);
    };
    write(target, "SevWarn", "one");
    writeInstead = nullptr;
    EXPECT_EQ(calls, 3);
    EXPECT_EQ(contents(), lineOf("one"));
}

} // namespace
