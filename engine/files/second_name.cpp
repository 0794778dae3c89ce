#include "files/second_name.h"

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>

namespace Quorle {

// Where the file system knows no links the file moves: its content stands under the second name
// until the new one takes the first. Whether a name is free has to be asked before, for moving
// would replace what stands there; the folder's lock keeps other savers out meanwhile.
bool SecondName::give(int folder, const std::string& name, const struct stat& file) {
    folder_ = folder;
    first_ = second_ = name;
    file_ = file.st_ino;
    second_ += ".damaged";
    for (int number = 2;; ++number) {
        bool has = false;
        if (isFree(has)) {
            isNew_ = linkat(folder, name.c_str(), folder, second_.c_str(), 0) == 0;
            if (isNew_) return true;
            if (errno != EEXIST) break;
        } else if (has || errno != 0) {
            return has;  // by a save that was killed before it was through
        }
        second_ = name + ".damaged." + std::to_string(number);
    }
    isOnly_ = renameat(folder, name.c_str(), folder, second_.c_str()) == 0;
    return isOnly_;
}

/// Otherwise `has` tells whether the name is the file's already; with errno when that is unknown.
bool SecondName::isFree(bool& has) const {
    struct stat other;
    const bool stands = fstatat(folder_, second_.c_str(), &other, AT_SYMLINK_NOFOLLOW) == 0;
    if (!stands) return errno == ENOENT;
    has = other.st_ino == file_;
    errno = 0;
    return false;
}

void SecondName::takeBack() const {
    if (isNew_) unlinkat(folder_, second_.c_str(), 0);
    if (isOnly_) renameat(folder_, second_.c_str(), folder_, first_.c_str());
}

}  // namespace Quorle
