// Icon services and Core Graphics.

#include "2System/FileSys/FileSysFileSpec.h"

#include "1Base/Error/ErrorMacros.h"
#include "2System/MacOS/MacOSTempCFString.h"

#include <ApplicationServices/ApplicationServices.h>
#include <Carbon/Carbon.h>

#include <cstddef>
#include <memory>
#include <type_traits>
#include <utility>
#include <vector>

// Icon services are deprecated from 10.15 on. What follows them is AppKit, for the main thread.
#pragma GCC diagnostic ignored "-Wdeprecated-declarations"

namespace FileSys {
namespace {

struct CIconReleaser {
    void operator()(IconRef icon) const { ReleaseIconRef(icon); }
};

struct CContextReleaser {
    void operator()(CGContextRef context) const { CGContextRelease(context); }
};

struct CColorSpaceReleaser {
    void operator()(CGColorSpaceRef space) const { CGColorSpaceRelease(space); }
};

template <class TRef, class TReleaser>
using TOwner = std::unique_ptr<std::remove_pointer_t<TRef>, TReleaser>;

using TIcon = TOwner<IconRef, CIconReleaser>;
using TContext = TOwner<CGContextRef, CContextReleaser>;
using TColorSpace = TOwner<CGColorSpaceRef, CColorSpaceReleaser>;

constexpr int defaultWidth = 512;
constexpr std::size_t bytesOfPixel = 4;

TIcon findIcon(CFileSpec const& spec) {
    IconRef icon = nullptr;
    OSStatus status = noErr;
    if (spec.exists() && spec.isFolder()) {
        status = GetIconRef(kOnSystemDisk, kSystemIconsCreator, kGenericFolderIcon, &icon);
    } else {
        MacOS::CTempCFString const extension(spec.getFileExtension());
        status = GetIconRefFromTypeInfo(0, 0, extension.get(), nullptr,
                                        kIconServicesNormalUsageFlag, &icon);
    }
    TIcon owner(icon);
    return status == noErr ? std::move(owner) : TIcon();
}

// The pixels of a square, four bytes each; empty where they can't be had.
std::vector<unsigned char> drawIcon(IconRef icon, std::size_t width) {
    TColorSpace const space(CGColorSpaceCreateDeviceRGB());
    if (!space)
        return {};
    std::vector<unsigned char> pixels(width * width * bytesOfPixel);
    TContext const context(CGBitmapContextCreate(pixels.data(), width, width, 8,
                                                 width * bytesOfPixel, space.get(),
                                                 kCGImageAlphaPremultipliedLast));
    if (!context)
        return {};
    CGFloat const side = static_cast<CGFloat>(width);
    CGRect const square = CGRectMake(0, 0, side, side);
    OSStatus const status =
        PlotIconRefInContext(context.get(), &square, kAlignAbsoluteCenter, kTransformNone, nullptr,
                             kPlotIconRefNormalFlags, icon);
    if (status != noErr)
        return {};
    return pixels;
}

void splitPixels(std::vector<unsigned char> const& pixels, std::string& rgb, std::string& alpha) {
    std::size_t const count = pixels.size() / bytesOfPixel;
    rgb.reserve(count * (bytesOfPixel - 1));
    alpha.reserve(count);
    for (auto pixel = pixels.begin(); pixel != pixels.end(); pixel += bytesOfPixel) {
        rgb.append(pixel, pixel + 3);
        alpha.push_back(static_cast<char>(pixel[3]));
    }
}

} // namespace

bool CFileSpec::getIcon(std::string& rgb, std::string& alpha, int& width, int& height) const {
    ERROR_BLOCK_BEGIN
    rgb.clear();
    alpha.clear();
    TIcon const icon = findIcon(*this);
    if (!icon)
        return false;
    if (width == 0)
        width = defaultWidth;
    height = width;
    if (width < 0)
        return false;
    std::vector<unsigned char> const pixels = drawIcon(icon.get(), static_cast<std::size_t>(width));
    splitPixels(pixels, rgb, alpha);
    return !pixels.empty();
    ERROR_BLOCK_END
}

} // namespace FileSys
