#include "word_file_build.h"

#include <algorithm>

#include "current_dictionary.h"

namespace {

constexpr std::size_t WordsAtOnce = 1024;
constexpr PackedWord AtEnd = ~PackedWord{0};

// Adding a word takes as long as building with so many.
constexpr std::uint32_t BuiltWhileAdding = 32;

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
    const bool few = file_.size() < base_.size() / BuiltWhileAdding;
    const std::size_t expected = base_.size() + file_.size();
    builder_ = few ? nullptr : std::make_unique<GraphBuilder>(expected);
    copy_ = few ? base_ : WordGraph();
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

bool MergedDictionary::addToCopy() {
    for (std::size_t i = 0; i < WordsAtOnce; i += BuiltWhileAdding, ++added_) {
        if (fresh_ == AtEnd) return false;
        char letters[MaxPackedLetters];
        copy_.add({letters, Unpack(fresh_, letters)});
        nextFresh();
    }
    return true;
}

/// False when all words are in.
bool MergedDictionary::addToBuilder() {
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
        if (builder_ ? addToBuilder() : addToCopy()) continue;
        TheDictionary.words = builder_ ? builder_->finish() : std::move(copy_);
        return true;
    } while (begun_ >= MaxAttempts);
    return false;
}

double MergedDictionary::fraction() const {
    const auto words = static_cast<double>(file_.size() + (builder_ ? base_.size() : 0));
    return words == 0 ? 1 : std::min(1.0, static_cast<double>(added_) / words);
}
