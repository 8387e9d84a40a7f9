/// Stand-ins for icon services and bitmap contexts, which keep a record of how they are called.
///
///     TestSupport::CIconServices services;
///     services.plotStatus = -1;
///     EXPECT_FALSE(spec.getIcon(rgb, alpha, width, height));
///     EXPECT_EQ(services.alive, 0);
#ifndef QORN_TESTS_FILESYSICONSERVICES_H
#define QORN_TESTS_FILESYSICONSERVICES_H

#include <ApplicationServices/ApplicationServices.h>

#include <cstddef>
#include <string>
#include <vector>

namespace TestSupport {

/// One lives at a time; the calls reach that one.
class CIconServices {
  public:
    CIconServices();
    ~CIconServices();

    CIconServices(CIconServices const&) = delete;
    CIconServices& operator=(CIconServices const&) = delete;

    // What they answer.
    OSErr iconStatus = noErr;
    bool hasIcon = true;
    bool hasColorSpace = true;
    bool hasContext = true;
    OSStatus plotStatus = noErr;
    std::vector<unsigned char> drawing; ///< drawn into the first bytes

    // What they were asked.
    std::vector<std::string> calls;
    long volume = 0;
    OSType creator = 0;
    OSType type = 0;
    std::u16string extension;
    bool hasMIMEType = false;
    unsigned usageFlags = 1;
    std::size_t width = 0;
    std::size_t height = 0;
    std::size_t bitsPerComponent = 0;
    std::size_t bytesPerRow = 0;
    unsigned bitmapInfo = 0;
    bool wasZeroed = false;
    CGRect square = {};
    int alignment = 0;
    int transform = 1;
    bool hasLabelColor = true;
    unsigned plotFlags = 1;

    /// Icons, colour spaces and contexts that are not released yet.
    int alive = 0;
};

} // namespace TestSupport

#endif
