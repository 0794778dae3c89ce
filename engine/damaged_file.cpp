#include "damaged_file.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cstddef>
#include <vector>

#include "read_file.h"
#include "write_all.h"

namespace {

constexpr int MostKept = 1000;

/// A place in the file system, however its path is written.
struct Place {
    dev_t device;
    ino_t folder;
    std::string name;
    bool operator==(const Place&) const = default;
};

std::vector<Place> DamagedPlaces;

bool PlaceOf(const FileTarget& target, Place& place) {
    struct stat folder {};
    if (!target.folder || fstat(target.folder.number(), &folder) != 0) return false;
    place = {folder.st_dev, folder.st_ino, target.name};
    return true;
}

bool SameFile(int folder, const std::string& a, const std::string& b) {
    struct stat first {
    }, second{};
    return fstatat(folder, a.c_str(), &first, AT_SYMLINK_NOFOLLOW) == 0 &&
           fstatat(folder, b.c_str(), &second, AT_SYMLINK_NOFOLLOW) == 0 &&
           first.st_dev == second.st_dev && first.st_ino == second.st_ino;
}

std::string KeptName(const std::string& name, int number) {
    std::string kept = name + ".damaged";
    if (number > 1) kept.append(".").append(std::to_string(number));
    return kept;
}

bool HasNoLinks(int error) {
    return error == EPERM || error == EOPNOTSUPP || error == ENOSYS || error == EMLINK;
}

/// A copy under the name `copy`. One that a kill cut short is a beginning of the file, so nothing
/// is lost when it is written anew.
enum class CopyResult { Done, NameTaken, Failed };
CopyResult Copy(const FileTarget& target, const std::string& copy, KeptFile& kept) {
    const int folder = target.folder.number();
    std::vector<std::byte> content, earlier;
    if (ReadFileAt(folder, target.name.c_str(), content) != ReadResult::Done) {
        return CopyResult::Failed;
    }
    const ReadResult standing = ReadFileAt(folder, copy.c_str(), earlier);
    if (standing == ReadResult::Failed) return CopyResult::NameTaken;
    if (standing == ReadResult::Done) {
        if (earlier == content) return CopyResult::Done;
        if (earlier.size() > content.size() ||
            !std::equal(earlier.begin(), earlier.end(), content.begin())) {
            return CopyResult::NameTaken;
        }
        unlinkat(folder, copy.c_str(), 0);
    }
    FileDescriptor file(RepeatInterrupted([&] {
        return openat(folder, copy.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_NOFOLLOW | O_CLOEXEC,
                      0600);
    }));
    if (!file) return CopyResult::Failed;
    kept.hold(folder, copy);
    return WriteAll(file.number(), content) && SyncFile(file.number()) && file.close()
               ? CopyResult::Done
               : CopyResult::Failed;
}

}  // namespace

void RememberDamaged(const char* path) {
    const FileTarget target = FindTarget(path);
    Place place;
    if (!PlaceOf(target, place)) return;
    struct stat standing {};
    if (fstatat(target.folder.number(), target.name.c_str(), &standing, 0) != 0) return;
    if (std::ranges::find(DamagedPlaces, place) == DamagedPlaces.end()) {
        DamagedPlaces.push_back(place);
    }
}

void ForgetDamaged(const FileTarget& target) {
    Place place;
    if (!DamagedPlaces.empty() && PlaceOf(target, place)) std::erase(DamagedPlaces, place);
}

void ForgetDamaged(const char* path) {
    if (!DamagedPlaces.empty()) ForgetDamaged(FindTarget(path));
}

KeptFile::~KeptFile() {
    if (!name_.empty()) unlinkat(folder_, name_.c_str(), 0);
}

void KeptFile::hold(int folder, const std::string& name) {
    folder_ = folder;
    name_ = name;
}

bool KeepIfDamaged(const FileTarget& target, KeptFile& kept) {
    if (DamagedPlaces.empty()) return true;
    Place place;
    if (!PlaceOf(target, place)) return false;
    if (std::ranges::find(DamagedPlaces, place) == DamagedPlaces.end()) return true;
    const int folder = target.folder.number();
    for (int number = 1; number <= MostKept; ++number) {
        const std::string name = KeptName(target.name, number);
        if (linkat(folder, target.name.c_str(), folder, name.c_str(), 0) == 0) {
            kept.hold(folder, name);
            return true;
        }
        if (HasNoLinks(errno)) {
            const CopyResult result = Copy(target, name, kept);
            if (result != CopyResult::NameTaken) return result == CopyResult::Done;
        } else if (errno != EEXIST) {
            return false;
        } else if (SameFile(folder, target.name, name)) {
            return true;  // kept by a save that was killed before it was through
        }
    }
    return false;
}
