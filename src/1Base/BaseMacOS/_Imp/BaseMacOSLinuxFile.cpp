#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxFile.h"

#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"

#include <fcntl.h>
#include <sys/random.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdint>

namespace MacOS {
namespace Native {
namespace {

class CDescriptor {
  public:
    explicit CDescriptor(int number) : number_(number) {}
    ~CDescriptor() { close(); }

    CDescriptor(CDescriptor const&) = delete;
    CDescriptor& operator=(CDescriptor const&) = delete;

    int get() const { return number_; }

    /// 0, or the error number. Network file systems report a failed write here.
    int close() {
        int const number = number_;
        number_ = -1;
        return number < 0 || ::close(number) == 0 ? 0 : errno;
    }

  private:
    int number_;
};

bool isRegular(int descriptor) {
    struct stat status;
    return ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode);
}

int writeAll(int descriptor, std::string const& text) {
    for (std::size_t done = 0; done < text.size();) {
        ssize_t const written = ::write(descriptor, text.data() + done, text.size() - done);
        if (written >= 0)
            done += static_cast<std::size_t>(written);
        else if (errno != EINTR)
            return errno;
    }
    return 0;
}

// Short, whatever the length of the name that the file gets in the end.
std::string makeScratchPath(std::string const& folder) {
    std::uint64_t number = 0;
    if (::getrandom(&number, sizeof number, GRND_NONBLOCK) < 0)
        number = static_cast<std::uint64_t>(::getpid());
    return joinPath(folder, ".qorn-" + std::to_string(number));
}

int writeNewFile(std::string const& path, std::string const& text) {
    CDescriptor file(::open(path.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666));
    if (file.get() < 0)
        return errno;
    int const failure = writeAll(file.get(), text);
    int const closingFailure = file.close();
    return failure != 0 ? failure : closingFailure;
}

} // namespace

std::optional<std::string> readTextFile(std::string const& path) {
    CDescriptor const file(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY));
    if (file.get() < 0 || !isRegular(file.get()))
        return std::nullopt;
    // The size of the kernel's own files is not to be trusted: read to the end.
    std::string text(textFileLimit + 1, '\0');
    std::size_t size = 0;
    while (size < text.size()) {
        ssize_t const count = ::read(file.get(), &text[size], text.size() - size);
        if (count == 0) {
            text.resize(size);
            return text;
        }
        if (count > 0)
            size += static_cast<std::size_t>(count);
        else if (errno != EINTR)
            return std::nullopt;
    }
    return std::nullopt;
}

int writeTextFile(std::string const& path, std::string const& text) {
    std::string const scratch = makeScratchPath(folderOf(path));
    int failure = writeNewFile(scratch, text);
    if (failure == EEXIST)
        return failure;
    if (failure == 0 && ::rename(scratch.c_str(), path.c_str()) != 0)
        failure = errno;
    if (failure != 0)
        ::unlink(scratch.c_str());
    return failure;
}

} // namespace Native
} // namespace MacOS
