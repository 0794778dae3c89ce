#pragma once
// Merging word files into the dictionary, a step at a time.
#include <deque>
#include <memory>
#include <string>

#include "word_file/merged_dictionary.h"
#include "word_file/word_file_reader.h"

namespace Quorle {

/// The files asked for since nothing was stepping.
class MergeLine {
  public:
    explicit MergeLine(Dictionary& dictionary) : dictionary_(dictionary) {}

    /// Does a step of at most about 8 ms and returns the percentage done: 0..99, never falling,
    /// then 100. `path` starts a merge, or joins the line behind the one that steps; "dummy" and
    /// null only step. With nothing stepping these, and what cannot be read, are 100 at once.
    std::int32_t step(const char* path);

  private:
    bool beginNext();
    void endCurrent();
    bool work();
    void workOnce();
    void beginAnew();
    double fraction() const;
    std::int32_t percent();

    Dictionary& dictionary_;
    std::unique_ptr<WordFileReader> current_;
    std::unique_ptr<MergedDictionary> build_;  // once all of the current file is read
    std::deque<std::string> waiting_;
    int outdated_ = 0;  // how often the current one had to begin anew
    int done_ = 0;
    std::int32_t percent_ = 0;
};

}  // namespace Quorle
