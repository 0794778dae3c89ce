#include "word_file/merged_dictionary.h"

#include <algorithm>

namespace Quorle {

namespace {

constexpr std::size_t WordsAtOnce = 1024;
constexpr PackedWord AtEnd = ~PackedWord{0};

// Someone who changes the dictionary at every step must not keep the merge from ending: the last
// attempt is made at one go.
constexpr int MaxAttempts = 8;

}  // namespace

MergedDictionary::MergedDictionary(Dictionary& dictionary, const SortedWords& words)
    : dictionary_(dictionary), file_(words) {
    begin();
}

void MergedDictionary::begin() {
    ++begun_;
    added_ = 0;
    base_ = dictionary_.words();
    longest_ = static_cast<std::size_t>(dictionary_.limits.longest);
    builder_ = std::make_unique<GraphBuilder>(base_.edgesEnd() + file_.size());
    cursor_ = WordCursor(base_);
    reader_ = SortedWordsReader(file_);
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
        builder_->add(word);
        if (held_ == word) nextHeld();
        if (fresh_ == word) nextFresh();
    }
    return true;
}

bool MergedDictionary::work() {
    if (!isUpToDate()) begin();
    do {
        if (addWords()) continue;
        dictionary_.replace(builder_->finish());
        return true;
    } while (begun_ >= MaxAttempts);
    return false;
}

double MergedDictionary::fraction() const {
    const auto words = static_cast<double>(base_.size() + file_.size());
    return words == 0 ? 1 : std::min(1.0, static_cast<double>(added_) / words);
}

}  // namespace Quorle
