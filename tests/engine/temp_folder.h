#pragma once
// A test's own folder: files as texts, gone at the end.
#include <stdlib.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <set>
#include <string>

class TempFolder {
  public:
    TempFolder() { mkdtemp(path_.data()); }
    TempFolder(const TempFolder&) = delete;
    TempFolder& operator=(const TempFolder&) = delete;
    ~TempFolder() { std::filesystem::remove_all(path_); }

    std::string operator/(const std::string& name) const { return path_ + "/" + name; }
    const std::string& path() const { return path_; }

    /// Returns the file's path.
    std::string write(const std::string& name, const std::string& text) const {
        const std::filesystem::path path = path_ + "/" + name;
        std::filesystem::create_directories(path.parent_path());
        std::filesystem::remove(path);  // writing it over would wait for the disk
        std::ofstream(path, std::ios::binary) << text;
        return path;
    }
    std::string read(const std::string& name) const {
        std::ifstream file(path_ + "/" + name, std::ios::binary);
        return {std::istreambuf_iterator<char>(file), {}};
    }
    std::set<std::string> names() const {
        std::set<std::string> all;
        for (const auto& entry : std::filesystem::directory_iterator(path_)) {
            all.insert(entry.path().filename());
        }
        return all;
    }

  private:
    std::string path_ = std::filesystem::temp_directory_path() / "quorle_XXXXXX";
};
