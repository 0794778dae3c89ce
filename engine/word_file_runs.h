#pragma once
// Sorting the words of a file in small pieces of work. Words in ascending order, as most word
// files have them, are only kept; others are sorted a chunk at a time, and the runs that come of it
// are merged as they are read.
#include <span>
#include <vector>

#include "word_file_run.h"

/// The words of many runs in strictly ascending order. The runs stay the caller's.
class RunMerger {
  public:
    RunMerger() = default;
    explicit RunMerger(std::span<const WordRun> runs);

    /// The next word; false at the end.
    bool next(PackedWord& word);

  private:
    void sink(std::size_t place);

    std::vector<WordRun::Cursor> heads_;  // a heap, the smallest word first
    PackedWord last_ = 0;
};

class WordRuns {
  public:
    void add(PackedWord word) {
        if (word <= last_) {
            if (word == last_) return;
            ascending_ = false;
        }
        last_ = word;
        chunk_.push_back(word);
        if (chunk_.size() == ChunkSize) finish();
    }

    /// Takes in what was added last.
    void finish();

    /// Whether so many runs have come up that some are to be merged before more words are added.
    bool crowded() const;

    /// Does a piece of that work, well under a millisecond.
    void relieve();

    std::span<const WordRun> runs() const { return runs_; }
    std::size_t size() const;  // of all runs together: not fewer than the words

  private:
    static constexpr std::size_t ChunkSize = 4096;
    static constexpr std::size_t MaxRuns = 64;  // of one level

    void replaceMerged();

    std::vector<WordRun> runs_;  // levels never ascend
    std::vector<PackedWord> chunk_;
    PackedWord last_ = 0;
    bool ascending_ = true;

    bool merging_ = false;
    RunMerger merger_;  // of the last MaxRuns runs, into:
    WordRun merged_;
    std::vector<WordRun> spent_;  // merged, and given back one by one: that, too, takes its time
};
