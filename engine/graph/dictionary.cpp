#include "graph/dictionary.h"

#include <utility>

#include "graph/bit_count.h"

namespace Quorle {

namespace {

std::uint32_t LetterOf(char character) {
    return static_cast<std::uint32_t>(character) - 'a';
}

}  // namespace

void Dictionary::replace(WordGraph words) noexcept {
    words_ = std::move(words);
    for (char first = 'a'; first <= 'z'; ++first) {
        for (char second = 'a'; second <= 'z'; ++second) {
            const char both[] = {first, second};
            renew({both, 2});
        }
    }
}

bool Dictionary::set(std::string_view word, bool isHeld) {
    const bool changed = words_.set(word, isHeld);
    if (changed) renew(word.substr(0, 2));
    return changed;
}

// An edit changes where the edges on its path lead, and no others'.
void Dictionary::renew(std::string_view beginning) {
    beginnings_[LetterOf(beginning[0]) * Letters + LetterOf(beginning[1])] = words_.find(beginning);
}

std::uint32_t Dictionary::lookUp(const char* text) const {
    return CountingBits([this, text = text] {
        const Edge* const edges = words_.edges();
        const Edge* edge = &words_.root();
        const char* at = text;
        if (LetterOf(at[0]) < Letters && LetterOf(at[1]) < Letters) {
            edge = &beginnings_[LetterOf(at[0]) * Letters + LetterOf(at[1])];
            at += 2;
        }
        for (; *at != 0; ++at) {
            const std::uint32_t letter = LetterOf(*at);
            if (letter >= Letters || (edge->letters >> letter & 1) == 0) return 0U;
            edge = edges + edge->at(1U << letter);
        }
        return edge->letters;
    });
}

}  // namespace Quorle
