#pragma once
// Reading files: regular ones alone, so that no pipe and no device is waited for.
#include <cstddef>
#include <vector>

#include "files/file_descriptor.h"

namespace Quorle {

/// Opens a regular file and tells its size; with errno when empty. `path` is relative to the open
/// folder `folder`, which may be AT_FDCWD.
FileDescriptor OpenRegularFile(int folder, const char* path, std::size_t& size);

/// Reads at most `size` bytes, fewer only at the file's end, and tells how many; false when it
/// cannot be read.
bool ReadOn(int file, std::byte* to, std::size_t size, std::size_t& got);

/// Reads the whole file, 1 GiB at most, into `out`. `Missing` only when there is no such file;
/// unless `Done`, `out` is empty.
enum class ReadResult { Done, Missing, Failed };
ReadResult ReadFileAt(int folder, const char* path, std::vector<std::byte>& out);

}  // namespace Quorle
