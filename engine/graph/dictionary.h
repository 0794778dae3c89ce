#pragma once
// The dictionary in use: its words, the limits on their size, and a short way to a word.
#include <array>

#include "graph/word_graph.h"

namespace Quorle {

/// Of words that count on a board; the longest is also the longest that is taken in.
struct WordLimits {
    std::int32_t shortest = 3;
    std::int32_t longest = 16;
};

class Dictionary {
  public:
    WordLimits limits;

    const WordGraph& words() const { return words_; }
    void replace(WordGraph words) noexcept;
    /// As of WordGraph; words of 2 letters and more.
    bool set(std::string_view word, bool isHeld);

    /// Follows a text, which may hold anything: what an edge says of the letters that words go on
    /// with, and WordEnds; 0 when no word begins so.
    std::uint32_t lookUp(const char* text) const;

  private:
    void renew(std::string_view beginning);

    WordGraph words_;
    // The edges of all beginnings of two letters: two steps less.
    std::array<Edge, Letters * Letters> beginnings_{};
};

}  // namespace Quorle
