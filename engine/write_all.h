#pragma once
// Writing to an open file so that no short write and no signal loses a byte.
#include <cstddef>
#include <span>

#include "file_descriptor.h"

/// Writes all of `content`; false when the system would not.
inline bool WriteAll(int file, std::span<const std::byte> content) {
    while (!content.empty()) {
        const ssize_t done =
            RepeatInterrupted([&] { return write(file, content.data(), content.size()); });
        if (done <= 0) return false;
        content = content.subspan(static_cast<std::size_t>(done));
    }
    return true;
}

/// Waits until the file is on the disk. Never tried again after an error: the system may have
/// dropped what it could not write.
inline bool SyncFile(int file) {
    return RepeatInterrupted([&] { return fsync(file); }) == 0;
}
