/// A program that runs beside a test and serves it, such as a bus or a display.
///
///     CServerProgram const display({"Xvfb", "-displayfd", "{}"});
///     if (!display.isRunning())
///         GTEST_SKIP() << display.reason();
///     display.line();   // "99"
#ifndef QORN_TESTS_SERVERPROGRAM_H
#define QORN_TESTS_SERVERPROGRAM_H

#include <sys/types.h>

#include <string>
#include <vector>

namespace TestSupport {

/// Runs from the construction to the end of the object, and at most as long as this process.
class CServerProgram {
  public:
    /// The program is looked for in PATH. It tells that it is ready by writing a line to a
    /// descriptor, whose number takes the place of "{}" in the arguments. What it writes elsewhere
    /// is lost.
    explicit CServerProgram(std::vector<std::string> arguments);
    ~CServerProgram();

    CServerProgram(CServerProgram const&) = delete;
    CServerProgram& operator=(CServerProgram const&) = delete;

    bool isRunning() const { return !line_.empty(); }

    /// Why it isn't running.
    std::string reason() const { return program_ + " can't be run here"; }

    /// The line that it wrote, without its end.
    std::string const& line() const { return line_; }

  private:
    std::string program_;
    pid_t process_ = -1;
    std::string line_;
};

} // namespace TestSupport

#endif
