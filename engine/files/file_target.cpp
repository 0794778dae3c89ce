#include "files/file_target.h"

#include <fcntl.h>
#include <limits.h>
#include <sys/file.h>
#include <time.h>

#include <array>
#include <chrono>

namespace Quorle {

namespace {

constexpr int MaxLinks = 40;
constexpr std::chrono::seconds LockPatience{1};

/// Splits `path` at its last slash and moves `target` there.
void Enter(FileTarget& target, int from, const std::string& path) {
    const std::size_t slash = path.rfind('/');
    const std::string folder =
        slash == std::string::npos ? "." : path.substr(0, slash == 0 ? 1 : slash);
    target.name = path.substr(slash == std::string::npos ? 0 : slash + 1);
    target.folder = FileDescriptor(RepeatInterrupted(
        [&] { return openat(from, folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC); }));
}

bool KnowsNoLocks(int error) {
    // EBADF: network file systems lock only what is open for writing, as no folder can be.
    return error == ENOLCK || error == EOPNOTSUPP || error == ENOSYS || error == EINVAL ||
           error == EBADF;
}

}  // namespace

FileTarget FindTarget(const char* path) {
    FileTarget target;
    Enter(target, AT_FDCWD, path);
    for (int links = 0; target.folder && links <= MaxLinks; ++links) {
        if (target.name.empty() || target.name == "." || target.name == "..") return {};
        std::array<char, PATH_MAX> link;
        const ssize_t length =
            readlinkat(target.folder.number(), target.name.c_str(), link.data(), link.size());
        if (length < 0 && (errno == EINVAL || errno == ENOENT)) return target;  // no link
        if (length <= 0 || length == static_cast<ssize_t>(link.size())) return {};
        FileTarget next;
        Enter(next, target.folder.number(), std::string(link.data(), static_cast<size_t>(length)));
        target = std::move(next);
    }
    return {};
}

bool LockFolder(const FileTarget& target) {
    const auto deadline = std::chrono::steady_clock::now() + LockPatience;
    while (flock(target.folder.number(), LOCK_EX | LOCK_NB) != 0) {
        if (errno == EINTR) continue;
        if (errno != EWOULDBLOCK) return KnowsNoLocks(errno);
        if (std::chrono::steady_clock::now() > deadline) return false;
        const timespec pause{0, 2'000'000};
        nanosleep(&pause, nullptr);
    }
    return true;
}

}  // namespace Quorle
