#pragma once
// The one way in which files are written: after any fault the old or the new content stands,
// whole. The content goes to a hidden temporary file beside the target, which then takes its name.
#include <cstddef>
#include <span>

#include "files/file_target.h"

namespace Quorle {

/// Whether the file that is replaced gets a second name before.
enum class Old { Goes, Stays };

/// Replaces the file at `path`, or makes it, under a lock on its folder. Symbolic links stay and
/// lead to the new content; an old file's mode and, where allowed, owner stay. Only a regular file
/// is replaced. False: the old content stands (or the new, when only the folder's sync failed).
bool ReplaceFile(const char* path, std::span<const std::byte> content, Old old = Old::Goes);

/// The same under the lock that the caller holds on the target's folder.
bool ReplaceFile(const FileTarget& target, std::span<const std::byte> content, Old old = Old::Goes);

}  // namespace Quorle
