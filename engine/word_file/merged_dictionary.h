#pragma once
// Making the dictionary that holds its words and a file's, beside the one in use.
#include <memory>

#include "graph/dictionary.h"
#include "graph/graph_builder.h"
#include "graph/word_cursor.h"
#include "word_file/sorted_words.h"

namespace Quorle {

class MergedDictionary {
  public:
    /// The words are the caller's, and finished.
    MergedDictionary(Dictionary& dictionary, const SortedWords& words);

    /// Does a piece of the work, well under a millisecond; true once the dictionary in use is the
    /// merged one. When that one has changed meanwhile all begins anew, with what it is then.
    bool work();

    /// The part that is done, 0..1.
    double fraction() const;

  private:
    void begin();
    bool isUpToDate() const;
    bool addWords();
    void nextHeld();
    void nextFresh();

    Dictionary& dictionary_;
    const SortedWords& file_;
    int begun_ = 0;
    std::size_t added_ = 0;
    WordGraph base_;
    std::size_t longest_ = 0;
    std::unique_ptr<GraphBuilder> builder_;
    WordCursor cursor_;
    SortedWordsReader reader_;
    PackedWord held_ = 0;   // the next word of the dictionary, AtEnd behind the last
    PackedWord fresh_ = 0;  // the next one of the file
};

}  // namespace Quorle
