#include "files/replace_file.h"

#include <fcntl.h>
#include <strings.h>
#include <sys/stat.h>

#include <cstdio>

#include "files/second_name.h"

namespace Quorle {

namespace {

// One fixed name a folder: however many saves are killed, one file is left at most, and the next
// save removes it. Not made from the target's name, which may be as long as names can be.
constexpr const char* TemporaryName = ".quorle-save";

/// Writes all of `content`, whatever is cut short; false when the system would not.
bool WriteAll(int file, std::span<const std::byte> content) {
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
bool SyncFile(int file) {
    return RepeatInterrupted([&] { return fsync(file); }) == 0;
}

/// The temporary file of a save; removed unless it has taken the target's name.
class TemporaryFile {
  public:
    TemporaryFile(int folder, mode_t mode) : folder_(folder) {
        unlinkat(folder, TemporaryName, 0);  // what a killed save has left
        file_ = FileDescriptor(RepeatInterrupted([&] {
            return openat(folder, TemporaryName,
                          O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC, mode);
        }));
        present_ = static_cast<bool>(file_);
    }
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;
    ~TemporaryFile() {
        if (present_) unlinkat(folder_, TemporaryName, 0);
    }

    explicit operator bool() const { return present_; }
    bool takeOver(const struct stat& old);
    bool complete(std::span<const std::byte> content);
    bool rename(const std::string& name);

  private:
    int folder_;
    FileDescriptor file_;
    bool present_ = false;
    struct stat own_ = {};
};

/// Gives the file the old one's owner, group and mode; false when the mode cannot be kept.
bool TemporaryFile::takeOver(const struct stat& old) {
    const int file = file_.number();
    // Only the administrator may give a file away; its group may be within the player's reach.
    const auto sameOwner = static_cast<uid_t>(-1);
    if (fchown(file, old.st_uid, old.st_gid) != 0) {
        [[maybe_unused]] const int grouped = fchown(file, sameOwner, old.st_gid);
    }
    struct stat now;
    if (fstat(file, &now) != 0) return false;
    const mode_t mode = old.st_mode & mode_t{07777};
    return (now.st_mode & mode_t{07777}) == mode || fchmod(file, mode) == 0;
}

bool TemporaryFile::complete(std::span<const std::byte> content) {
    return WriteAll(file_.number(), content) && SyncFile(file_.number()) &&
           fstat(file_.number(), &own_) == 0 && file_.close();
}

bool TemporaryFile::rename(const std::string& name) {
    // Where the file system knows no locks another save may have taken the name meanwhile.
    struct stat named;
    if (fstatat(folder_, TemporaryName, &named, AT_SYMLINK_NOFOLLOW) != 0) return false;
    if (named.st_dev != own_.st_dev || named.st_ino != own_.st_ino) return false;
    if (renameat(folder_, TemporaryName, folder_, name.c_str()) != 0) return false;
    present_ = false;
    return true;
}

bool SyncFolder(int folder) {
    // Some file systems sync no folders and say so.
    return SyncFile(folder) || errno == EINVAL;
}

}  // namespace

bool ReplaceFile(const FileTarget& target, std::span<const std::byte> content, Old old) {
    const int folder = target.folder.number();
    const char* const name = target.name.c_str();
    if (strcasecmp(name, TemporaryName) == 0) return false;
    struct stat standing;
    const bool exists = fstatat(folder, name, &standing, AT_SYMLINK_NOFOLLOW) == 0;
    if (exists ? !S_ISREG(standing.st_mode) : errno != ENOENT) return false;

    TemporaryFile temporary(folder, exists ? 0600 : 0666);
    if (!temporary || (exists && !temporary.takeOver(standing))) return false;
    if (!temporary.complete(content)) return false;
    SecondName second;
    if (exists && old == Old::Stays && !second.give(folder, target.name, standing)) return false;
    if (!temporary.rename(target.name)) {
        second.takeBack();
        return false;
    }
    return SyncFolder(folder);
}

bool ReplaceFile(const char* path, std::span<const std::byte> content, Old old) {
    const FileTarget target = FindTarget(path);
    return target.folder && LockFolder(target) && ReplaceFile(target, content, old);
}

}  // namespace Quorle
