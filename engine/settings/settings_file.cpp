#include "settings/settings_file.h"

#include <sys/stat.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <optional>
#include <vector>

#include "files/replace_file.h"

namespace Quorle {

// A line is: key, tab, name, tab, value. None of the three can hold a control character, so no
// two settings are ever confused. Any other line is nobody's and stays as it is.

namespace {

constexpr std::size_t MaxTextSize = 255;

bool IsText(std::string_view text) {
    const auto isControl = [](unsigned char c) { return c < 0x20 || c == 0x7f; };
    return text.size() <= MaxTextSize && std::ranges::none_of(text, isControl);
}

/// What the lines of a setting begin with; empty when it cannot be one.
std::string LineStart(std::string_view key, std::string_view name) {
    if (key.empty() || name.empty() || !IsText(key) || !IsText(name)) return {};
    return std::string(key).append("\t").append(name).append("\t");
}

/// The settings file taken apart where a setting stands, or would.
struct Parts {
    std::string before;
    std::optional<std::string> value;
    std::string after;
};

Parts TakeApart(const std::vector<std::byte>& content, std::string_view start) {
    Parts parts;
    std::string_view text(reinterpret_cast<const char*>(content.data()), content.size());
    while (!text.empty()) {
        const std::string_view line = text.substr(0, text.find('\n'));
        text.remove_prefix(std::min(line.size() + 1, text.size()));
        if (!line.starts_with(start) || !IsText(line.substr(start.size()))) {
            (parts.value ? parts.after : parts.before).append(line).append("\n");
        } else if (!parts.value) {
            parts.value = line.substr(start.size());
        }
    }
    return parts;
}

/// Empty when the player has no home.
std::filesystem::path SettingsPath() {
    const char* configuration = std::getenv("XDG_CONFIG_HOME");
    if (configuration != nullptr && *configuration == '/')
        return std::filesystem::path(configuration) / "quorle/settings";
    const char* home = std::getenv("HOME");
    if (home == nullptr || *home == '\0') return {};
    return std::filesystem::path(home) / ".config/quorle/settings";
}

}  // namespace

bool GetSetting(std::string_view key, std::string_view name, std::string& value) {
    const std::filesystem::path path = SettingsPath();
    const std::string start = LineStart(key, name);
    std::vector<std::byte> content;
    if (path.empty() || start.empty()) return false;
    if (ReadFileAt(AT_FDCWD, path.c_str(), content) != ReadResult::Done) return false;
    const Parts parts = TakeApart(content, start);
    if (parts.value) value = *parts.value;
    return parts.value.has_value();
}

bool SetSetting(std::string_view key, std::string_view name, std::string_view value) {
    const std::filesystem::path path = SettingsPath();
    const std::string start = LineStart(key, name);
    if (path.empty() || start.empty() || !IsText(value)) return false;
    // Folders are for the player alone. What cannot be made shows when the file is opened.
    std::filesystem::path made;
    for (const auto& part : path.parent_path()) mkdir((made /= part).c_str(), 0700);
    const FileTarget target = LockTarget(path.c_str());
    if (!target.folder) return false;
    std::vector<std::byte> content;
    const int folder = target.folder.number();
    if (ReadFileAt(folder, target.name.c_str(), content) == ReadResult::Failed) return false;
    Parts parts = TakeApart(content, start);
    parts.before.append(start).append(value).append("\n").append(parts.after);
    return ReplaceFile(target, std::as_bytes(std::span(parts.before)));
}

}  // namespace Quorle
