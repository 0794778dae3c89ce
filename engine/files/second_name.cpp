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
    first_ = name;
    second_ = name + ".damaged";
    struct stat other;
    for (int number = 2; fstatat(folder, second_.c_str(), &other, AT_SYMLINK_NOFOLLOW) == 0;) {
        if (other.st_ino == file.st_ino) return true;  // by a save that was killed
        second_ = name + ".damaged." + std::to_string(number++);
    }
    if (errno != ENOENT) return false;
    isNew_ = linkat(folder, name.c_str(), folder, second_.c_str(), 0) == 0;
    if (isNew_ || errno == EEXIST) return isNew_;
    isOnly_ = renameat(folder, name.c_str(), folder, second_.c_str()) == 0;
    return isOnly_;
}

void SecondName::takeBack() const {
    if (isNew_) unlinkat(folder_, second_.c_str(), 0);
    if (isOnly_) renameat(folder_, second_.c_str(), folder_, first_.c_str());
}

}  // namespace Quorle
