#pragma once
// An open file or folder, closed on every way out.
#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <utility>

namespace Quorle {

class FileDescriptor {
  public:
    FileDescriptor() = default;
    explicit FileDescriptor(int number) : number_(number) {}
    FileDescriptor(FileDescriptor&& other) noexcept : number_(std::exchange(other.number_, -1)) {}
    FileDescriptor& operator=(FileDescriptor&& other) noexcept {
        std::swap(number_, other.number_);
        return *this;
    }
    ~FileDescriptor() {
        if (number_ >= 0) ::close(number_);
    }

    explicit operator bool() const { return number_ >= 0; }
    int number() const { return number_; }

    /// Closes now; false when the system reports that data may be lost.
    /// An interrupted close has closed.
    bool close() { return ::close(std::exchange(number_, -1)) == 0 || errno == EINTR; }

  private:
    int number_ = -1;
};

/// Calls `call` (a system call that gives -1 and errno) again while signals interrupt it.
template <typename Call>
auto RepeatInterrupted(Call call) {
    auto result = call();
    while (result == -1 && errno == EINTR) result = call();
    return result;
}

/// Empty, and errno, when it cannot be opened.
inline FileDescriptor OpenAt(int folder, const char* path, int flags, mode_t mode = 0) {
    return FileDescriptor(
        RepeatInterrupted([&] { return openat(folder, path, flags | O_CLOEXEC, mode); }));
}

}  // namespace Quorle
