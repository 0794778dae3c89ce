#pragma once
// A set of word indexes: a bit for each word of the dictionary.
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <memory>
#include <new>

class RankSet {
  public:
    /// Makes room for indexes below `count`. The set must be empty.
    void resize(std::size_t count) {
        if (count <= count_) return;
        // Memory that the system hands out zeroed, page by page as it is used: a small file can
        // spell a huge number of words.
        words_.reset(
            static_cast<std::uint64_t*>(std::calloc((count >> 6) + 1, sizeof(std::uint64_t))));
        count_ = words_ ? count : 0;
        if (!words_) throw std::bad_alloc();
    }

    /// 1 when the index was not held, else 0: to count by, without a branch.
    std::uint32_t insert(std::uint32_t index) {
        std::uint64_t& word = words_[index >> 6];
        const std::uint64_t before = word;
        word |= std::uint64_t{1} << (index & 63);
        return (~before >> (index & 63)) & 1;
    }

    bool contains(std::uint32_t index) const {
        return ((words_[index >> 6] >> (index & 63)) & 1) != 0;
    }

    /// Also forgets others near it: for emptying the set of all it holds.
    void clearAround(std::uint32_t index) { words_[index >> 6] = 0; }

  private:
    struct Free {
        void operator()(std::uint64_t* words) const { std::free(words); }
    };
    std::unique_ptr<std::uint64_t[], Free> words_;
    std::size_t count_ = 0;
};
