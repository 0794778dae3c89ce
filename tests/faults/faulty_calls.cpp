#include "faulty_calls.h"

#include <signal.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <cerrno>

namespace FaultyCalls {
namespace {

const Plan* Now = nullptr;
std::vector<std::string> Calls;

bool IsDue(Fault fault) {
    return Now != nullptr && Calls.size() == Now->number && Now->fault == fault;
}

/// What is to be read or written may be cut short.
template <typename Argument>
Argument Cut(Argument argument) {
    return std::is_same_v<Argument, size_t> && IsDue(Fault::Short) ? Argument(1) : argument;
}

template <typename Result, typename... Arguments>
Result Perform(const std::string& call, long number, Arguments... arguments) {
    const bool noLink = Now != nullptr && Now->noLinks && call == "linkat";
    if (Now != nullptr && !noLink) Calls.push_back(call);
    if (IsDue(Fault::Kill)) raise(SIGKILL);
    const bool fails = noLink || IsDue(Fault::Error);
    // A descriptor is gone whatever its closing says.
    const long result = fails && number != SYS_close ? -1 : syscall(number, Cut(arguments)...);
    if (fails) errno = noLink ? EPERM : Now->error;
    return fails ? -1 : static_cast<Result>(result);
}

}  // namespace

std::vector<std::string> During(const Plan& plan, const std::function<void()>& work) {
    Calls.clear();
    Now = &plan;
    work();
    Now = nullptr;
    return Calls;
}

}  // namespace FaultyCalls

#define CALL(result, name, number, parameters, ...)                      \
    extern "C" result name parameters {                                  \
        return FaultyCalls::Perform<result>(#name, number, __VA_ARGS__); \
    }
// Without its header openat() needs no list of any arguments.
CALL(int, openat, SYS_openat, (int folder, const char* path, int flags, mode_t mode), folder, path,
     flags, mode)
CALL(ssize_t, read, SYS_read, (int file, void* data, size_t size), file, data, size)
CALL(ssize_t, write, SYS_write, (int file, const void* data, size_t size), file, data, size)
CALL(ssize_t, readlink, SYS_readlink, (const char* path, char* link, size_t size), path, link, size)
CALL(int, close, SYS_close, (int file), file)
CALL(int, fsync, SYS_fsync, (int file), file)
CALL(int, flock, SYS_flock, (int file, int operation), file, operation)
CALL(int, fchmod, SYS_fchmod, (int file, mode_t mode), file, mode)
CALL(int, fchown, SYS_fchown, (int file, uid_t owner, gid_t group), file, owner, group)
CALL(int, fstat, SYS_fstat, (int file, struct stat* status), file, status)
CALL(int, lstat, SYS_lstat, (const char* path, struct stat* status), path, status)
CALL(int, fstatat, SYS_newfstatat, (int folder, const char* path, struct stat* status, int flags),
     folder, path, status, flags)
CALL(int, linkat, SYS_linkat, (int from, const char* path, int to, const char* name, int flags),
     from, path, to, name, flags)
CALL(int, renameat, SYS_renameat, (int from, const char* path, int to, const char* name), from,
     path, to, name)
CALL(int, unlinkat, SYS_unlinkat, (int folder, const char* path, int flags), folder, path, flags)
CALL(int, mkdir, SYS_mkdir, (const char* path, mode_t mode), path, mode)
