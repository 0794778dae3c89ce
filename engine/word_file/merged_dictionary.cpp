#include "word_file/merged_dictionary.h"

#include <algorithm>
#include <utility>

namespace Quorle {

namespace {

constexpr std::size_t WordsAtOnce = 1024;
constexpr PackedWord AtEnd = ~PackedWord{0};

}  // namespace

MergedDictionary::MergedDictionary(Dictionary& dictionary, SortedWords words)
    : dictionary_(dictionary),
      base_(dictionary.words()),
      longest_(static_cast<std::size_t>(dictionary.limits.longest)),
      fileSize_(words.size()),
      builder_(base_.edgesEnd() + fileSize_),
      cursor_(base_),
      reader_(std::move(words)) {
    nextHeld();
    nextFresh();
}

bool MergedDictionary::isUpToDate() const {
    return dictionary_.words() == base_ &&
           longest_ == static_cast<std::size_t>(dictionary_.limits.longest);
}

void MergedDictionary::nextHeld() {
    if (!cursor_.next(held_)) held_ = AtEnd;
}

void MergedDictionary::nextFresh() {
    do {
        if (!reader_.next(fresh_)) fresh_ = AtEnd;
    } while (fresh_ != AtEnd && LengthOf(fresh_) > longest_);
}

/// False when all words are in.
bool MergedDictionary::addWords() {
    for (std::size_t i = 0; i < WordsAtOnce; ++i, ++added_) {
        const PackedWord word = std::min(held_, fresh_);
        if (word == AtEnd) return false;
        builder_.add(word);
        if (held_ == word) nextHeld();
        if (fresh_ == word) nextFresh();
    }
    return true;
}

MergedDictionary::Progress MergedDictionary::work() {
    if (!isUpToDate()) return Progress::Outdated;
    if (addWords()) return Progress::Working;
    dictionary_.replace(builder_.finish());
    return Progress::Done;
}

double MergedDictionary::fraction() const {
    const auto words = static_cast<double>(base_.size() + fileSize_);
    return words == 0 ? 1 : std::min(1.0, static_cast<double>(added_) / words);
}

}  // namespace Quorle
