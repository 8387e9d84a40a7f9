#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"

#include <dirent.h>
#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <sys/types.h>

#include <algorithm>
#include <cerrno>
#include <cstdarg>
#include <cstdio>
#include <cstring>

using TestSupport::CSystemCalls;

namespace TestSupport {
namespace {

CSystemCalls* currentCalls = nullptr;

} // namespace

CSystemCalls::CSystemCalls() {
    currentCalls = this;
}

CSystemCalls::~CSystemCalls() {
    currentCalls = nullptr;
}

CSystemCalls* CSystemCalls::current() {
    return currentCalls;
}

void CSystemCalls::setUser(std::optional<CUserEntry> const& user, std::size_t room) {
    hasUsers_ = true;
    user_ = user;
    userRoom_ = room;
}

bool CSystemCalls::takeFailure(std::string const& function) {
    auto const failure = failures_.find(function);
    if (failure == failures_.end() || --failure->second.left != 0)
        return false;
    errno = failure->second.error;
    failures_.erase(failure);
    return true;
}

std::string CSystemCalls::fileFor(std::string const& path) const {
    auto const file = files_.find(path);
    return file == files_.end() ? path : file->second;
}

} // namespace TestSupport

namespace {

bool isToFail(char const* function) {
    return CSystemCalls::current() != nullptr && CSystemCalls::current()->takeFailure(function);
}

} // namespace

extern "C" {

int __real_open(char const* path, int flags, mode_t mode);
int __real_fstat(int descriptor, struct stat* status);
ssize_t __real_read(int descriptor, void* data, size_t size);
ssize_t __real_getrandom(void* data, size_t size, unsigned flags);
DIR* __real_opendir(char const* path);
ssize_t __real_write(int descriptor, void const* data, size_t size);
int __real_close(int descriptor);
int __real_rename(char const* from, char const* to);
int __real_lsetxattr(char const* path, char const* name, void const* value, size_t size, int flags);
int __real_lremovexattr(char const* path, char const* name);
int __real_gethostname(char* name, size_t size);
int __real_statx(int folder, char const* path, int flags, unsigned mask, struct statx* status);
int __real_getpwuid_r(uid_t user, struct passwd* entry, char* buffer, size_t size,
                      struct passwd** result);

int __wrap_open(char const* path, int flags, ...) {
    mode_t mode = 0;
    if ((flags & O_CREAT) != 0) {
        va_list arguments;
        va_start(arguments, flags);
        mode = va_arg(arguments, mode_t);
        va_end(arguments);
    }
    if (isToFail("open"))
        return -1;
    CSystemCalls const* const calls = CSystemCalls::current();
    return __real_open(calls != nullptr ? calls->fileFor(path).c_str() : path, flags, mode);
}

int __wrap_fstat(int descriptor, struct stat* status) {
    return isToFail("fstat") ? -1 : __real_fstat(descriptor, status);
}

ssize_t __wrap_read(int descriptor, void* data, size_t size) {
    return isToFail("read") ? -1 : __real_read(descriptor, data, size);
}

ssize_t __wrap_getrandom(void* data, size_t size, unsigned flags) {
    return isToFail("getrandom") ? -1 : __real_getrandom(data, size, flags);
}

DIR* __wrap_opendir(char const* path) {
    return isToFail("opendir") ? nullptr : __real_opendir(path);
}

// A failing write is one of a full disk: half of the data is written first.
ssize_t __wrap_write(int descriptor, void const* data, size_t size) {
    static bool wroteHalf = false;
    if (wroteHalf) {
        wroteHalf = false;
        errno = ENOSPC;
        return -1;
    }
    if (isToFail("write")) {
        if (errno == EINTR)
            return -1;
        wroteHalf = true;
        return __real_write(descriptor, data, size / 2);
    }
    return __real_write(descriptor, data, size);
}

int __wrap_close(int descriptor) {
    int const error = isToFail("close") ? errno : 0;
    int const result = __real_close(descriptor);
    if (error == 0)
        return result;
    errno = error;
    return -1;
}

int __wrap_rename(char const* from, char const* to) {
    if (CSystemCalls::current() != nullptr && CSystemCalls::current()->onRename)
        CSystemCalls::current()->onRename(from, to);
    return isToFail("rename") ? -1 : __real_rename(from, to);
}

int __wrap_lsetxattr(char const* path, char const* name, void const* value, size_t size,
                     int flags) {
    return isToFail("lsetxattr") ? -1 : __real_lsetxattr(path, name, value, size, flags);
}

int __wrap_lremovexattr(char const* path, char const* name) {
    return isToFail("lremovexattr") ? -1 : __real_lremovexattr(path, name);
}

int __wrap_gethostname(char* name, size_t size) {
    if (isToFail("gethostname"))
        return -1;
    CSystemCalls const* const calls = CSystemCalls::current();
    if (calls == nullptr || !calls->hostName())
        return __real_gethostname(name, size);
    std::memcpy(name, calls->hostName()->data(), std::min(size, calls->hostName()->size()));
    return 0;
}

int __wrap_statx(int folder, char const* path, int flags, unsigned mask, struct statx* status) {
    if (isToFail("statx"))
        return -1;
    int const result = __real_statx(folder, path, flags, mask, status);
    if (result == 0 && CSystemCalls::current() != nullptr && CSystemCalls::current()->onStatx)
        CSystemCalls::current()->onStatx(path, *status);
    return result;
}

int __wrap_getpwuid_r(uid_t user, struct passwd* entry, char* buffer, size_t size,
                      struct passwd** result) {
    CSystemCalls* const calls = CSystemCalls::current();
    if (calls == nullptr || !calls->hasUsers())
        return __real_getpwuid_r(user, entry, buffer, size, result);
    calls->usersAsked.push_back(user);
    *result = nullptr;
    if (!calls->user())
        return 0;
    if (size < calls->userRoom())
        return ERANGE;
    *entry = {};
    entry->pw_name = const_cast<char*>(calls->user()->login.c_str());
    entry->pw_gecos = const_cast<char*>(calls->user()->gecos.c_str());
    entry->pw_dir = const_cast<char*>(calls->user()->home.c_str());
    *result = entry;
    return 0;
}

// Nothing reaches the system's log from here.
void __wrap_syslog(int, char const* format, ...) {
    char line[1024];
    va_list arguments;
    va_start(arguments, format);
    std::vsnprintf(line, sizeof line, format, arguments);
    va_end(arguments);
    if (CSystemCalls::current() != nullptr)
        CSystemCalls::current()->logged.emplace_back(line);
}
}
