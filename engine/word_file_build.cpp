#include "word_file_build.h"

#include <algorithm>

#include "current_dictionary.h"

namespace {

constexpr std::size_t WordsAtOnce = 1024;
constexpr PackedWord AtEnd = ~PackedWord{0};

// Someone who changes the dictionary at every step must not keep the merge from ending: the last
// attempt is made at one go.
constexpr int MaxAttempts = 8;

}  // namespace

MergedDictionary::MergedDictionary(const WordRuns& words) : file_(words) {
    begin();
}

void MergedDictionary::begin() {
    ++begun_;
    added_ = 0;
    base_ = TheDictionary.words;
    maxWordSize_ = TheDictionary.maxWordSize;
    builder_ = std::make_unique<GraphBuilder>();
    cursor_ = WordCursor(base_);
    merger_ = RunMerger(file_.runs());
    nextHeld();
    nextFresh();
}

bool MergedDictionary::isUpToDate() const {
    const WordGraph& now = TheDictionary.words;
    return now.nodes() == base_.nodes() && now.root() == base_.root() &&
           TheDictionary.maxWordSize == maxWordSize_;
}

void MergedDictionary::nextHeld() {
    std::string_view word;
    held_ = cursor_.next(word) ? Pack(word) : AtEnd;
}

void MergedDictionary::nextFresh() {
    do {
        if (!merger_.next(fresh_)) fresh_ = AtEnd;
    } while (fresh_ != AtEnd && IsLonger(fresh_, static_cast<std::size_t>(maxWordSize_)));
}

/// False when all words are in.
bool MergedDictionary::addWords() {
    for (std::size_t i = 0; i < WordsAtOnce; ++i, ++added_) {
        const PackedWord word = std::min(held_, fresh_);
        if (word == AtEnd) return false;
        char letters[MaxPackedLetters];
        builder_->add({letters, Unpack(word, letters)});
        if (held_ == word) nextHeld();
        if (fresh_ == word) nextFresh();
    }
    return true;
}

bool MergedDictionary::work() {
    if (!isUpToDate()) begin();
    do {
        if (addWords()) continue;
        TheDictionary.words = builder_->finish();
        return true;
    } while (begun_ >= MaxAttempts);
    return false;
}

double MergedDictionary::fraction() const {
    const auto words = static_cast<double>(base_.size() + file_.size());
    return words == 0 ? 1 : std::min(1.0, static_cast<double>(added_) / words);
}
