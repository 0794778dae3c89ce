#pragma once
// Where a file is written: the last target of its symbolic links, and that target's folder.
#include <string>

#include "files/file_descriptor.h"

namespace Quorle {

struct FileTarget {
    FileDescriptor folder;  // open; empty when the path leads nowhere
    std::string name;       // within the folder: never empty, no folder, no path
};

/// Follows the links of `path` by hand, so that a link to a file not yet there leads to it too.
FileTarget FindTarget(const char* path);

/// Locks the target's folder against other savers, trying for up to a second; the lock lives as
/// long as the open folder. False when another holds it for longer. A file system that knows no
/// locks counts as locked.
bool LockFolder(const FileTarget& target);

}  // namespace Quorle
