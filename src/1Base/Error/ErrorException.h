/// The root of the exception family, for those who only catch.
///
///     catch (Error::CException const& exc) {
///         exc.writeTo(std::cerr, false);   // /src/a.cpp # 12: [SevError] "no folder /tmp/a"
///     }
#ifndef QORN_1BASE_ERROREXCEPTION_H
#define QORN_1BASE_ERROREXCEPTION_H

#include "1Base/Error/ErrorInfo.h"

#include <iosfwd>

namespace Error {

/// Abstract root, without a base class: deliberately no std::exception. An object belongs to the
/// thread that handles it.
class CException {
  public:
    virtual ~CException() = default;

    /// The name of the level that was raised, for instance "TimeFormatError".
    virtual char const* getExcName() const = 0;

    /// Origin, message and severity; they live as long as the exception.
    virtual CInfo const& getInfo() const = 0;

    /// @{
    /// The guarded blocks that the exception passed, the innermost first.
    virtual CStackInfoList const& getStackInfo() const = 0;
    virtual CStackInfoList& getStackInfo() = 0;
    /// @}

    /// @{
    /// Plain: `file #line: [SevError] "message"`. Detailed: the name in front, every origin with
    /// signature and build date, the leftover parameters, and behind a blank the guarded blocks
    /// that the exception passed. Expands the stored message in place: after a plain rendering a
    /// detailed one lists every parameter.
    void writeTo(std::ostream& stream, bool detailed) const;
    void writeTo(std::wostream& stream, bool detailed) const;
    /// @}

  protected:
    CException() = default;

    /// @{
    /// Only a whole exception is copied, never its root alone.
    CException(CException const&) = default;
    CException& operator=(CException const&) = default;
    /// @}
};

/// The plain rendering. Casting an exception to text goes through here.
std::wostream& operator<<(std::wostream& stream, CException const& exc);

} // namespace Error

#endif
