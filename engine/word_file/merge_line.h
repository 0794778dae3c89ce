#pragma once
// Merging word files into the dictionary, one after the other, a step at a time. A file's words are
// read block by block and sorted; then the dictionary that holds them too is built beside the one
// in use, and takes its place.
#include <memory>
#include <optional>
#include <queue>
#include <string>
#include <vector>

#include "files/read_file.h"
#include "graph/dictionary.h"
#include "graph/graph_builder.h"
#include "graph/word_cursor.h"
#include "word_file/sorted_words.h"

namespace Quorle {

/// The merge of one file.
class FileMerge {
  public:
    /// The file is read as long as it is now: one that grows has an end, too.
    FileMerge(Dictionary& dictionary, const char* path);

    /// Does a piece of the work, well under a millisecond; false when there is no more, as when
    /// there is no regular file that can be read. What is added and removed meanwhile is kept.
    /// Throws std::bad_alloc; the dictionary is as it was.
    bool work();
    /// The part that is done, 0..1.
    double fraction() const;

  private:
    /// What the merged dictionary is made of.
    struct Build {
        Build(const Dictionary& dictionary, SortedWords& words);

        const WordGraph base;
        const std::int32_t longest;
        WordCursor cursor;
        GraphBuilder builder;
        PackedWord held;   // the next word of the base
        PackedWord fresh;  // the next one of the file
        std::size_t added = 0;
        std::optional<WordGraph> merged;  // once all words are in
    };

    bool readOn();
    void takeWords();
    bool addWords();
    bool beginAnew();

    Dictionary& dictionary_;
    std::size_t size_ = 0;
    FileDescriptor file_;
    std::size_t left_;
    std::vector<std::byte> text_;  // what is left of the block before, the block, and room
    std::size_t used_ = 0;
    SortedWords words_;
    std::unique_ptr<Build> build_;  // once all of the file is read
    int attempts_ = 0;
};

/// The files asked for since nothing was stepping.
class MergeLine {
  public:
    explicit MergeLine(Dictionary& dictionary) : dictionary_(dictionary) {}

    /// Does a step of at most about 8 ms and returns the percentage done: 0..99, never falling,
    /// then 100. `path` starts a merge, or joins the line behind the one that steps; "dummy" and
    /// null only step. With nothing stepping these, and what cannot be read, are 100 at once.
    std::int32_t step(const char* path);

  private:
    bool work();

    Dictionary& dictionary_;
    std::optional<FileMerge> current_;
    std::queue<std::string> waiting_;
    int done_ = 0;  // files, since nothing was stepping
    std::int32_t percent_ = 0;
};

}  // namespace Quorle
