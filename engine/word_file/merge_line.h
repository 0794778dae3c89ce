#pragma once
// Merging word files into the dictionary, one after the other, a step at a time.
#include <optional>
#include <queue>
#include <string>

#include "word_file/file_merge.h"

namespace Quorle {

class MergeLine {
  public:
    explicit MergeLine(Dictionary& dictionary) : dictionary_(dictionary) {}

    /// Does a step of at most about 8 ms and returns the percentage done: 0..99, never falling,
    /// then 100. `path` starts a merge, or joins the line behind the one that steps; "dummy" and
    /// null only step. With nothing stepping these, and what cannot be read, are 100 at once.
    std::int32_t step(const char* path);

  private:
    bool work();
    bool hasCurrent();

    Dictionary& dictionary_;
    std::optional<FileMerge> current_;
    std::queue<std::string> waiting_;
    int done_ = 0;  // files, since nothing was stepping
    std::int32_t percent_ = 0;
};

}  // namespace Quorle
