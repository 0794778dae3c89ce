#pragma once
// Making the dictionary that holds its words and a file's, beside the one in use.
#include "graph/dictionary.h"
#include "graph/graph_builder.h"
#include "graph/word_cursor.h"
#include "word_file/sorted_words.h"

namespace Quorle {

class MergedDictionary {
  public:
    /// The words are finished.
    MergedDictionary(Dictionary& dictionary, SortedWords words);

    /// Does a piece of the work, well under a millisecond. `Done`: the dictionary in use is the
    /// merged one; `Outdated`: that one has changed meanwhile, and all is to begin anew.
    enum class Progress { Working, Done, Outdated };
    Progress work();

    /// The part that is done, 0..1.
    double fraction() const;

  private:
    bool isUpToDate() const;
    bool addWords();
    void nextHeld();
    void nextFresh();

    Dictionary& dictionary_;
    const WordGraph base_;
    const std::size_t longest_;
    const std::size_t fileSize_;
    std::size_t added_ = 0;
    GraphBuilder builder_;
    WordCursor cursor_;
    SortedWordsReader reader_;
    PackedWord held_ = 0;   // the next word of the dictionary, AtEnd behind the last
    PackedWord fresh_ = 0;  // the next one of the file
};

}  // namespace Quorle
