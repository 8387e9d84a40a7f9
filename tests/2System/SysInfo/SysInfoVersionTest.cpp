#include "2System/SysInfo/_Imp/SysInfoVersionSources.h"

#include "support/Registry.h"
#include "support/TextFailures.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <string>
#include <vector>

namespace SysInfo {

static bool operator==(SystemInfo const& left, SystemInfo const& right) {
    return left.majorVersion == right.majorVersion && left.minorVersion == right.minorVersion &&
           left.patchVersion == right.patchVersion;
}

static void PrintTo(SystemInfo const& info, std::ostream* stream) {
    *stream << info.majorVersion << '.' << info.minorVersion << '.' << info.patchVersion;
}

} // namespace SysInfo

namespace {

using SysInfo::CVersionSources;
using SysInfo::SystemInfo;
using SysInfo::TToolOutput;
using TestSupport::failedCheckOf;

int toolsClosed = 0;

int closeTool(std::FILE* file) {
    ++toolsClosed;
    return std::fclose(file);
}

// Texts as a system gives them, and a record of who was asked.
class CFakeSystem {
  public:
    CFakeSystem& product(std::string const& text) { return keep_(sources_.productVersion, text); }
    CFakeSystem& kernel(std::string const& text) { return keep_(sources_.kernelRelease, text); }

    CFakeSystem& tool(std::string const& output) {
        sources_.startVersionTool = [this, output] {
            asked_.push_back("tool");
            std::FILE* const file =
                output.empty() ? std::fopen("/dev/null", "r") : fmemopen(nullptr, 4096, "w+");
            std::fputs(output.c_str(), file);
            std::rewind(file);
            return TToolOutput(file, closeTool);
        };
        return *this;
    }

    CFakeSystem& noTool() {
        sources_.startVersionTool = [] { return TToolOutput(nullptr, closeTool); };
        return *this;
    }

    SystemInfo version() { return SysInfo::discoverVersion(sources_); }

    std::vector<std::string> const& asked() const { return asked_; }
    std::vector<std::size_t> const& sizes() const { return sizes_; }

  private:
    // Like the system's calls: the text with its zero, as far as the buffer goes.
    CFakeSystem& keep_(CVersionSources::TText& source, std::string const& text) {
        std::string const name = &source == &sources_.productVersion ? "product" : "kernel";
        source = [this, name, text](char* buffer, std::size_t size) {
            asked_.push_back(name);
            sizes_.push_back(size);
            std::copy_n(text.c_str(), std::min(size, text.size() + 1), buffer);
            return 0;
        };
        return *this;
    }

    CVersionSources::TText failing_(std::string const& name) {
        return [this, name](char* buffer, std::size_t size) {
            asked_.push_back(name);
            std::fill_n(buffer, size, '9');
            return -1;
        };
    }

