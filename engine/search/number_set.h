#pragma once
// A set of word numbers: a bit for each word of the dictionary.
#include <cassert>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <memory>
#include <new>

namespace Quorle {

class NumberSet {
  public:
    /// Makes room for numbers up to `most`. The set must be empty.
    void resize(std::size_t most) {
        if (most < size_) return;
        // Memory that the system hands out zeroed, page by page as it is used: a small file can
        // spell a huge number of words.
        words_.reset(
            static_cast<std::uint64_t*>(std::calloc((most >> 6) + 1, sizeof(std::uint64_t))));
        size_ = words_ ? most + 1 : 0;
        if (!words_) throw std::bad_alloc();
    }

    /// 1 when the number was not held, else 0: to count by, without a branch.
    std::uint32_t insert(std::uint32_t number) {
        assert(number < size_);
        std::uint64_t& word = words_[number >> 6];
        const std::uint64_t before = word;
        word |= std::uint64_t{1} << (number & 63);
        return (~before >> (number & 63)) & 1;
    }
    bool contains(std::uint32_t number) const {
        return ((words_[number >> 6] >> (number & 63)) & 1) != 0;
    }
    /// Also forgets others near it: for emptying the set of all it holds.
    void clearAround(std::uint32_t number) { words_[number >> 6] = 0; }

  private:
    struct Free {
        void operator()(std::uint64_t* words) const { std::free(words); }
    };
    std::unique_ptr<std::uint64_t[], Free> words_;
    std::size_t size_ = 0;
};

}  // namespace Quorle
