#pragma once
// The dictionary in use: its words, the limits on their size, and a short way to a word.
#include <array>
#include <utility>

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
    void replace(WordGraph words) {
        words_ = std::move(words);
        for (std::uint32_t i = 0; i < beginnings_.size(); ++i) {
            const Edge& first = Follow(words_.edges(), words_.root(), 1U << i / Letters);
            beginnings_[i] = Follow(words_.edges(), first, 1U << i % Letters);
        }
    }
    /// Adds a word of 2 to 16 letters, or removes it; false when it is held, or not, already.
    /// Throws std::bad_alloc and changes nothing.
    bool set(const char* word, bool isHeld) {
        if ((lookUp(word) >= WordEnds) == isHeld) return false;
        // An edit changes where the edges on its path lead, and no others'.
        beginnings_[beginningOf(word)] = words_.set(word, isHeld);
        return true;
    }

    /// Follows a text, which may hold anything: what an edge says of the letters that words go on
    /// with, and WordEnds; 0 when no word begins so.
    std::uint32_t lookUp(const char* text) const {
        return CountingBits([this, text] {
            const char* at = text;
            const Edge* const edges = words_.edges();
            const Edge* edge = &words_.root();
            if (numberOf(at[0]) < Letters && numberOf(at[1]) < Letters) {
                edge = &beginnings_[beginningOf(at)];
                at += 2;
            }
            for (; *at != 0; ++at) {
                const std::uint32_t letter = numberOf(*at);
                if (letter >= Letters || (edge->letters >> letter & 1) == 0) return 0U;
                edge = edges + edge->at(1U << letter);
            }
            return edge->letters;
        });
    }

  private:
    static std::uint32_t numberOf(char letter) { return static_cast<std::uint32_t>(letter - 'a'); }
    static std::uint32_t beginningOf(const char* word) {
        return numberOf(word[0]) * Letters + numberOf(word[1]);
    }

    WordGraph words_;
    // Where all beginnings of two letters lead: two steps less. Words before are not kept up.
    std::array<Edge, std::size_t{Letters} * Letters> beginnings_{};
};

}  // namespace Quorle