    CVersionSources sources_ = {failing_("product"),
                                [this] {
                                    asked_.push_back("tool");
                                    return TToolOutput(nullptr, closeTool);
                                },
                                failing_("kernel")};
    std::vector<std::string> asked_;
    std::vector<std::size_t> sizes_;
};

using TAsked = std::vector<std::string>;

class CSysInfoVersionTest : public TestSupport::CErrorTest {
  protected:
    void SetUp() override {
        CErrorTest::SetUp();
        toolsClosed = 0;
    }
};

SystemInfo productVersion(std::string const& text) {
    CFakeSystem system;
    SystemInfo const version = system.product(text).version();
    EXPECT_EQ(system.asked(), TAsked{"product"}) << text;
    return version;
}

TEST_F(CSysInfoVersionTest, TheProductVersionIsReadAsFarAsItGoes) {
    EXPECT_EQ(productVersion("12.1"), (SystemInfo{12, 1, 0}));
    EXPECT_EQ(productVersion("13.2.1"), (SystemInfo{13, 2, 1}));
    EXPECT_EQ(productVersion("10.15.7"), (SystemInfo{10, 15, 7}));
    EXPECT_EQ(productVersion("14"), (SystemInfo{14, 0, 0}));
    EXPECT_EQ(productVersion("12.x.7"), (SystemInfo{12, 0, 0}));
    EXPECT_EQ(productVersion("12.3.4.5"), (SystemInfo{12, 3, 4}));
    EXPECT_EQ(productVersion("bookworm"), (SystemInfo{0, 0, 0}));
    EXPECT_EQ(productVersion(""), (SystemInfo{0, 0, 0}));
}

TEST_F(CSysInfoVersionTest, OnlyTheOneVersionThatIsNotTrustedStartsTheTool) {
    for (char const* const text : {"10.15.9", "9.16", "11.16", "16.10", "0.0", "-10.16"})
        productVersion(text);
    for (char const* const text : {"10.16", "10.16.2", "10.17", "10.99"}) {
        CFakeSystem system;
        EXPECT_EQ(system.product(text).tool("12.6.1\n").version(), (SystemInfo{12, 6, 1})) << text;
        EXPECT_EQ(system.asked(), (TAsked{"product", "tool"})) << text;
    }
}

TEST_F(CSysInfoVersionTest, ATextThatFillsTheBufferLosesItsLastByte) {
    std::string const zeros(125, '0');
    EXPECT_EQ(productVersion(zeros + "123"), (SystemInfo{12, 0, 0}));
    EXPECT_EQ(CFakeSystem().kernel(zeros + "193").version(), (SystemInfo{10, 15, 0}));
}

TEST_F(CSysInfoVersionTest, BothTextsAreAskedForWith128Bytes) {
    CFakeSystem system;
    system.product("12.1").version();
    CFakeSystem old;
    old.kernel("19.6.0").version();
    EXPECT_EQ(system.sizes(), std::vector<std::size_t>{128});
    EXPECT_EQ(old.sizes(), std::vector<std::size_t>{128});
}

SystemInfo toolVersion(std::string const& output, std::string const& product = "10.16") {
    return CFakeSystem().product(product).tool(output).version();
}

TEST_F(CSysInfoVersionTest, ASilentToolKeepsTheNumbers) {
    EXPECT_EQ(toolVersion(""), (SystemInfo{10, 16, 0}));
    EXPECT_EQ(toolVersion("", "10.16.3"), (SystemInfo{10, 16, 3}));
    EXPECT_EQ(toolVersion("sw_vers: not found\n", "10.16.3"), (SystemInfo{10, 16, 3}));
    EXPECT_EQ(toolsClosed, 3);
    EXPECT_EQ(CFakeSystem().product("10.16").noTool().version(), (SystemInfo{10, 16, 0}));
    EXPECT_EQ(toolsClosed, 3);
}

TEST_F(CSysInfoVersionTest, WhatTheToolDoesNotSayStaysAsItWas) {
    EXPECT_EQ(toolVersion("12.1\n", "10.16.4"), (SystemInfo{12, 1, 4}));
    EXPECT_EQ(toolVersion("13\n", "10.16.4"), (SystemInfo{13, 16, 4}));
}

TEST_F(CSysInfoVersionTest, TheToolsLinesAreReadAsOneText) {
    EXPECT_EQ(toolVersion("\n\n 12.6.1\n7\n"), (SystemInfo{12, 6, 1}));
    EXPECT_EQ(toolVersion("12.6\n.1\n"), (SystemInfo{12, 6, 0}));
    // A piece ends behind 255 bytes: within the first number.
    EXPECT_EQ(toolVersion(std::string(254, ' ') + "12.6.1\n"), (SystemInfo{12, 6, 1}));
}

TEST_F(CSysInfoVersionTest, TheToolMayPrint1023Bytes) {
    std::string const version = "12.6.1";
    EXPECT_EQ(toolVersion(std::string(1023 - version.size(), ' ') + version),
              (SystemInfo{12, 6, 1}));
    EXPECT_EQ(
        failedCheckOf([&] { toolVersion(std::string(1024 - version.size(), ' ') + version); }),
        "buflen < sizeof(buf)");
    EXPECT_EQ(failedCheckOf([&] { toolVersion(std::string(4000, ' ')); }), "buflen < sizeof(buf)");
    EXPECT_EQ(toolsClosed, 3);
}

SystemInfo kernelVersion(std::string const& release) {
    CFakeSystem system;
    SystemInfo const version = system.kernel(release).version();
    EXPECT_EQ(system.asked(), (TAsked{"product", "kernel"})) << release;
    return version;
}

TEST_F(CSysInfoVersionTest, WithoutAProductVersionTheKernelsReleaseTellsIt) {
    EXPECT_EQ(kernelVersion("19.6.0"), (SystemInfo{10, 15, 5}));
    EXPECT_EQ(kernelVersion("19"), (SystemInfo{10, 15, 0}));
    EXPECT_EQ(kernelVersion("19.0.0"), (SystemInfo{10, 15, 0}));
    EXPECT_EQ(kernelVersion("19.1.0"), (SystemInfo{10, 15, 0}));
    EXPECT_EQ(kernelVersion("19.-3"), (SystemInfo{10, 15, 0}));
    EXPECT_EQ(kernelVersion("5.4.0-generic"), (SystemInfo{10, 1, 3}));
}

TEST_F(CSysInfoVersionTest, TheToolIsNotStartedOnTheKernelsRoad) {
    EXPECT_EQ(kernelVersion("20.3.0"), (SystemInfo{10, 16, 2}));
}

TEST_F(CSysInfoVersionTest, AKernelReleaseThatIsNoneFailsACheck) {
    auto const failedCheck = [](std::string const& release) {
        return failedCheckOf([&] { CFakeSystem().kernel(release).version(); });
    };
    EXPECT_EQ(failedCheckOf([] { CFakeSystem().version(); }), "result == 0");
    EXPECT_EQ(failedCheck(""), "numScanned >= 1");
    EXPECT_EQ(failedCheck("Linux"), "numScanned >= 1");
    EXPECT_EQ(failedCheck("4.19.0"), "rawMinor > 4");
    EXPECT_EQ(failedCheck("-19"), "rawMinor > 4");
    EXPECT_EQ(failedCheck("5"), "");
}

TEST_F(CSysInfoVersionTest, NothingIsKeptBetweenTwoDiscoveries) {
    CFakeSystem system;
    system.product("10.16").tool("12.6.1");
    system.version();
    system.version();
    EXPECT_EQ(system.asked(), (TAsked{"product", "tool", "product", "tool"}));
}

// The texts.

TEST_F(CSysInfoVersionTest, TheProductsNameGoesByTheVersion) {
    auto const text = [](SystemInfo const& info) {
        return SysInfo::GetOperatingSystemInformation_(info);
    };
    EXPECT_EQ(text({11, 2, 3}), L"macOS 11.2.3");
    EXPECT_EQ(text({11, 0, 0}), L"macOS 11.0.0");
    EXPECT_EQ(text({26, 1, 0}), L"macOS 26.1.0");
    EXPECT_EQ(text({10, 12, 0}), L"macOS 10.12.0");
    EXPECT_EQ(text({10, 16, 0}), L"macOS 10.16.0");
    EXPECT_EQ(text({10, 11, 6}), L"Mac OS X 10.11.6");
    EXPECT_EQ(text({10, 0, 4}), L"Mac OS X 10.0.4");
    EXPECT_EQ(text({9, 2, 2}), L"Mac OS 9.2.2");
    EXPECT_EQ(text({9, 12, 0}), L"Mac OS 9.12.0");
    EXPECT_EQ(text({}), L"Mac OS 0.0.0");
    EXPECT_EQ(text({-1, 12, -3}), L"Mac OS -1.12.-3");
}

TEST_F(CSysInfoVersionTest, TheFirstVersionsTextIsTheProcesssText) {
    EXPECT_EQ(SysInfo::GetOperatingSystemInformation(SystemInfo{9, 2, 2}), L"Mac OS 9.2.2");
    EXPECT_EQ(SysInfo::GetOperatingSystemInformation(SystemInfo{11, 2, 3}), L"Mac OS 9.2.2");
    EXPECT_EQ(SysInfo::GetPlatformInformation(), L"Mac OS 9.2.2");
    EXPECT_EQ(SysInfo::GetOperatingSystemInformation_(SystemInfo{11, 2, 3}), L"macOS 11.2.3");
}

// The numbers of a version text as a shell and a reader of its own find them.
SystemInfo versionByShell() {
    std::FILE* const shell = popen("test -r /etc/os-release && . /etc/os-release || "
                                   ". /usr/lib/os-release; IFS=.; set -- $VERSION_ID; "
                                   "echo ${1:-0} ${2:-0} ${3:-0}",
                                   "r");
    SystemInfo info;
    EXPECT_EQ(
        std::fscanf(shell, "%d %d %d", &info.majorVersion, &info.minorVersion, &info.patchVersion),
        3);
    pclose(shell);
    return info;
}

TEST_F(CSysInfoVersionTest, TheRunningSystemHasAVersion) {
    SystemInfo const expected = versionByShell();
    if (expected == SystemInfo())
        GTEST_SKIP() << "this system has no VERSION_ID";
    EXPECT_EQ(SysInfo::GetOperatingSystemInformation(), expected);

    int majorVersion = -1;
    int minorVersion = -1;
    Strings::string const text = SysInfo::GetPlatformInformation(majorVersion, minorVersion);
    EXPECT_EQ(majorVersion, expected.majorVersion);
    EXPECT_EQ(minorVersion, expected.minorVersion);
    EXPECT_EQ(text, SysInfo::GetOperatingSystemInformation_(expected));
    EXPECT_EQ(SysInfo::GetPlatformInformation(), text);
}

TEST_F(CSysInfoVersionTest, TheNumbersAreThePresentOnesBesideAnOldText) {
    SysInfo::GetOperatingSystemInformation(SystemInfo{9, 2, 2});
    int majorVersion = -1;
    int minorVersion = -1;
    EXPECT_EQ(SysInfo::GetPlatformInformation(majorVersion, minorVersion), L"Mac OS 9.2.2");
    SystemInfo const present = SysInfo::GetOperatingSystemInformation();
    EXPECT_EQ(majorVersion, present.majorVersion);
    EXPECT_EQ(minorVersion, present.minorVersion);
}

// Whichever of the sources there are, one of the two roads gives numbers.
TEST_F(CSysInfoVersionTest, TheSystemsSourcesSpeak) {
    CVersionSources const sources = SysInfo::systemVersionSources();
    char release[128] = "";
    ASSERT_EQ(sources.kernelRelease(release, sizeof(release)), 0);
    EXPECT_TRUE(release[0] >= '1' && release[0] <= '9') << release;

    char few[4] = {'?', '?', '?', '?'};
    sources.kernelRelease(few, 3);
    EXPECT_EQ(std::string(few, 4), std::string(release, 2) + '\0' + '?');
    few[2] = '?';
    sources.productVersion(few, 3);
    EXPECT_EQ(few[3], '?');
    EXPECT_EQ(sources.startVersionTool(), nullptr);
}

} // namespace
