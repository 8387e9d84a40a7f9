/// Exceptions with a fixed origin, so that their texts can be written out.
///
///     auto const exc = TestSupport::sampleAt(7, Error::CMessage(std::string("text")));
///     exc.writeTo(stream, false);   // /build/A #  7: [SevError] "text"
#ifndef QORN_TESTS_SAMPLEEXCEPTION_H
#define QORN_TESTS_SAMPLEEXCEPTION_H

#include "1Base/Error/ErrorExc.h"

#include <string>

namespace TestSupport {

TEMPLMETA_TAG_NAME(Sample);
TEMPLMETA_TAG_NAME(OtherSample);

using TExcSample = Error::TExc<TemplMeta::CTag<CTag_Name_Sample<char const*>>, Error::CException>;
using TExcOtherSample =
    Error::TExc<TemplMeta::CTag<CTag_Name_OtherSample<char const*>>, Error::CException>;

using XSample = Error::XExc<TExcSample>;
using XOtherSample = Error::XExc<TExcOtherSample>;

inline constexpr char const* sampleFile = "/build/A";
inline constexpr unsigned int sampleLine = 118;
inline constexpr char const* sampleFunc = "int f(int)";
inline constexpr char const* sampleDate = "Apr 29 2021";
inline constexpr char const* sampleTime = "08:35:23";

inline Error::COrigin sampleOrigin(unsigned int line = sampleLine) {
    return Error::COrigin(sampleFile, line, sampleFunc, sampleDate, sampleTime);
}

/// What follows the origin is what the constructors of exceptions take.
template <class... TArguments>
XSample sampleAt(unsigned int line, TArguments const&... arguments) {
    return XSample(sampleFile, line, sampleFunc, sampleDate, sampleTime, arguments...);
}

template <class... TArguments>
XSample sample(TArguments const&... arguments) {
    return sampleAt(sampleLine, arguments...);
}

inline Error::CMessage messageOf(std::string const& text) {
    return Error::CMessage(text);
}

/// An exception of another severity than those that the constructors give.
class XSampleOfSeverity
    : public Error::Detail::CExcImplBase<TExcSample, Error::CExcImplementation> {
  public:
    XSampleOfSeverity(Error::ESeverity severity, Error::CMessage const& message)
        : CExcImplBase(Error::CInfo(sampleOrigin(), severity, message)) {}
};

/// A list of owned parameters.
inline Strings::CParameterList<wchar_t> parameterList(std::string const& name,
                                                      std::string const& value) {
    Strings::CParameterList<wchar_t> list;
    list.add(name, value);
    return list;
}

} // namespace TestSupport

#endif
