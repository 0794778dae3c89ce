#include "files/replace_file.h"

#include <strings.h>
#include <sys/file.h>
#include <sys/stat.h>

#include <chrono>
#include <filesystem>
#include <thread>

namespace Quorle {

namespace {

// One fixed name a folder: however many saves are killed, one file is left at most, and the next
// save removes it. Not made from the target's name, which may be as long as names can be.
constexpr const char* TemporaryName = ".quorle-save";
constexpr int MaxLinks = 40;
constexpr int LockTries = 500;
constexpr std::chrono::milliseconds LockPause{2};

bool KnowsNoLocks(int error) {
    // EBADF: network file systems lock only what is open for writing, as no folder can be.
    return error == ENOLCK || error == EOPNOTSUPP || error == ENOSYS || error == EINVAL ||
           error == EBADF;
}

bool Lock(int folder) {
    for (int tries = 0; tries < LockTries; ++tries) {
        if (flock(folder, LOCK_EX | LOCK_NB) == 0) return true;
        if (errno != EWOULDBLOCK && errno != EINTR) return KnowsNoLocks(errno);
        std::this_thread::sleep_for(LockPause);
    }
    return false;
}

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
bool Sync(int file) {
    return RepeatInterrupted([&] { return fsync(file); }) == 0;
}

bool IsSame(const struct stat& one, const struct stat& other) {
    return one.st_dev == other.st_dev && one.st_ino == other.st_ino;
}

/// A save under way. What it has put into the folder goes again, unless it takes the target's
/// place.
class Replacement {
  public:
    Replacement(int folder, const std::string& name, FileDescriptor temporary)
        : folder_(folder), name_(name), file_(std::move(temporary)) {}
    ~Replacement() {
        if (isDone_) return;
        unlinkat(folder_, TemporaryName, 0);
        // Two names of one file both stay when one is to become the other.
        if (second_.empty() || !move(second_, name_)) return;
        unlinkat(folder_, second_.c_str(), 0);
    }

    /// Gives the file the old one's owner, group and mode; false when the mode cannot be kept.
    bool takeOver(const struct stat& old) {
        const int file = file_.number();
        // Only the administrator may give a file away; its group may be within the player's reach.
        [[maybe_unused]] const bool isOwned = fchown(file, old.st_uid, old.st_gid) == 0 ||
                                              fchown(file, static_cast<uid_t>(-1), old.st_gid) == 0;
        struct stat now;
        if (fstat(file, &now) != 0) return false;
        const mode_t mode = old.st_mode & mode_t{07777};
        return (now.st_mode & mode_t{07777}) == mode || fchmod(file, mode) == 0;
    }

    bool complete(std::span<const std::byte> content) {
        return WriteAll(file_.number(), content) && Sync(file_.number()) &&
               fstat(file_.number(), &own_) == 0 && file_.close();
    }

    // A dictionary file that could not be read may hold years of words that can still be rescued.
    // Where the file system knows no links the file moves: its content stands under the second name
    // until the new one takes the first. Whether a name is free has to be asked before, for moving
    // would replace what stands there; the folder's lock keeps other savers out meanwhile.
    bool giveSecondName(const struct stat& old) {
        std::string second = name_ + ".damaged";
        struct stat other;
        for (int number = 2; fstatat(folder_, second.c_str(), &other, AT_SYMLINK_NOFOLLOW) == 0;) {
            if (IsSame(old, other)) return true;  // by a save that was killed
            second = name_ + ".damaged." + std::to_string(number++);
        }
        if (errno != ENOENT) return false;
        const bool isLinked = linkat(folder_, name_.c_str(), folder_, second.c_str(), 0) == 0;
        if (!isLinked && (errno == EEXIST || !move(name_, second))) return false;
        second_ = std::move(second);
        return true;
    }

    bool takePlace() {
        // Where the file system knows no locks another save may have taken the name meanwhile.
        struct stat named;
        isDone_ = fstatat(folder_, TemporaryName, &named, AT_SYMLINK_NOFOLLOW) == 0 &&
                  IsSame(named, own_) && move(TemporaryName, name_);
        return isDone_;
    }

  private:
    bool move(const std::string& from, const std::string& to) const {
        return renameat(folder_, from.c_str(), folder_, to.c_str()) == 0;
    }

    int folder_;
    const std::string& name_;
    FileDescriptor file_;
    struct stat own_ = {};
    std::string second_;  // of the old file, if it is new
    bool isDone_ = false;
};

}  // namespace

FileTarget LockTarget(const char* path) {
    std::filesystem::path place = path;
    std::error_code error;
    for (int links = 0; links < MaxLinks; ++links) {
        const std::filesystem::path link = std::filesystem::read_symlink(place, error);
        if (error) break;
        place = place.parent_path() / link;
    }
    const std::filesystem::path folder = place.has_parent_path() ? place.parent_path() : ".";
    FileTarget target{OpenAt(AT_FDCWD, folder.c_str(), O_RDONLY | O_DIRECTORY), place.filename()};
    if (!target.folder || !Lock(target.folder.number())) return {};
    return target;
}

bool ReplaceFile(const FileTarget& target, std::span<const std::byte> content, Old old) {
    const int folder = target.folder.number();
    const char* const name = target.name.c_str();
    if (!target.folder || *name == 0 || strcasecmp(name, TemporaryName) == 0) return false;
    struct stat standing;
    const bool exists = fstatat(folder, name, &standing, AT_SYMLINK_NOFOLLOW) == 0;
    if (exists ? !S_ISREG(standing.st_mode) : errno != ENOENT) return false;

    unlinkat(folder, TemporaryName, 0);  // what a killed save has left
    FileDescriptor temporary = OpenAt(
        folder, TemporaryName, O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW, exists ? 0600 : 0666);
    if (!temporary) return false;
    Replacement replacement(folder, target.name, std::move(temporary));
    if ((exists && !replacement.takeOver(standing)) || !replacement.complete(content)) return false;
    if (exists && old == Old::Stays && !replacement.giveSecondName(standing)) return false;
    // Some file systems sync no folders and say so.
    return replacement.takePlace() && (Sync(folder) || errno == EINVAL);
}

}  // namespace Quorle
