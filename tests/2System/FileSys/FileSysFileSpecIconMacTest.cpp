// The source for macOS, run against stand-ins for what it calls.

#include "2System/FileSys/FileSysFileSpec.h"

#include "2System/FileSys/FileSysIconServices.h"
#include "support/FileRoot.h"

#include <string>
#include <vector>

namespace {

using FileSys::CFileSpec;
using TestSupport::CIconServices;

using TCalls = std::vector<std::string>;

class FileSysFileSpecIconMacTest : public TestSupport::CFileRootTest {
  protected:
    bool getIcon(Strings::string const& path) {
        return CFileSpec(path).getIcon(rgb, alpha, width, height);
    }

    bool getIcon() { return getIcon(L"letter.odt"); }

    void expectNoPixels() const {
        EXPECT_EQ(rgb, "");
        EXPECT_EQ(alpha, "");
        EXPECT_EQ(services.alive, 0);
    }

    CIconServices services;
    std::string rgb = "left over";
    std::string alpha = "left over";
    int width = 2;
    int height = 7;
};

TEST_F(FileSysFileSpecIconMacTest, AFolderHasTheIconOfFolders) {
    EXPECT_TRUE(CFileSpec(path()).getIcon(rgb, alpha, width, height));
    EXPECT_EQ(services.calls.at(0), "GetIconRef");
    EXPECT_EQ(services.volume, -32768);
    EXPECT_EQ(services.creator, 0x6D616373u);
    EXPECT_EQ(services.type, 0x666C6472u);
}

TEST_F(FileSysFileSpecIconMacTest, AnyOtherPathIsAskedForByItsExtensionAlone) {
    TestSupport::writeFile(path("letter.txt"));
    EXPECT_TRUE(CFileSpec(path("letter.txt")).getIcon(rgb, alpha, width, height));
    EXPECT_EQ(services.calls.at(0), "GetIconRefFromTypeInfo");
    EXPECT_EQ(services.extension, u"txt");
    EXPECT_EQ(services.creator, 0u);
    EXPECT_EQ(services.type, 0u);
    EXPECT_FALSE(services.hasMIMEType);
    EXPECT_EQ(services.usageFlags, 0u);
}

TEST_F(FileSysFileSpecIconMacTest, APathThatDoesNotExistHasAnIconToo) {
    EXPECT_TRUE(getIcon(L"/missing/letter.\u00E4"));
    EXPECT_EQ(services.extension, u"\u00E4");
    EXPECT_TRUE(getIcon(L"/missing/letter"));
    EXPECT_EQ(services.extension, u"");
}

TEST_F(FileSysFileSpecIconMacTest, ThePixelsAreSplitRowByRow) {
    services.drawing = {1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 253, 254, 255, 0};
    EXPECT_TRUE(getIcon());
    EXPECT_EQ(rgb, "\x01\x02\x03\x05\x06\x07\x09\x0A\x0B\xFD\xFE\xFF");
    EXPECT_EQ(alpha, std::string("\x04\x08\x0C\x00", 4));
}

TEST_F(FileSysFileSpecIconMacTest, TheIconIsASquareOfTheWidth) {
    EXPECT_TRUE(getIcon());
    EXPECT_EQ(width, 2);
    EXPECT_EQ(height, 2);
    EXPECT_EQ(services.width, 2u);
    EXPECT_EQ(services.height, 2u);
    EXPECT_EQ(services.square.origin.x, 0);
    EXPECT_EQ(services.square.origin.y, 0);
    EXPECT_EQ(services.square.size.width, 2);
    EXPECT_EQ(services.square.size.height, 2);
}

TEST_F(FileSysFileSpecIconMacTest, NoWidthIs512) {
    width = 0;
    EXPECT_TRUE(getIcon());
    EXPECT_EQ(width, 512);
    EXPECT_EQ(height, 512);
    EXPECT_EQ(rgb.size(), 512u * 512 * 3);
    EXPECT_EQ(alpha.size(), 512u * 512);
}

TEST_F(FileSysFileSpecIconMacTest, TheContextHasFourBytesAPixelWithAlphaLast) {
    EXPECT_TRUE(getIcon());
    EXPECT_EQ(services.bitsPerComponent, 8u);
    EXPECT_EQ(services.bytesPerRow, 8u);
    EXPECT_EQ(services.bitmapInfo, 1u);
    EXPECT_TRUE(services.wasZeroed);
}

TEST_F(FileSysFileSpecIconMacTest, TheIconIsCentredAndDrawnAsItIs) {
    EXPECT_TRUE(getIcon());
    EXPECT_EQ(services.alignment, 5);
    EXPECT_EQ(services.transform, 0);
    EXPECT_FALSE(services.hasLabelColor);
    EXPECT_EQ(services.plotFlags, 0u);
}

TEST_F(FileSysFileSpecIconMacTest, EachStepIsTakenOnceAndEverythingIsReleased) {
    EXPECT_TRUE(getIcon());
    TCalls const expected = {"GetIconRefFromTypeInfo", "CGColorSpaceCreateDeviceRGB",
                             "CGBitmapContextCreate",  "PlotIconRefInContext",
                             "CGContextRelease",       "CGColorSpaceRelease",
                             "ReleaseIconRef"};
    EXPECT_EQ(services.calls, expected);
    EXPECT_EQ(services.alive, 0);
}

TEST_F(FileSysFileSpecIconMacTest, WithoutAnIconNothingIsDrawn) {
    services.hasIcon = false;
    EXPECT_FALSE(getIcon());
    EXPECT_EQ(services.calls, TCalls{"GetIconRefFromTypeInfo"});
    EXPECT_EQ(width, 2);
    EXPECT_EQ(height, 7);
    expectNoPixels();
}

TEST_F(FileSysFileSpecIconMacTest, AStatusThatIsAnErrorCountsWhateverComesWithIt) {
    services.iconStatus = -2582;
    EXPECT_FALSE(getIcon());
    EXPECT_EQ(services.calls, (TCalls{"GetIconRefFromTypeInfo", "ReleaseIconRef"}));
    expectNoPixels();
}

TEST_F(FileSysFileSpecIconMacTest, WithoutAColourSpaceThereIsNoContext) {
    services.hasColorSpace = false;
    EXPECT_FALSE(getIcon());
    EXPECT_EQ(services.calls.back(), "ReleaseIconRef");
    EXPECT_EQ(services.calls.size(), 3u);
    EXPECT_EQ(height, 2);
    expectNoPixels();
}

TEST_F(FileSysFileSpecIconMacTest, WithoutAContextNothingIsDrawn) {
    services.hasContext = false;
    EXPECT_FALSE(getIcon());
    EXPECT_EQ(services.calls.size(), 5u);
    expectNoPixels();
}

TEST_F(FileSysFileSpecIconMacTest, AFailedDrawingLeavesNoPixels) {
    services.drawing = {1, 2, 3, 4};
    services.plotStatus = -50;
    EXPECT_FALSE(getIcon());
    expectNoPixels();
}

TEST_F(FileSysFileSpecIconMacTest, AWidthBelowZeroHasNoIcon) {
    width = -1;
    EXPECT_FALSE(getIcon());
    expectNoPixels();
}

} // namespace
