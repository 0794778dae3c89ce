#include "faulty_calls.h"

#include <fcntl.h>
#include <signal.h>
#include <stdarg.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>

namespace FaultyCalls {
namespace {

Plan Now;
bool Armed = false;
std::map<std::string, int> Calls;

/// What is to happen at this call.
Fault Next(const char* call) {
    if (!Armed) return Fault::None;
    const bool due = ++Calls[call] == Now.number && Now.call == call;
    if (due && Now.fault == Fault::Kill) raise(SIGKILL);
    return due ? Now.fault : Fault::None;
}

template <typename... Arguments>
long Perform(const char* call, long number, Arguments... arguments) {
    if (Next(call) != Fault::Error) return syscall(number, arguments...);
    // A descriptor is gone whatever its closing says.
    if (number == SYS_close) syscall(number, arguments...);
    errno = Now.error;
    return -1;
}

template <typename Data>
ssize_t Transfer(const char* call, long number, int file, Data* data, size_t size) {
    const Fault fault = Next(call);
    errno = Now.error;
    if (fault == Fault::Error) return -1;
    return syscall(number, file, data, fault == Fault::Short ? std::min<size_t>(size, 1) : size);
}

}  // namespace

void Arm(const Plan& plan) {
    Now = plan;
    Calls.clear();
    Armed = true;
}

std::map<std::string, int> Disarm() {
    Armed = false;
    return Calls;
}

}  // namespace FaultyCalls

using namespace FaultyCalls;

extern "C" {

int openat(int folder, const char* path, int flags, ...) {
    va_list rest;
    va_start(rest, flags);
    const mode_t mode = (flags & O_CREAT) != 0 ? va_arg(rest, mode_t) : 0;
    va_end(rest);
    return static_cast<int>(Perform("openat", SYS_openat, folder, path, flags, mode));
}
ssize_t write(int file, const void* data, size_t size) {
    return Transfer("write", SYS_write, file, data, size);
}
ssize_t read(int file, void* data, size_t size) {
    return Transfer("read", SYS_read, file, data, size);
}
ssize_t readlink(const char* path, char* link, size_t size) {
    return Perform("readlink", SYS_readlink, path, link, size);
}
int linkat(int from, const char* path, int to, const char* name, int flags) {
    const bool possible = !Armed || !Now.noLinks;
    if (possible)
        return static_cast<int>(Perform("linkat", SYS_linkat, from, path, to, name, flags));
    errno = EPERM;
    return -1;
}

#define CALL(name, number, parameters, ...)                           \
    int name parameters {                                             \
        return static_cast<int>(Perform(#name, number, __VA_ARGS__)); \
    }
CALL(close, SYS_close, (int file), file)
CALL(fsync, SYS_fsync, (int file), file)
CALL(fchmod, SYS_fchmod, (int file, mode_t mode), file, mode)
CALL(fchown, SYS_fchown, (int file, uid_t owner, gid_t group), file, owner, group)
CALL(flock, SYS_flock, (int file, int operation), file, operation)
CALL(fstat, SYS_fstat, (int file, struct stat* status), file, status)
CALL(lstat, SYS_lstat, (const char* path, struct stat* status), path, status)
CALL(fstatat, SYS_newfstatat, (int folder, const char* path, struct stat* status, int flags),
     folder, path, status, flags)
CALL(unlinkat, SYS_unlinkat, (int folder, const char* path, int flags), folder, path, flags)
CALL(renameat, SYS_renameat, (int from, const char* path, int to, const char* name), from, path, to,
     name)
CALL(mkdir, SYS_mkdir, (const char* path, mode_t mode), path, mode)
}
