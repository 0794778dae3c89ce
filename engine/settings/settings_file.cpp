#include "settings/settings_file.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cstdlib>
#include <span>
#include <vector>

#include "files/read_file.h"
#include "files/replace_file.h"

namespace Quorle {

// A line is: key, tab, name, tab, value. None of the three can hold a control character, so no
// two settings are ever confused. Any other line is nobody's and stays as it is.

namespace {

constexpr std::size_t MaxTextSize = 255;

bool IsText(std::string_view text) {
    return text.size() <= MaxTextSize && std::ranges::none_of(text, [](char c) {
               return static_cast<unsigned char>(c) < 0x20 || c == 0x7f;
           });
}

bool IsName(std::string_view text) {
    return !text.empty() && IsText(text);
}

std::string LineStart(std::string_view key, std::string_view name) {
    return std::string(key).append("\t").append(name).append("\t");
}

/// Takes the next line, its end left out, from the front of `text`.
std::string_view NextLine(std::string_view& text) {
    const std::string_view line = text.substr(0, text.find('\n'));
    text.remove_prefix(std::min(line.size() + 1, text.size()));
    return line;
}

bool IsSetting(std::string_view line, std::string_view start) {
    return line.starts_with(start) && IsText(line.substr(start.size()));
}

std::string WithSetting(std::string_view text, std::string_view start, std::string_view value) {
    std::string changed;
    bool written = false;
    const auto write = [&] {
        if (!written) changed.append(start).append(value).append("\n");
        written = true;
    };
    while (!text.empty()) {
        const std::string_view line = NextLine(text);
        if (IsSetting(line, start)) {
            write();
        } else {
            changed.append(line).append("\n");
        }
    }
    write();
    return changed;
}

/// The settings' folder without a slash at its end; empty when the player has no home.
std::string SettingsFolder() {
    const char* configuration = std::getenv("XDG_CONFIG_HOME");
    if (configuration != nullptr && *configuration == '/') {
        return std::string(configuration) + "/quorle";
    }
    const char* home = std::getenv("HOME");
    if (home == nullptr || *home == '\0') return {};
    return std::string(home) + "/.config/quorle";
}

/// Makes what is missing of the folder's path. What cannot be made shows when the file is opened.
void MakeFolders(const std::string& folder) {
    for (std::size_t end = folder.find('/', 1); end != std::string::npos;
         end = folder.find('/', end + 1)) {
        mkdir(folder.substr(0, end).c_str(), 0700);
    }
    mkdir(folder.c_str(), 0700);
}

std::string_view AsText(const std::vector<std::byte>& content) {
    return {reinterpret_cast<const char*>(content.data()), content.size()};
}

}  // namespace

bool GetSetting(std::string_view key, std::string_view name, std::string& value) {
    const std::string folder = SettingsFolder();
    std::vector<std::byte> content;
    if (folder.empty() || !IsName(key) || !IsName(name)) return false;
    const std::string path = folder + "/settings";
    if (ReadFileAt(AT_FDCWD, path.c_str(), content) != ReadResult::Done) return false;
    const std::string start = LineStart(key, name);
    std::string_view text = AsText(content);
    while (!text.empty()) {
        const std::string_view line = NextLine(text);
        if (!IsSetting(line, start)) continue;
        value = line.substr(start.size());
        return true;
    }
    return false;
}

bool SetSetting(std::string_view key, std::string_view name, std::string_view value) {
    const std::string folder = SettingsFolder();
    if (folder.empty() || !IsName(key) || !IsName(name) || !IsText(value)) return false;
    MakeFolders(folder);
    const FileTarget target = FindTarget((folder + "/settings").c_str());
    if (!target.folder || !LockFolder(target)) return false;
    std::vector<std::byte> content;
    const int where = target.folder.number();
    if (ReadFileAt(where, target.name.c_str(), content) == ReadResult::Failed) return false;
    const std::string changed = WithSetting(AsText(content), LineStart(key, name), value);
    return ReplaceFile(target, std::as_bytes(std::span(changed)));
}

}  // namespace Quorle
