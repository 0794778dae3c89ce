#include "word_file/file_merge.h"

#include <algorithm>

#include "word_file/word_text.h"

namespace Quorle {

namespace {

constexpr std::size_t BlockSize = std::size_t{16} << 10;
// Of a token that lies across blocks no more is kept: it is no word, however it goes on.
constexpr std::size_t MostKept = LongestWord + 1;
constexpr std::size_t WordsAtOnce = 256;
constexpr PackedWord AtEnd = ~PackedWord{0};
constexpr double ReadingShare = 0.4;  // of the time; the rest is building

// Someone who changes the dictionary at every step must not keep the merge from ending: the last
// attempt is made at one go.
constexpr int MostAttempts = 8;

bool HasByteOrderMark(const std::vector<std::byte>& text) {
    return text[0] == std::byte{0xEF} && text[1] == std::byte{0xBB} && text[2] == std::byte{0xBF};
}

}  // namespace

FileMerge::FileMerge(Dictionary& dictionary, const char* path)
    : dictionary_(dictionary),
      file_(OpenRegularFile(AT_FDCWD, path, size_)),
      left_(size_),
      text_(MostKept + BlockSize + LongestWord) {}

bool FileMerge::work() {
    if (!build_) return readOn();
    if (isIn_) return build_->builder.giveBack();
    if (!build_->isOf(dictionary_)) return beginAnew();
    isIn_ = !addWords();
    if (isIn_) dictionary_.replace(build_->builder.finish());
    return true;
}

double FileMerge::fraction() const {
    const auto part = [](std::size_t done, std::size_t all) {
        return all == 0 ? 1 : std::min(1.0, static_cast<double>(done) / static_cast<double>(all));
    };
    if (!build_) return ReadingShare * part(size_ - left_, size_);
    const std::size_t words = build_->base.size() + words_.size();
    return ReadingShare + (1 - ReadingShare) * part(build_->added, words);
}

/// False when the file cannot be read on.
bool FileMerge::readOn() {
    const std::size_t size = std::min(left_, BlockSize);
    std::size_t got = 0;
    if (!ReadOn(file_.number(), text_.data() + used_, size, got)) return false;
    if (left_ == size_ && got >= 3 && HasByteOrderMark(text_)) {
        std::fill_n(text_.begin(), 3, std::byte{' '});
    }
    used_ += got;
    takeWords();
    left_ -= got;
    if (left_ > 0 && got == size) return true;
    // A word that was written on beyond the end since the file was opened is taken whole.
    if (used_ > 0) {
        if (!ReadOn(file_.number(), text_.data() + used_, MostKept, got)) return false;
        std::byte* const rest = text_.data() + used_;
        std::byte* const space = std::find_if(rest, rest + got, IsSpace);
        *space = std::byte{' '};
        used_ = static_cast<std::size_t>(space + 1 - text_.data());
        takeWords();
    }
    words_.finish();
    build_ = std::make_unique<Build>(dictionary_, words_.size());
    nextHeld();
    nextFresh();
    return true;
}

/// Takes in the words of the text, and keeps the token that it ends within.
void FileMerge::takeWords() {
    std::byte* const end = text_.data() + used_;
    *end = std::byte{0};
    const std::byte* const token =
        ReadWords(text_.data(), end, [this](PackedWord word) { words_.add(word); });
    used_ = std::min(static_cast<std::size_t>(end - token), MostKept);
    std::copy_n(token, used_, text_.data());
}

FileMerge::Build::Build(const Dictionary& dictionary, std::size_t newWords)
    : base(dictionary.words()),
      longest(dictionary.limits.longest),
      cursor(base),
      builder(base.edgesEnd() + newWords) {}

bool FileMerge::Build::isOf(const Dictionary& dictionary) const {
    return dictionary.words() == base && dictionary.limits.longest == longest;
}

void FileMerge::nextHeld() {
    if (!build_->cursor.next(build_->held)) build_->held = AtEnd;
}

void FileMerge::nextFresh() {
    PackedWord& fresh = build_->fresh;
    do {
        if (!words_.next(fresh)) fresh = AtEnd;
    } while (fresh != AtEnd && LengthOf(fresh) > static_cast<std::size_t>(build_->longest));
}

/// False when all words are in.
bool FileMerge::addWords() {
    for (std::size_t i = 0; i < WordsAtOnce; ++i, ++build_->added) {
        const PackedWord word = std::min(build_->held, build_->fresh);
        if (word == AtEnd) return false;
        build_->builder.add(word);
        if (build_->held == word) nextHeld();
        if (build_->fresh == word) nextFresh();
    }
    return true;
}

/// The dictionary has changed; and words taken out are given back already: the file is read again.
bool FileMerge::beginAnew() {
    build_.reset();
    words_ = {};
    lseek(file_.number(), 0, SEEK_SET);
    left_ = size_;
    used_ = 0;
    bool goesOn = true;
    for (const bool atOneGo = ++attempts_ >= MostAttempts; atOneGo && goesOn;) goesOn = work();
    return goesOn;
}

}  // namespace Quorle
