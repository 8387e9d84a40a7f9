#include "support/SystemCalls.h"

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>
#include <cstdarg>
#include <cstdlib>
#include <utility>

namespace TestSupport {
namespace {

thread_local CSystemCalls* watch = nullptr;

} // namespace

CSystemCalls::CSystemCalls() {
    watch = this;
}

CSystemCalls::~CSystemCalls() {
    watch = nullptr;
}

void CSystemCalls::fail(std::string const& function, int error, unsigned int nth) {
    faults_[function] = {error, nth == 0 ? 0 : count(function) + nth};
}

void CSystemCalls::replacePath(std::string const& function, std::string const& path,
                               unsigned int nth) {
    replacements_[function] = {path, count(function) + nth};
}

unsigned int CSystemCalls::count(std::string const& function) const {
    auto const found = counts_.find(function);
    return found == counts_.end() ? 0 : found->second;
}

int CSystemCalls::errorOf(char const* function, char const*& path) {
    CSystemCalls* const watching = std::exchange(watch, nullptr);
    if (watching == nullptr)
        return 0;
    int const error = watching->note(function, path);
    watch = watching;
    return error;
}

int CSystemCalls::note(std::string const& function, char const*& path) {
    unsigned int const number = ++counts_[function];
    if (observer_)
        observer_(function, path == nullptr ? "" : path);
    auto const replacement = replacements_.find(function);
    if (replacement != replacements_.end() && replacement->second.at == number)
        path = replacement->second.path.c_str();
    auto const fault = faults_.find(function);
    bool const fails =
        fault != faults_.end() && (fault->second.at == 0 || fault->second.at == number);
    return fails ? fault->second.error : 0;
}

} // namespace TestSupport

namespace {

// Says whether a call is to fail, with errno set.
bool fails(char const* function, char const*& path) {
    int const before = errno;
    int const error = TestSupport::CSystemCalls::errorOf(function, path);
    errno = error == 0 ? before : error;
    return error != 0;
}

bool fails(char const* function) {
    char const* path = nullptr;
    return fails(function, path);
}

} // namespace

// CMakeLists.txt lists the functions that these stand in front of.
extern "C" {
#define QORN_WRAP(result, name, failure, parameters, arguments, ...)                               \
    result __real_##name parameters;                                                               \
    result __wrap_##name parameters;                                                               \
    result __wrap_##name parameters {                                                              \
        return fails(__VA_ARGS__) ? failure : __real_##name arguments;                             \
    }

QORN_WRAP(int, access, -1, (char const* path, int mode), (path, mode), "access", path)
QORN_WRAP(int, chmod, -1, (char const* path, mode_t mode), (path, mode), "chmod", path)
QORN_WRAP(int, fchmod, -1, (int file, mode_t mode), (file, mode), "fchmod")
QORN_WRAP(int, fchmodat, -1, (int folder, char const* path, mode_t mode, int flags),
          (folder, path, mode, flags), "chmod", path)
QORN_WRAP(DIR*, fdopendir, nullptr, (int file), (file), "fdopendir")
QORN_WRAP(int, ftruncate64, -1, (int file, off64_t size), (file, size), "ftruncate")
QORN_WRAP(int, mkdir, -1, (char const* path, mode_t mode), (path, mode), "mkdir", path)
QORN_WRAP(DIR*, opendir, nullptr, (char const* path), (path), "opendir", path)
QORN_WRAP(ssize_t, read, -1, (int file, void* bytes, size_t count), (file, bytes, count), "read")
QORN_WRAP(struct dirent*, readdir, nullptr, (DIR * folder), (folder), "readdir")
QORN_WRAP(struct dirent64*, readdir64, nullptr, (DIR * folder), (folder), "readdir")
QORN_WRAP(int, rename, -1, (char const* from, char const* to), (from, to), "rename", from)
QORN_WRAP(ssize_t, sendfile64, -1, (int to, int from, off64_t* offset, size_t count),
          (to, from, offset, count), "sendfile")
QORN_WRAP(int, setenv, -1, (char const* name, char const* value, int overwrite),
          (name, value, overwrite), "setenv")
QORN_WRAP(int, stat, -1, (char const* path, struct stat* status), (path, status), "stat", path)
QORN_WRAP(int, statx, -1,
          (int folder, char const* path, int flags, unsigned int mask, struct statx* status),
          (folder, path, flags, mask, status), "statx", path)
QORN_WRAP(int, unlinkat, -1, (int folder, char const* path, int flags), (folder, path, flags),
          "unlinkat", path)
QORN_WRAP(ssize_t, write, -1, (int file, void const* bytes, size_t count), (file, bytes, count),
          "write")
QORN_WRAP(int, __openat64_2, -1, (int folder, char const* path, int flags), (folder, path, flags),
          "openat", path)

// They change the path that they are given.

char* __real_mkdtemp(char* pattern);
char* __wrap_mkdtemp(char* pattern);
char* __wrap_mkdtemp(char* pattern) {
    char const* path = pattern;
    return fails("mkdtemp", path) ? nullptr : __real_mkdtemp(pattern);
}

int __real_mkstemp(char* pattern);
int __wrap_mkstemp(char* pattern);
int __wrap_mkstemp(char* pattern) {
    char const* path = pattern;
    return fails("mkstemp", path) ? -1 : __real_mkstemp(pattern);
}

// Their last parameters are of variable number; passing on one that was not given does no harm.

int __real_open64(char const* path, int flags, mode_t mode);
int __wrap_open64(char const* path, int flags, mode_t mode);
int __wrap_open64(char const* path, int flags, mode_t mode) {
    return fails("open", path) ? -1 : __real_open64(path, flags, mode);
}

int __real_openat64(int folder, char const* path, int flags, mode_t mode);
int __wrap_openat64(int folder, char const* path, int flags, mode_t mode);
int __wrap_openat64(int folder, char const* path, int flags, mode_t mode) {
    return fails("openat", path) ? -1 : __real_openat64(folder, path, flags, mode);
}

long __real_syscall(long number, long a, long b, long c, long d, long e, long f);
long __wrap_syscall(long number, long a, long b, long c, long d, long e, long f);
long __wrap_syscall(long number, long a, long b, long c, long d, long e, long f) {
    if (number == SYS_copy_file_range && fails("copy_file_range"))
        return -1;
    return __real_syscall(number, a, b, c, d, e, f);
}
}
