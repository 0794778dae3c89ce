#include "word_file/merge_line.h"

#include <algorithm>
#include <chrono>
#include <new>

namespace Quorle {

namespace {

using Clock = std::chrono::steady_clock;

// A piece of work more may follow when the time is up.
constexpr std::chrono::microseconds StepTime{3500};

}  // namespace

/// Goes on to the next file that can be read, where none is being merged; false when there is none.
bool MergeLine::hasCurrent() {
    while (!current_ && !waiting_.empty()) {
        current_.emplace(dictionary_, waiting_.front().c_str());
        waiting_.pop();
        if (*current_) break;
        current_.reset();
        ++done_;
    }
    return current_.has_value();
}

/// Works until the time is up; false when the line is through.
bool MergeLine::work() {
    for (const auto end = Clock::now() + StepTime; hasCurrent() && Clock::now() < end;) {
        bool goesOn = false;
        try {
            goesOn = current_->work();
        } catch (const std::bad_alloc&) {
            // The file's words do not fit in memory; the dictionary is as it was.
        }
        if (goesOn) continue;
        current_.reset();
        ++done_;
    }
    return hasCurrent();
}

std::int32_t MergeLine::step(const char* path) {
    if (path != nullptr && std::string_view(path) != "dummy") waiting_.emplace(path);
    if (!work()) {
        done_ = percent_ = 0;
        return 100;
    }
    const double files = done_ + 1 + static_cast<double>(waiting_.size());
    const double done = (done_ + current_->fraction()) / files;
    percent_ = std::clamp(static_cast<std::int32_t>(100 * done), percent_, 99);
    return percent_;
}

}  // namespace Quorle
