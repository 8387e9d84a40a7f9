/// The drawing of icons (HIServices), and the frameworks that ApplicationServices brings along.
#ifndef QORN_TESTS_APPLEHEADERS_APPLICATIONSERVICES_H
#define QORN_TESTS_APPLEHEADERS_APPLICATIONSERVICES_H

#include <CoreGraphics/CoreGraphics.h>
#include <CoreServices/CoreServices.h>

struct RGBColor {
    unsigned short red;
    unsigned short green;
    unsigned short blue;
};
typedef struct RGBColor RGBColor;

typedef SInt16 IconAlignmentType;
enum {
    kAlignVerticalCenter = 0x1,
    kAlignHorizontalCenter = 0x4,
    kAlignAbsoluteCenter = kAlignVerticalCenter | kAlignHorizontalCenter
};

typedef SInt16 IconTransformType;
enum { kTransformNone = 0x0 };

typedef UInt32 PlotIconRefFlags;
enum { kPlotIconRefNormalFlags = 0L };

extern "C" OSStatus PlotIconRefInContext(CGContextRef inContext, CGRect const* inRect,
                                         IconAlignmentType inAlign, IconTransformType inTransform,
                                         RGBColor const* inLabelColor, PlotIconRefFlags inFlags,
                                         IconRef inIconRef) QORN_DEPRECATED_ICON;

#endif
