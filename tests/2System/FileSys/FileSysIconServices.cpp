#include "2System/FileSys/FileSysIconServices.h"

#include <gtest/gtest.h>

#include <algorithm>

#pragma GCC diagnostic ignored "-Wdeprecated-declarations"

struct OpaqueIconRef {};
struct CGColorSpace {};
struct CGContext {
    unsigned char* pixels;
};

namespace {

TestSupport::CIconServices* services = nullptr;
OpaqueIconRef theIcon;
CGColorSpace theSpace;
CGContext theContext;

OSErr giveIcon(IconRef* icon) {
    if (services->hasIcon) {
        *icon = &theIcon;
        ++services->alive;
    }
    return services->iconStatus;
}

std::u16string unitsOf(CFStringRef text) {
    std::u16string units(static_cast<std::size_t>(CFStringGetLength(text)), u' ');
    CFStringGetCharacters(text, CFRangeMake(0, CFStringGetLength(text)),
                          reinterpret_cast<UniChar*>(units.data()));
    return units;
}

void release(char const* call, bool isOurs) {
    EXPECT_TRUE(isOurs) << call;
    services->calls.emplace_back(call);
    --services->alive;
}

} // namespace

namespace TestSupport {

CIconServices::CIconServices() {
    services = this;
}

CIconServices::~CIconServices() {
    services = nullptr;
}

} // namespace TestSupport

OSErr GetIconRef(SInt16 vRefNum, OSType creator, OSType iconType, IconRef* theIconRef) {
    services->calls.emplace_back("GetIconRef");
    services->volume = vRefNum;
    services->creator = creator;
    services->type = iconType;
    return giveIcon(theIconRef);
}

OSErr GetIconRefFromTypeInfo(OSType inCreator, OSType inType, CFStringRef inExtension,
                             CFStringRef inMIMEType, IconServicesUsageFlags inUsageFlags,
                             IconRef* outIconRef) {
    services->calls.emplace_back("GetIconRefFromTypeInfo");
    services->creator = inCreator;
    services->type = inType;
    services->extension = unitsOf(inExtension);
    services->hasMIMEType = inMIMEType != nullptr;
    services->usageFlags = inUsageFlags;
    return giveIcon(outIconRef);
}

OSErr ReleaseIconRef(IconRef theIconRef) {
    release("ReleaseIconRef", theIconRef == &theIcon);
    return noErr;
}

CGColorSpaceRef CGColorSpaceCreateDeviceRGB() {
    services->calls.emplace_back("CGColorSpaceCreateDeviceRGB");
    if (!services->hasColorSpace)
        return nullptr;
    ++services->alive;
    return &theSpace;
}

void CGColorSpaceRelease(CGColorSpaceRef space) {
    release("CGColorSpaceRelease", space == &theSpace);
}

CGContextRef CGBitmapContextCreate(void* data, size_t width, size_t height, size_t bitsPerComponent,
                                   size_t bytesPerRow, CGColorSpaceRef space, uint32_t bitmapInfo) {
    EXPECT_EQ(space, &theSpace);
    services->calls.emplace_back("CGBitmapContextCreate");
    services->width = width;
    services->height = height;
    services->bitsPerComponent = bitsPerComponent;
    services->bytesPerRow = bytesPerRow;
    services->bitmapInfo = bitmapInfo;
    theContext.pixels = static_cast<unsigned char*>(data);
    unsigned char* const end = theContext.pixels + bytesPerRow * height;
    services->wasZeroed =
        std::all_of(theContext.pixels, end, [](unsigned char byte) { return byte == 0; });
    if (!services->hasContext)
        return nullptr;
    ++services->alive;
    return &theContext;
}

void CGContextRelease(CGContextRef c) {
    release("CGContextRelease", c == &theContext);
}

OSStatus PlotIconRefInContext(CGContextRef inContext, CGRect const* inRect,
                              IconAlignmentType inAlign, IconTransformType inTransform,
                              RGBColor const* inLabelColor, PlotIconRefFlags inFlags,
                              IconRef inIconRef) {
    EXPECT_EQ(inContext, &theContext);
    EXPECT_EQ(inIconRef, &theIcon);
    services->calls.emplace_back("PlotIconRefInContext");
    services->square = *inRect;
    services->alignment = inAlign;
    services->transform = inTransform;
    services->hasLabelColor = inLabelColor != nullptr;
    services->plotFlags = inFlags;
    std::copy(services->drawing.begin(), services->drawing.end(), inContext->pixels);
    return services->plotStatus;
}
