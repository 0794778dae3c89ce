#include "files/read_file.h"

#include <sys/stat.h>

namespace Quorle {

// Nothing of ours comes near; a larger file must not exhaust the memory before it is refused.
constexpr std::size_t MaxFileSize = std::size_t{1} << 30;

FileDescriptor OpenAt(int folder, const char* path, int flags, mode_t mode) {
    return FileDescriptor(
        RepeatInterrupted([&] { return openat(folder, path, flags | O_CLOEXEC, mode); }));
}

FileDescriptor OpenRegularFile(int folder, const char* path, std::size_t& size) {
    FileDescriptor file = OpenAt(folder, path, O_RDONLY | O_NONBLOCK | O_NOCTTY);
    struct stat status;
    if (!file || fstat(file.number(), &status) != 0) return {};
    size = static_cast<std::size_t>(status.st_size);
    if (S_ISREG(status.st_mode)) return file;
    errno = EINVAL;
    return {};
}

bool ReadOn(int file, std::byte* to, std::size_t size, std::size_t& got) {
    for (got = 0; got < size;) {
        const ssize_t more = RepeatInterrupted([&] { return read(file, to + got, size - got); });
        if (more <= 0) return more == 0;
        got += static_cast<std::size_t>(more);
    }
    return true;
}

ReadResult ReadFileAt(int folder, const char* path, std::vector<std::byte>& out) {
    out.clear();
    std::size_t size = 0, got = 0;
    const FileDescriptor file = OpenRegularFile(folder, path, size);
    if (!file) return errno == ENOENT ? ReadResult::Missing : ReadResult::Failed;
    if (size > MaxFileSize) return ReadResult::Failed;
    out.resize(size + 1);  // a file that has grown meanwhile is not read whole
    const bool isWhole = ReadOn(file.number(), out.data(), out.size(), got) && got <= size;
    out.resize(isWhole ? got : 0);
    return isWhole ? ReadResult::Done : ReadResult::Failed;
}

}  // namespace Quorle
