/// Catches what a process writes to its standard streams, by whatever road.
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_OUTPUTCAPTURE_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_OUTPUTCAPTURE_H

#include <string>

namespace BridgeTest {

/// While it lives, the file descriptors of standard output and standard error lead to memory.
class COutputCapture {
  public:
    COutputCapture();
    ~COutputCapture();
    COutputCapture(COutputCapture const&) = delete;
    COutputCapture& operator=(COutputCapture const&) = delete;

    /// What was written so far.
    std::string text() const;

  private:
    int memory_;
    int output_;
    int error_;
};

} // namespace BridgeTest

#endif
