#include "QORNOpenOfficeLibrary/OutputCapture.h"

#include <cstdio>
#include <cstdlib>
#include <sys/mman.h>
#include <unistd.h>

namespace BridgeTest {
namespace {

int require(int result) {
    if (result < 0) {
        std::perror("COutputCapture");
        std::abort();
    }
    return result;
}

} // namespace

COutputCapture::COutputCapture()
    : memory_(require(memfd_create("output", MFD_CLOEXEC))),
      output_(require(dup(STDOUT_FILENO))),
      error_(require(dup(STDERR_FILENO))) {
    std::fflush(nullptr);
    require(dup2(memory_, STDOUT_FILENO));
    require(dup2(memory_, STDERR_FILENO));
}

COutputCapture::~COutputCapture() {
    std::fflush(nullptr);
    dup2(output_, STDOUT_FILENO);
    dup2(error_, STDERR_FILENO);
    close(output_);
    close(error_);
    close(memory_);
}

std::string COutputCapture::text() const {
    std::fflush(nullptr);
    std::string result;
    char buffer[4096];
    ssize_t count;
    while ((count = pread(memory_, buffer, sizeof buffer, static_cast<off_t>(result.size()))) > 0)
        result.append(buffer, static_cast<std::size_t>(count));
    return result;
}

} // namespace BridgeTest
