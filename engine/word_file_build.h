#pragma once
// Making the dictionary that holds its words and a file's, beside the one in use.
#include "graph_builder.h"
#include "word_cursor.h"
#include "word_file_runs.h"

class MergedDictionary {
  public:
    /// The words are the caller's, and finished.
    explicit MergedDictionary(const WordRuns& words);

    /// Does a piece of the work, well under a millisecond; true once the dictionary in use is the
    /// merged one. When that one has changed meanwhile all begins anew, with what it is then.
    bool work();

    /// The part that is done, 0..1.
    double fraction() const;

  private:
    void begin();
    bool isUpToDate() const;
    bool addToBuilder();
    bool addToCopy();
    void nextHeld();
    void nextFresh();

    const WordRuns& file_;
    int begun_ = 0;
    std::size_t added_ = 0;
    WordGraph base_;
    std::int32_t maxWordSize_ = 0;
    std::unique_ptr<GraphBuilder> builder_;  // none when the file has only few words:
    WordGraph copy_;                         // they are added to this one
    WordCursor cursor_;
    RunMerger merger_;
    PackedWord held_ = 0;   // the next word of the dictionary, AtEnd behind the last
    PackedWord fresh_ = 0;  // the next one of the file
};
