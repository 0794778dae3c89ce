#pragma once
// Open files and folders, and reading files: regular ones alone, so that no pipe and no device is
// waited for.
#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstddef>
#include <utility>
#include <vector>

namespace Quorle {

/// An open file or folder, closed on every way out.
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

    /// Closes now; false when data may be lost. An interrupted close has closed.
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

/// Opens `path`, relative to the open folder `folder` or AT_FDCWD; with errno when empty.
FileDescriptor OpenAt(int folder, const char* path, int flags, mode_t mode = 0);

/// Opens a regular file in the same way to be read, and tells its size.
FileDescriptor OpenRegularFile(int folder, const char* path, std::size_t& size);

/// Reads at most `size` bytes, fewer only at the file's end, and tells how many; false when it
/// cannot be read.
bool ReadOn(int file, std::byte* to, std::size_t size, std::size_t& got);

/// Reads the whole file, 1 GiB at most, into `out`. `Missing` only when there is no such file;
/// unless `Done`, `out` is empty.
enum class ReadResult { Done, Missing, Failed };
ReadResult ReadFileAt(int folder, const char* path, std::vector<std::byte>& out);

}  // namespace Quorle
