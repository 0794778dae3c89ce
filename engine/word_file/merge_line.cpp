#include "word_file/merge_line.h"

#include <algorithm>
#include <chrono>
#include <new>

namespace Quorle {

namespace {

using Clock = std::chrono::steady_clock;

// A piece of work more may follow when the time is up.
constexpr std::chrono::microseconds StepTime{3500};
constexpr double ReadingShare = 0.4;  // of a file's time; the rest is building

// Someone who changes the dictionary at every step must not keep the merge from ending: the last
// attempt is made at one go.
constexpr int MaxAttempts = 8;

}  // namespace

/// Does a piece of the current file's work.
void MergeLine::workOnce() {
    using Progress = WordFileReader::Progress;
    if (build_) {
        const auto built = build_->work();
        if (built == MergedDictionary::Progress::Done) endCurrent();
        if (built == MergedDictionary::Progress::Outdated) beginAnew();
        return;
    }
    const Progress progress = current_->readOn();
    if (progress == Progress::Failed) endCurrent();
    if (progress != Progress::Done) return;
    build_ = std::make_unique<MergedDictionary>(dictionary_, current_->takeWords());
}

/// The words read are given back already: the file is read again.
void MergeLine::beginAnew() {
    build_.reset();
    current_->rewind();
    const bool atOneGo = ++outdated_ >= MaxAttempts;
    for (const int done = done_; atOneGo && done == done_;) workOnce();
}

/// The part of the current file that is done, 0..1.
double MergeLine::fraction() const {
    if (!current_) return 0;
    return build_ ? ReadingShare + (1 - ReadingShare) * build_->fraction()
                  : ReadingShare * current_->fraction();
}

/// Begins with the next file that can be read; false when there is none.
bool MergeLine::beginNext() {
    while (!waiting_.empty()) {
        auto next = std::make_unique<WordFileReader>();
        const bool readable = next->open(waiting_.front().c_str());
        waiting_.pop_front();
        if (readable) {
            current_ = std::move(next);
            return true;
        }
        ++done_;
    }
    return false;
}

void MergeLine::endCurrent() {
    build_.reset();
    current_.reset();
    outdated_ = 0;
    ++done_;
}

/// Works until the time is up; false when the line is through.
bool MergeLine::work() {
    const auto end = Clock::now() + StepTime;
    do {
        if (!current_ && !beginNext()) return false;
        try {
            workOnce();
        } catch (const std::bad_alloc&) {
            endCurrent();  // its words do not fit in memory; the dictionary is as it was
        }
    } while (Clock::now() < end);
    return current_ || !waiting_.empty();
}

std::int32_t MergeLine::percent() {
    const double files = done_ + 1 + static_cast<double>(waiting_.size());
    const double done = (done_ + fraction()) / files;
    percent_ = std::clamp(static_cast<std::int32_t>(100 * done), percent_, 99);
    return percent_;
}

std::int32_t MergeLine::step(const char* path) {
    if (path != nullptr && std::string_view(path) != "dummy") waiting_.emplace_back(path);
    if (work()) return percent();
    done_ = percent_ = 0;
    return 100;
}

}  // namespace Quorle
