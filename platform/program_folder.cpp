#include "platform/desktop.h"

#include <quorle/word_engine.h>

#include <array>
#include <cstdlib>
#include <filesystem>
#include <system_error>

namespace fs = std::filesystem;

namespace {

constexpr const char* DictionaryName = "Dictionary.dat";
constexpr std::array HelpNames{"Quorle.htm", "Quorle.png"};

fs::path ExecutableFolder() {
    std::error_code error;
    return fs::read_symlink("/proc/self/exe", error).parent_path();
}

fs::path PlayersFolder() {
    const char* data = std::getenv("XDG_DATA_HOME");
    if (data != nullptr && data[0] == '/') return fs::path(data) / "quorle";
    const char* home = std::getenv("HOME");
    return fs::path(home == nullptr ? "/" : home) / ".local/share/quorle";
}

// Loading and saving makes a copy that is whole whatever happens meanwhile; what
// the engine holds is loaded again by start-up.
void CopyDictionary(const fs::path& from, const fs::path& to) {
    std::error_code error;
    if (fs::exists(fs::symlink_status(to, error))) return;
    if (cReadBinaryDictionary(from.c_str()) == 1) cWriteBinaryDictionary(to.c_str());
}

void LinkHelp(const fs::path& file, const fs::path& link) {
    std::error_code error;
    if (fs::is_symlink(link, error) && fs::read_symlink(link, error) != file) {
        fs::remove(link, error);
    }
    fs::create_symlink(file, link, error);
}

void Furnish(const fs::path& folder, const fs::path& shared) {
    std::error_code error;
    if (fs::create_directories(folder, error)) {
        fs::permissions(folder, fs::perms::owner_all, error);
    }
    CopyDictionary(shared / DictionaryName, folder / DictionaryName);
    for (const char* name : HelpNames) LinkHelp(shared / name, folder / name);
}

}  // namespace

std::string Platform::FindProgramFolder() {
    const fs::path own = ExecutableFolder();
    const fs::path shared = (own / "../share/quorle").lexically_normal();
    std::error_code error;
    if (!fs::is_directory(shared, error)) return own.string();
    const fs::path folder = PlayersFolder();
    Furnish(folder, shared);
    return folder.string();
}
