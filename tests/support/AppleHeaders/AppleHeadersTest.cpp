// Types, values and prototypes of what the sources for macOS call: this unit has only to compile.
// On macOS it reads the frameworks' headers, so what is declared beside it is held against them.

#include <ApplicationServices/ApplicationServices.h>

#include <sys/sysctl.h>

#include <cstddef>
#include <cstdint>
#include <type_traits>

#pragma GCC diagnostic ignored "-Wdeprecated-declarations"

namespace {

template <class TExpected, class TActual>
constexpr bool isType = std::is_same_v<TExpected, TActual>;

static_assert(isType<OSErr, short> && isType<OSStatus, int> && noErr == 0);
static_assert(isType<FourCharCode, unsigned int> && isType<OSType, FourCharCode>);

static_assert(isType<IconRef, OpaqueIconRef*> && isType<IconServicesUsageFlags, UInt32>);
static_assert(kOnSystemDisk == -32768 && kIconServicesNormalUsageFlag == 0);
static_assert(kSystemIconsCreator == 0x6D616373 && kGenericFolderIcon == 0x666C6472);
static_assert(isType<decltype(GetIconRef), OSErr(SInt16, OSType, OSType, IconRef*)>);
static_assert(
    isType<decltype(GetIconRefFromTypeInfo),
           OSErr(OSType, OSType, CFStringRef, CFStringRef, IconServicesUsageFlags, IconRef*)>);
static_assert(isType<decltype(ReleaseIconRef), OSErr(IconRef)>);

static_assert(isType<IconAlignmentType, SInt16> && isType<IconTransformType, SInt16>);
static_assert(isType<PlotIconRefFlags, UInt32> && kPlotIconRefNormalFlags == 0);
static_assert(kAlignAbsoluteCenter == 5 && kTransformNone == 0);
static_assert(isType<decltype(PlotIconRefInContext),
                     OSStatus(CGContextRef, CGRect const*, IconAlignmentType, IconTransformType,
                              RGBColor const*, PlotIconRefFlags, IconRef)>);

static_assert(isType<CGFloat, double> && sizeof(CGRect) == 4 * sizeof(CGFloat));
static_assert(isType<decltype(CGRectMake), CGRect(CGFloat, CGFloat, CGFloat, CGFloat)>);
static_assert(isType<CGContextRef, CGContext*> && isType<CGColorSpaceRef, CGColorSpace*>);
static_assert(isType<std::underlying_type_t<CGImageAlphaInfo>, std::uint32_t>);
static_assert(kCGImageAlphaPremultipliedLast == 1);
static_assert(isType<decltype(CGColorSpaceCreateDeviceRGB), CGColorSpaceRef()>);
static_assert(isType<decltype(CGColorSpaceRelease), void(CGColorSpaceRef)>);
static_assert(isType<decltype(CGBitmapContextCreate),
                     CGContextRef(void*, std::size_t, std::size_t, std::size_t, std::size_t,
                                  CGColorSpaceRef, std::uint32_t)>);
static_assert(isType<decltype(CGContextRelease), void(CGContextRef)>);

static_assert(CTL_KERN == 1 && KERN_OSRELEASE == 2);
static_assert(
    isType<decltype(sysctl), int(int*, unsigned, void*, std::size_t*, void*, std::size_t)>);
static_assert(
    isType<decltype(sysctlbyname), int(char const*, void*, std::size_t*, void*, std::size_t)>);

} // namespace
