#include "1Base/Strings/StringsCase.h"
#include "1Base/Encoding/EncodingConverter.h"

#include <CoreFoundation/CoreFoundation.h>

#include <boost/smart_ptr/scoped_array.hpp>

#include <cmath>
#include <cstddef>

namespace Strings {
namespace {

// Older platforms have no locales, and there case follows none.
bool hasCFLocaleSupport() {
    static bool const isPresent = std::floor(kCFCoreFoundationVersionNumber) >= 299.0;
    return isPresent;
}

// Owned by the caller; null without locale support.
CFLocaleRef getLocaleRef() {
    return hasCFLocaleSupport() ? CFLocaleCopyCurrent() : nullptr;
}

// Releases a platform object unless it is null.
template <class TRef>
class COwned {
  public:
    explicit COwned(TRef ref) : ref_(ref) {}
    ~COwned() {
        if (ref_ != nullptr)
            CFRelease(ref_);
    }
    COwned(COwned const&) = delete;
    COwned& operator=(COwned const&) = delete;

    TRef get() const { return ref_; }

  private:
    TRef ref_;
};

template <class TString>
CFMutableStringRef createMutableCFString(TString const& text) {
    stringUTF16 const units = Encoding::convert<stringUTF16>(text);
    CFStringRef const ref = CFStringCreateWithCharacters(
        kCFAllocatorDefault, reinterpret_cast<UniChar const*>(units.data()),
        static_cast<CFIndex>(units.size()));
    CFMutableStringRef const mref = CFStringCreateMutableCopy(kCFAllocatorDefault, 0, ref);
    CFRelease(ref);
    return mref;
}

// The platform's form of a text for the length of one operation.
template <class TString>
class CTempCFString {
  public:
    explicit CTempCFString(TString const& text)
        : locale_(getLocaleRef()), string_(createMutableCFString(text)) {}

    CTempCFString& makeUpperCase() {
        CFStringUppercase(string_.get(), locale_.get());
        return *this;
    }

    CTempCFString& makeLowerCase() {
        CFStringLowercase(string_.get(), locale_.get());
        return *this;
    }

    // The text ends at its first zero unit, not at its length: callers rely on the cut.
    TString get() const {
        CFIndex const length = CFStringGetLength(string_.get());
        boost::scoped_array<short> units(new short[static_cast<std::size_t>(length) + 1]);
        CFStringGetCharacters(string_.get(), CFRangeMake(0, length),
                              reinterpret_cast<UniChar*>(units.get()));
        units[length] = 0;
        stringUTF16 const text(units.get());
        units.reset();
        return Encoding::convert<TString>(text);
    }

  private:
    // In this order: a conversion that raises while the string is made leaves a locale to release,
    // and otherwise the string goes first.
    COwned<CFLocaleRef> locale_;
    COwned<CFMutableStringRef> string_;
};

template <class TString>
TString& makeUpper(TString& text) {
    text = CTempCFString<TString>(text).makeUpperCase().get();
    return text;
}

template <class TString>
TString& makeLower(TString& text) {
    text = CTempCFString<TString>(text).makeLowerCase().get();
    return text;
}

} // namespace

std::string& toUpper(std::string& text) {
    return makeUpper(text);
}

string& toUpper(string& text) {
    return makeUpper(text);
}

std::string& toLower(std::string& text) {
    return makeLower(text);
}

string& toLower(string& text) {
    return makeLower(text);
}

string toLower(string const& text) {
    string copy(text);
    return toLower(copy);
}

} // namespace Strings
