#pragma once
// Reading a word file block by block.
#include "file_descriptor.h"
#include "word_file_runs.h"
#include "word_file_tokens.h"

class WordFileReader {
  public:
    /// Begins with the file at `path`, as long as it is now: a file that grows has an end, too.
    /// False when it is no regular file that can be read.
    bool open(const char* path);

    /// Does a piece of the work, about a millisecond; `Done` when all words are in `words`,
    /// `Failed` when the file cannot be read on.
    enum class Progress { Reading, Done, Failed };
    Progress readOn();

    /// The part of the file that has been read, 0..1.
    double fraction() const;

    const WordRuns& words() const { return words_; }

  private:
    Progress finish();

    FileDescriptor file_;
    std::size_t size_ = 0;
    std::size_t left_ = 0;
    std::vector<std::byte> block_;
    WordTokens tokens_;
    WordRuns words_;
};
