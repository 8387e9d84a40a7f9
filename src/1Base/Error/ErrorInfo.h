/// Where an exception arose, what it says, and which guarded blocks it passed.
///
/// None of these values owns its `char const*` texts: they are static strings (file names,
/// signatures, build dates and times).
#ifndef QORN_1BASE_ERRORINFO_H
#define QORN_1BASE_ERRORINFO_H

#include "1Base/Error/ErrorMessage.h"
#include "1Base/Error/ErrorSeverity.h"

#include <iosfwd>
#include <vector>

namespace Error {

/// A place in the sources. `func` is the whole signature as the compiler prints it, `date` and
/// `time` are those of the build.
class COrigin {
  public:
    /// The texts are static: they are not copied.
    constexpr COrigin(char const* file, unsigned int line, char const* func, char const* date,
                      char const* time)
        : file_(file), line_(line), func_(func), date_(date), time_(time) {}

    /// @{
    /// What the constructor was given.
    char const* getFile() const { return file_; }
    unsigned int getLine() const { return line_; }
    char const* getFunc() const { return func_; }
    char const* getDate() const { return date_; }
    char const* getTime() const { return time_; }
    /// @}

    /// @{
    /// `file #line`, the line right-adjusted to three places; the adjustment stays on the stream.
    /// Detailed, signature, date and time follow.
    void writeTo(std::ostream& stream, bool detailed) const;
    void writeTo(std::wostream& stream, bool detailed) const;
    /// @}

  private:
    char const* file_;
    unsigned int line_;
    char const* func_;
    char const* date_;
    char const* time_;
};

/// What an exception says: origin, message, severity.
class CInfo {
  public:
    /// The same from the parts of an origin.
    CInfo(char const* file, unsigned int line, char const* func, char const* date, char const* time,
          ESeverity severity, CMessage const& message)
        : CInfo(COrigin(file, line, func, date, time), severity, message) {}

    /// Copies the message with its parameters.
    CInfo(COrigin const& origin, ESeverity severity, CMessage const& message)
        : origin_(origin), message_(message), severity_(severity) {}

    /// @{
    /// What the constructor was given.
    COrigin const& getOrigin() const { return origin_; }
    CMessage const& getMessage() const { return message_; }
    ESeverity getSeverity() const { return severity_; }
    /// @}

    /// @{
    /// `origin: [severity] "message"`. The message is expanded in place, twice; detailed, the
    /// parameters that no placeholder took are appended to it. Not for two threads at once.
    void writeTo(std::ostream& stream, bool detailed) const;
    void writeTo(std::wostream& stream, bool detailed) const;
    /// @}

  private:
    COrigin origin_;
    CMessage message_;
    ESeverity severity_;
};

/// A guarded block that an exception passed, by its first and last line.
class CStackInfo {
  public:
    /// The texts are static: they are not copied.
    constexpr CStackInfo(char const* file, unsigned int lineBegin, unsigned int lineEnd,
                         char const* func, char const* date, char const* time)
        : file_(file),
          lineBegin_(lineBegin),
          lineEnd_(lineEnd),
          func_(func),
          date_(date),
          time_(time) {}

    /// @{
    /// What the constructor was given.
    char const* getFile() const { return file_; }
    unsigned int getLineBegin() const { return lineBegin_; }
    unsigned int getLineEnd() const { return lineEnd_; }
    char const* getFunc() const { return func_; }
    char const* getDate() const { return date_; }
    char const* getTime() const { return time_; }
    /// @}

    /// @{
    /// `file [#first...#last] `, with the blank at its end; detailed, signature, date and time
    /// stand before that blank.
    void writeTo(std::ostream& stream, bool detailed) const;
    void writeTo(std::wostream& stream, bool detailed) const;
    /// @}

  private:
    char const* file_;
    unsigned int lineBegin_;
    unsigned int lineEnd_;
    char const* func_;
    char const* date_;
    char const* time_;
};

/// The blocks in the order in which they were passed, the innermost first.
class CStackInfoList {
  public:
    /// Walks from the innermost block outward.
    using const_iterator = std::vector<CStackInfo>::const_iterator;

    /// Adds the next block outward.
    void add(CStackInfo const& info) { entries_.push_back(info); }

    /// @{
    /// The blocks passed so far; adding one ends the validity of both.
    const_iterator begin() const { return entries_.begin(); }
    const_iterator end() const { return entries_.end(); }
    /// @}

    /// @{
    /// All entries, one after the other.
    void writeTo(std::ostream& stream, bool detailed) const;
    void writeTo(std::wostream& stream, bool detailed) const;
    /// @}

  private:
    std::vector<CStackInfo> entries_;
};

} // namespace Error

#endif
