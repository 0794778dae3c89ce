#pragma once
// Reading a word file block by block.
#include <utility>
#include <vector>

#include "files/read_file.h"
#include "word_file/sorted_words.h"

namespace Quorle {

class WordFileReader {
  public:
    /// Begins with the file at `path`, as long as it is now: a file that grows has an end, too.
    /// False when it is no regular file that can be read.
    bool open(const char* path);

    /// Does a piece of the work, well under a millisecond; `Done` when all words are in `words`,
    /// `Failed` when the file cannot be read on.
    enum class Progress { Reading, Done, Failed };
    Progress readOn();

    /// The part of the file that has been read, 0..1.
    double fraction() const;

    /// The words of the file, once; and reading it anew.
    SortedWords takeWords() { return std::exchange(words_, {}); }
    void rewind();

  private:
    void readWords();

    FileDescriptor file_;
    std::size_t size_ = 0;
    std::size_t left_ = 0;
    std::vector<std::byte> text_;  // what is left of the block before, the block, and room
    std::size_t used_ = 0;
    SortedWords words_;
};

}  // namespace Quorle
