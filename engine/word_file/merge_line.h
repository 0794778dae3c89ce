#pragma once
// Merging word files into the dictionary, a step at a time.
#include <deque>
#include <memory>
#include <string>

#include "graph/dictionary.h"

namespace Quorle {

struct FileMerge;

/// The files asked for since nothing was stepping.
class MergeLine {
  public:
    explicit MergeLine(Dictionary& dictionary);
    ~MergeLine();

    /// Does a step of at most about 8 ms and returns the percentage done: 0..99, never falling,
    /// then 100. `path` starts a merge, or joins the line behind the one that steps; "dummy" and
    /// null only step. With nothing stepping these, and what cannot be read, are 100 at once.
    std::int32_t step(const char* path);

  private:
    bool beginNext();
    void endCurrent();
    bool work();
    std::int32_t percent();

    Dictionary& dictionary_;
    std::unique_ptr<FileMerge> current_;
    std::deque<std::string> waiting_;
    int done_ = 0;
    std::int32_t percent_ = 0;
};

}  // namespace Quorle
