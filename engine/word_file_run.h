#pragma once
// Words in strictly ascending order, kept in a quarter of the memory that the words would take.
//
// Each word is written as what differs from the word before it: a byte that holds the number of
// letters they share (high half) and the number of new letters less one (low half), and the new
// letters. Blocks begin anew.
#include <array>
#include <memory>
#include <vector>

#include "packed_word.h"

class WordRun {
  public:
    /// The words one after another. The run stays the caller's, and as it is.
    class Cursor {
      public:
        Cursor() = default;
        explicit Cursor(const WordRun& run) : run_(&run) {}

        /// Goes to the next word, at first to the first; false at the end.
        bool next() {
            if (at_ == end_ && !nextBlock()) return false;
            const auto head = static_cast<std::size_t>(*at_++);
            const std::size_t shared = head >> 4, fresh = (head & 15) + 1;
            const PackedWord kept = shared == 0 ? 0 : FirstLetters(word_, shared);
            word_ = kept | FirstLetters(LoadBytes(at_), fresh) >> 8 * shared;
            at_ += fresh;
            return true;
        }
        PackedWord word() const { return word_; }

      private:
        bool nextBlock();

        const WordRun* run_ = nullptr;
        std::size_t block_ = 0;  // the next one
        const std::byte* at_ = nullptr;
        const std::byte* end_ = nullptr;
        PackedWord word_ = 0;
    };

    /// Appends a word, which must be greater than the last.
    void append(PackedWord word);

    PackedWord last() const { return last_; }  // 0 when empty
    std::size_t size() const { return size_; }

    int level = 0;  // how often its words have been merged

  private:
    static constexpr std::size_t BlockSize = std::size_t{32} << 10;
    static constexpr std::size_t Room = 1 + 2 * MaxPackedLetters;  // written or read ahead
    struct Block {
        std::unique_ptr<std::byte[]> bytes;
        std::size_t used;
    };

    std::vector<Block> blocks_;
    PackedWord last_ = 0;
    std::size_t size_ = 0;
};
