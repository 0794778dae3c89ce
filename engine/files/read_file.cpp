#include "files/read_file.h"

#include <fcntl.h>
#include <sys/stat.h>

namespace Quorle {

namespace {

// Nothing of ours comes near; a larger file must not exhaust the memory before it is refused.
constexpr std::size_t MaxFileSize = std::size_t{1} << 30;
constexpr std::size_t ReadAhead = 4096;

bool ReadAll(int file, std::size_t sizeHint, std::vector<std::byte>& out) {
    std::size_t used = 0;
    out.resize(sizeHint + 1);  // the byte more shows the end without another round
    while (used <= MaxFileSize) {
        if (used == out.size()) out.resize(used + used / 2 + ReadAhead);
        const ssize_t got =
            RepeatInterrupted([&] { return read(file, out.data() + used, out.size() - used); });
        if (got < 0) return false;
        if (got == 0) {
            out.resize(used);
            return true;
        }
        used += static_cast<std::size_t>(got);
    }
    return false;
}

}  // namespace

FileDescriptor OpenRegularFile(int folder, const char* path) {
    FileDescriptor file(RepeatInterrupted(
        [&] { return openat(folder, path, O_RDONLY | O_NONBLOCK | O_NOCTTY | O_CLOEXEC); }));
    struct stat status;
    if (!file || fstat(file.number(), &status) != 0) return {};
    if (!S_ISREG(status.st_mode)) {
        errno = EINVAL;
        return {};
    }
    return file;
}

ReadResult ReadFileAt(int folder, const char* path, std::vector<std::byte>& out) {
    out.clear();
    const FileDescriptor file = OpenRegularFile(folder, path);
    if (!file) return errno == ENOENT ? ReadResult::Missing : ReadResult::Failed;
    struct stat status;
    if (fstat(file.number(), &status) != 0) return ReadResult::Failed;
    const auto size = static_cast<std::size_t>(status.st_size);
    if (size <= MaxFileSize && ReadAll(file.number(), size, out)) return ReadResult::Done;
    out.clear();
    return ReadResult::Failed;
}

bool ReadRegularFile(const char* path, std::vector<std::byte>& out) {
    return ReadFileAt(AT_FDCWD, path, out) == ReadResult::Done;
}

}  // namespace Quorle
