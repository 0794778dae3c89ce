#include "word_file/merge_line.h"

#include <algorithm>
#include <chrono>
#include <cstring>
#include <new>

#include "word_file/word_text.h"

namespace Quorle {

namespace {

constexpr std::size_t BlockSize = std::size_t{16} << 10;
// Of a token that lies across blocks no more is kept: it is no word, however it goes on.
constexpr std::size_t MostKept = LongestWord + 1;
constexpr std::size_t WordsAtOnce = 256;
constexpr double ReadingShare = 0.4;  // of the time; the rest is building

// Someone who changes the dictionary at every step must not keep the merge from ending: the last
// attempt is made at one go.
constexpr int MostAttempts = 8;

using Clock = std::chrono::steady_clock;

// A piece of work more may follow when the time is up.
constexpr std::chrono::microseconds StepTime{3500};

}  // namespace

FileMerge::FileMerge(Dictionary& dictionary, const char* path)
    : dictionary_(dictionary),
      file_(OpenRegularFile(AT_FDCWD, path, size_)),
      left_(size_),
      text_(MostKept + BlockSize + LongestWord) {}

bool FileMerge::work() {
    if (!file_) return false;
    if (!build_) return readOn();
    if (dictionary_.words() != build_->base || dictionary_.limits.longest != build_->longest)
        return beginAnew();
    if (addWords() || build_->builder.giveBack()) return true;
    dictionary_.replace(*build_->merged);
    return false;
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
    if (left_ == size_ && got >= 3 && std::memcmp(text_.data(), "\xEF\xBB\xBF", 3) == 0)
        std::fill_n(text_.begin(), 3, std::byte{' '});  // in place of a byte order mark
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
    build_ = std::make_unique<Build>(dictionary_, words_);
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

FileMerge::Build::Build(const Dictionary& dictionary, SortedWords& words)
    : base(dictionary.words()),
      longest(dictionary.limits.longest),
      cursor(base),
      builder(base.edgesEnd() + words.size()),
      held(cursor.next()),
      fresh(words.next()) {}

/// False when all words are in.
bool FileMerge::addWords() {
    Build& build = *build_;
    const auto longest = static_cast<std::size_t>(build.longest);
    for (std::size_t i = 0; i < WordsAtOnce; ++i, ++build.added) {
        const PackedWord word = std::min(build.held, build.fresh);
        if (word == NoWord) {
            if (!build.merged) build.merged = build.builder.finish();
            return false;
        }
        if (word == build.held || LengthOf(word) <= longest) build.builder.add(word);
        if (word == build.fresh) build.fresh = words_.next();
        if (word == build.held) build.held = build.cursor.next();
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

/// Works until the time is up; false when the line is through.
bool MergeLine::work() {
    const auto end = Clock::now() + StepTime;
    do {
        if (!current_ && waiting_.empty()) return false;
        if (!current_) {
            current_.emplace(dictionary_, waiting_.front().c_str());
            waiting_.pop();
        }
        bool goesOn = false;
        try {
            goesOn = current_->work();
        } catch (const std::bad_alloc&) {
            // The file's words do not fit in memory; the dictionary is as it was.
        }
        if (!goesOn) current_.reset();
        done_ += goesOn ? 0 : 1;
    } while (Clock::now() < end);
    return current_ || !waiting_.empty();
}

std::int32_t MergeLine::step(const char* path) {
    if (path != nullptr && std::string_view(path) != "dummy") waiting_.emplace(path);
    if (!work()) {
        done_ = percent_ = 0;
        return 100;
    }
    const double files = done_ + 1 + static_cast<double>(waiting_.size());
    const double done = (done_ + (current_ ? current_->fraction() : 0)) / files;
    percent_ = std::clamp(static_cast<std::int32_t>(100 * done), percent_, 99);
    return percent_;
}

}  // namespace Quorle
