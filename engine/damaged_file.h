#pragma once
// A dictionary file that could not be read may hold years of words that can still be rescued: the
// save that replaces it keeps it beside the new one as NAME.damaged (.damaged.2, .damaged.3 …).
#include <string>

#include "file_target.h"

/// Remembers that loading `path` failed, when something stands there.
void RememberDamaged(const char* path);

/// What stands at `path` is known to be whole: loaded or saved by us.
void ForgetDamaged(const char* path);
void ForgetDamaged(const FileTarget& target);

/// A damaged file kept under another name; taken away again unless the save confirms it.
class KeptFile {
  public:
    KeptFile() = default;
    KeptFile(const KeptFile&) = delete;
    KeptFile& operator=(const KeptFile&) = delete;
    ~KeptFile();

    void hold(int folder, const std::string& name);
    void confirm() { name_.clear(); }

  private:
    int folder_ = -1;
    std::string name_;
};

/// Keeps the target's present file, by a link or where there are none by a copy, when loading it
/// failed. True also when there is nothing to keep; false when keeping it failed.
bool KeepIfDamaged(const FileTarget& target, KeptFile& kept);
