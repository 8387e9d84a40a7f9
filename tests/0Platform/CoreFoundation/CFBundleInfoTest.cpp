// What a bundle tells of itself.

#include "0Platform/CoreFoundation/CFBundleCases.h"

#include <filesystem>

using PlatformTest::CBundle;
using PlatformTest::demoInfo;
using TestSupport::binaryInfo;
using TestSupport::CPlatformString;
using TestSupport::layFile;
using TestSupport::TInfo;
using TestSupport::xmlInfo;
using TestSupport::xmlPlist;

namespace {

using CFBundleInfoTest = PlatformTest::CBundleTest;

constexpr auto nothing = std::nullopt;

TInfo const demo = {{"CFBundleName", "Demo"},
                    {"CFBundleVersion", "1.2.3"},
                    {"Greeting", "Gr\xC3\xBC\xC3\x9F\xF0\x9F\x98\x80"},
                    {"Empty", ""},
                    {"Long", std::string(300, 'x')}};

void expectDemo(CBundle const& bundle) {
    EXPECT_EQ(bundle.value("CFBundleName"), u"Demo");
    EXPECT_EQ(bundle.value("CFBundleVersion"), u"1.2.3");
    EXPECT_EQ(bundle.value("Greeting"), u"Gr\u00FC\u00DF\U0001F600");
    EXPECT_EQ(bundle.value("Empty"), u"");
    EXPECT_EQ(bundle.value("Long"), std::u16string(300, u'x'));
}

void expectNoValues(std::string const& plist) {
    layFile(demoInfo, plist);
    CBundle const bundle("Demo.bundle");
    ASSERT_FALSE(bundle.isNull());
    EXPECT_EQ(bundle.value("CFBundleName"), nothing) << plist;
}

TEST_F(CFBundleInfoTest, XmlIsRead) {
    layFile(demoInfo, xmlInfo(demo));
    expectDemo(CBundle("Demo.bundle"));
}

TEST_F(CFBundleInfoTest, TheBinaryFormIsRead) {
    layFile(demoInfo, binaryInfo(demo));
    expectDemo(CBundle("Demo.bundle"));
}

TEST_F(CFBundleInfoTest, TheConstantsNameTheirKeys) {
    EXPECT_EQ(CPlatformString::unitsOf(kCFBundleNameKey), u"CFBundleName");
    EXPECT_EQ(CPlatformString::unitsOf(kCFBundleVersionKey), u"CFBundleVersion");
    EXPECT_EQ(CFStringGetCharactersPtr(kCFBundleNameKey)[12], 0);

    layFile(demoInfo, xmlInfo(demo));
    CBundle const bundle("Demo.bundle");
    CFTypeRef const name = CFBundleGetValueForInfoDictionaryKey(bundle.get(), kCFBundleNameKey);
    CFTypeRef const version =
        CFBundleGetValueForInfoDictionaryKey(bundle.get(), kCFBundleVersionKey);
    EXPECT_EQ(CPlatformString::unitsOf(static_cast<CFStringRef>(name)), u"Demo");
    EXPECT_EQ(CPlatformString::unitsOf(static_cast<CFStringRef>(version)), u"1.2.3");
}

TEST_F(CFBundleInfoTest, AConstantIsRetainedAndReleasedLikeAnyString) {
    CFIndex const owners = CFGetRetainCount(kCFBundleNameKey);
    CFRetain(kCFBundleNameKey);
    CFRelease(kCFBundleNameKey);
    EXPECT_EQ(CFGetRetainCount(kCFBundleNameKey), owners);
    EXPECT_EQ(CPlatformString::unitsOf(kCFBundleNameKey), u"CFBundleName");
}

TEST_F(CFBundleInfoTest, AnUnknownKeyHasNoValue) {
    layFile(demoInfo, xmlInfo(demo));
    CBundle const bundle("Demo.bundle");
    EXPECT_EQ(bundle.value("CFBundleNam"), nothing);
    EXPECT_EQ(bundle.value("cfbundlename"), nothing);
    EXPECT_EQ(bundle.value(""), nothing);
    CPlatformString const surrogate(std::u16string(1, 0xD800));
    EXPECT_EQ(CFBundleGetValueForInfoDictionaryKey(bundle.get(), surrogate.get()), nullptr);
    CPlatformString const beyond(std::u16string(u"CFBundleName\0x", 14));
    EXPECT_EQ(CFBundleGetValueForInfoDictionaryKey(bundle.get(), beyond.get()), nullptr);
}

TEST_F(CFBundleInfoTest, OnlyTextsAreValues) {
    layFile(demoInfo, xmlPlist("<dict><key>Number</key><integer>3</integer>"
                               "<key>Real</key><real>1.5</real><key>Flag</key><true/>"
                               "<key>Date</key><date>2021-04-29T08:35:23Z</date>"
                               "<key>Data</key><data>QUJD</data>"
                               "<key>List</key><array><string>a</string></array>"
                               "<key>Inner</key><dict><key>Deep</key><string>b</string></dict>"
                               "<key>Text</key><string>c</string></dict>"));
    CBundle const bundle("Demo.bundle");
    for (char const* const key : {"Number", "Real", "Flag", "Date", "Data", "List", "Inner"})
        EXPECT_EQ(bundle.value(key), nothing) << key;
    EXPECT_EQ(bundle.value("Deep"), nothing);
    EXPECT_EQ(bundle.value("Text"), u"c");
}

TEST_F(CFBundleInfoTest, EntitiesAreCharacters) {
    layFile(demoInfo, xmlInfo({{"CFBundleName", "Fish &amp; &lt;Chips&gt;"}}));
    EXPECT_EQ(CBundle("Demo.bundle").value("CFBundleName"), u"Fish & <Chips>");
}

TEST_F(CFBundleInfoTest, ATextThatIsNotUTF8IsNoValue) {
    layFile(demoInfo, xmlInfo({{"CFBundleName", "Gr\xFC\xDF"}, {"CFBundleVersion", "1"}}));
    CBundle const bundle("Demo.bundle");
    EXPECT_EQ(bundle.value("CFBundleName"), nothing);
    EXPECT_EQ(bundle.value("CFBundleVersion"), u"1");
}

TEST_F(CFBundleInfoTest, WithoutAnInfoPlistThereAreNoValues) {
    std::filesystem::create_directories("Demo.bundle/Contents");
    EXPECT_EQ(CBundle("Demo.bundle").value("CFBundleName"), nothing);
    std::filesystem::create_directory("Plain");
    EXPECT_EQ(CBundle("Plain").value("CFBundleName"), nothing);
}

TEST_F(CFBundleInfoTest, AnInfoPlistThatIsAFolderHasNoValues) {
    std::filesystem::create_directories(demoInfo);
    EXPECT_EQ(CBundle("Demo.bundle").value("CFBundleName"), nothing);
}

TEST_F(CFBundleInfoTest, ABrokenInfoPlistHasNoValues) {
    expectNoValues("");
    expectNoValues("\n");
    expectNoValues("CFBundleName = Demo;");
    expectNoValues("bplist00");
    expectNoValues(std::string(4096, '\0'));
    expectNoValues(xmlPlist(""));
    expectNoValues(xmlPlist("<string>Demo</string>"));
    expectNoValues(xmlPlist("<array><string>CFBundleName</string></array>"));
    expectNoValues(xmlPlist("<dict><key>CFBundleName</key></dict>"));
    expectNoValues("bplist00\x50\x08" + std::string(5, '\0'));
}

TEST_F(CFBundleInfoTest, AnInfoPlistCutOffAnywhereDoesNoHarm) {
    for (std::string const& whole : {xmlInfo(demo), binaryInfo(demo)}) {
        for (std::size_t size = 0; size < whole.size(); size += 7) {
            layFile(demoInfo, whole.substr(0, size));
            CBundle const bundle("Demo.bundle");
            ASSERT_FALSE(bundle.isNull());
            std::optional<std::u16string> const name = bundle.value("CFBundleName");
            EXPECT_TRUE(!name || *name == u"Demo") << size;
        }
    }
}

TEST_F(CFBundleInfoTest, ABundleShowsTheInfoPlistOfItsCreation) {
    layFile(demoInfo, xmlInfo({{"CFBundleName", "Old"}}));
    CBundle const before("Demo.bundle");
    layFile(demoInfo, xmlInfo({{"CFBundleName", "New"}}));
    CBundle const after("Demo.bundle");
    std::filesystem::remove(demoInfo);
    EXPECT_EQ(before.value("CFBundleName"), u"Old");
    EXPECT_EQ(after.value("CFBundleName"), u"New");
}

TEST_F(CFBundleInfoTest, AValueBelongsToItsBundle) {
    layFile(demoInfo, xmlInfo(demo));
    CBundle bundle("Demo.bundle");
    CFTypeRef const value = CFBundleGetValueForInfoDictionaryKey(bundle.get(), kCFBundleNameKey);
    EXPECT_EQ(value, CFBundleGetValueForInfoDictionaryKey(bundle.get(), kCFBundleNameKey));
    EXPECT_EQ(CFGetRetainCount(value), 1);
    CFRetain(value);
    bundle.release();
    EXPECT_EQ(CPlatformString::unitsOf(static_cast<CFStringRef>(value)), u"Demo");
    CFRelease(value);
}

} // namespace
