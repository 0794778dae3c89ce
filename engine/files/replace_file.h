#pragma once
// The one way in which files are written: after any fault the old or the new content stands,
// whole. The content goes to a hidden temporary file beside the target, which then takes its name.
#include <cstddef>
#include <span>
#include <string>

#include "files/read_file.h"

namespace Quorle {

/// Where a file is written: the last target of its symbolic links.
struct FileTarget {
    FileDescriptor folder;  // open; empty when the path leads nowhere or the folder is in use
    std::string name;       // within the folder
};

/// Follows the links of `path`, so that a link to a file not yet there leads to it too, and locks
/// the folder against other savers, trying for up to a second; the lock lives as long as the open
/// folder. A file system that knows no locks counts as locked.
FileTarget LockTarget(const char* path);

/// Whether the file that is replaced gets a second name before.
enum class Old { Goes, Stays };

/// Replaces the file, or makes it. Symbolic links stay and lead to the new content; an old file's
/// mode and, where allowed, owner stay. Only a regular file is replaced. False: the old content
/// stands (or the new, when only the folder's sync failed).
bool ReplaceFile(const FileTarget& target, std::span<const std::byte> content, Old old = Old::Goes);

}  // namespace Quorle
