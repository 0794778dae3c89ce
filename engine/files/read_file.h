#pragma once
// Reading a file whole.
#include <cstddef>
#include <vector>

#include "files/file_descriptor.h"

namespace Quorle {

enum class ReadResult { Done, Missing, Failed };

/// Opens a regular file for reading; never waits (a pipe, a device, a folder are refused).
/// `path` is relative to the open folder `folder`, which may be AT_FDCWD. With errno when empty.
FileDescriptor OpenRegularFile(int folder, const char* path);

/// Reads the whole file, 1 GiB at most, into `out`. `Missing` only when there is no such file;
/// unless `Done`, `out` is empty.
ReadResult ReadFileAt(int folder, const char* path, std::vector<std::byte>& out);

/// Reads the whole regular file at `path` into `out`; false, and `out` empty, when any of it
/// cannot be read.
bool ReadRegularFile(const char* path, std::vector<std::byte>& out);

}  // namespace Quorle
