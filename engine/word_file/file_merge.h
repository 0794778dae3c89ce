#pragma once
// Merging one word file: its words are read block by block and sorted; then the dictionary that
// holds them too is built beside the one in use, and takes its place.
#include <memory>
#include <vector>

#include "files/read_file.h"
#include "graph/dictionary.h"
#include "graph/graph_builder.h"
#include "graph/word_cursor.h"
#include "word_file/sorted_words.h"

namespace Quorle {

class FileMerge {
  public:
    /// The file is read as long as it is now: one that grows has an end, too.
    FileMerge(Dictionary& dictionary, const char* path);
    /// False when there is no regular file that can be read, and nothing to do.
    explicit operator bool() const { return static_cast<bool>(file_); }

    /// Does a piece of the work, well under a millisecond; false when there is no more. What is
    /// added and removed meanwhile is kept. Throws std::bad_alloc; the dictionary is as it was.
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
    bool isIn_ = false;
    int attempts_ = 0;
};

}  // namespace Quorle
