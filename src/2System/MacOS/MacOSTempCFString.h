/// An owner of a platform string for the length of a call.
///
///     lookUp(MacOS::CTempCFString(name).get());
#ifndef QORN_2SYSTEM_MACOSTEMPCFSTRING_H
#define QORN_2SYSTEM_MACOSTEMPCFSTRING_H

#include "1Base/Error/ErrorMacros.h"
#include "2System/MacOS/MacOSCFStringConverter.h"

namespace MacOS {

/// Owns one platform string, never a null one, and releases it.
class CTempCFString {
  public:
    /// Takes over the caller's ownership of `ref`. Fails a check for a null reference.
    explicit CTempCFString(CFStringRef ref) : ref_(ERROR_ASSERT(ref)) {}

    /// A platform string of any string kind. Raises the conversion failure for a malformed text.
    template <class TString,
              class = std::enable_if_t<!std::is_convertible_v<TString const&, CFStringRef>>>
    explicit CTempCFString(TString const& text) : ref_(GetCFString(text)) {
        if (ref_ == nullptr)
            Encoding::Detail::throwConversionError("CFStringCreateWithBytes",
                                                   "Could not create string with encoding UTF8",
                                                   Encoding::eseUTF8);
    }

    CTempCFString(CTempCFString const&) = delete;
    CTempCFString& operator=(CTempCFString const&) = delete;

    ~CTempCFString() { CFRelease(ref_); }

    /// The string, which stays owned by this object.
    CFStringRef get() const { return ref_; }

  private:
    CFStringRef ref_;
};

} // namespace MacOS

#endif
