/// Ready-made log targets. Nothing installs them by itself.
///
///     static Error::CStreamLogTarget const target(std::clog, Error::SevWarn);
///     Error::CLogSingleton::addTarget<Error::TTgtLogger, Error::TSevWarn>(&target);
///     // [SevWarn] FileSys: no folder /tmp/a (/src/FileSys.cpp #12)
#ifndef QORN_1BASE_ERRORLOGTARGETS_H
#define QORN_1BASE_ERRORLOGTARGETS_H

#include "1Base/Error/ErrorLogging.h"

#include <iosfwd>

namespace Error {

/// Writes each record as one line of UTF-8 to a stream: `[severity] tag: text (file #line)`, line
/// breaks within the text as blanks, and U+FFFD for what is no character. The stream must outlive
/// the target; a failed stream is left as it is, and nothing is raised for it.
class CStreamLogTarget : public CLogTarget {
  public:
    /// Records below `least` are passed over.
    explicit CStreamLogTarget(std::ostream& stream, ESeverity least = SevDebug);

    void write(char const* file, unsigned int line, char const* func, char const* date,
               char const* time, char const* tag, char const* target, char const* severity,
               CMessage const& message) const override;

  private:
    std::ostream& stream_;
    ESeverity least_;
};

/// Appends the same lines to a file, each with one write. A file that can't be opened or a full
/// disk loses records and raises nothing; once there is room again, lines arrive whole.
class CFileLogTarget : public CLogTarget {
  public:
    /// Opens `path` for appending and makes it where it is missing. Raises the conversion failure
    /// for a path that is no text.
    explicit CFileLogTarget(wchar_t const* path, ESeverity least = SevDebug);
    ~CFileLogTarget() override;

    CFileLogTarget(CFileLogTarget const&) = delete;
    CFileLogTarget& operator=(CFileLogTarget const&) = delete;

    /// False where the file could not be opened.
    bool is_open() const { return descriptor_ >= 0; }

    void write(char const* file, unsigned int line, char const* func, char const* date,
               char const* time, char const* tag, char const* target, char const* severity,
               CMessage const& message) const override;

  private:
    int descriptor_;
    ESeverity least_;
    // The last line was cut off; the next one starts on a line of its own.
    mutable bool torn_ = false;
};

} // namespace Error

#endif
