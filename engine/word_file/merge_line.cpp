#include "word_file/merge_line.h"

#include <algorithm>
#include <chrono>
#include <new>

#include "word_file/merged_dictionary.h"
#include "word_file/word_file_reader.h"

namespace Quorle {

namespace {

using Clock = std::chrono::steady_clock;

// A piece of work more may follow when the time is up.
constexpr std::chrono::microseconds StepTime{3500};
constexpr double ReadingShare = 0.4;  // of a file's time; the rest is building

}  // namespace

/// A file on its way into the dictionary.
struct FileMerge {
    WordFileReader reader;
    std::unique_ptr<MergedDictionary> build;  // once all is read

    bool work(Dictionary& dictionary);
    double fraction() const;
};

/// Does a piece of the work; true when nothing is left to do.
bool FileMerge::work(Dictionary& dictionary) {
    using Progress = WordFileReader::Progress;
    if (build) return build->work();
    const Progress progress = reader.readOn();
    if (progress == Progress::Done) {
        build = std::make_unique<MergedDictionary>(dictionary, reader.words());
    }
    return progress == Progress::Failed;
}

double FileMerge::fraction() const {
    return build ? ReadingShare + (1 - ReadingShare) * build->fraction()
                 : ReadingShare * reader.fraction();
}

MergeLine::MergeLine(Dictionary& dictionary) : dictionary_(dictionary) {}
MergeLine::~MergeLine() = default;

/// Begins with the next file that can be read; false when there is none.
bool MergeLine::beginNext() {
    while (!waiting_.empty()) {
        auto next = std::make_unique<FileMerge>();
        const bool readable = next->reader.open(waiting_.front().c_str());
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
    current_.reset();
    ++done_;
}

/// Works until the time is up; false when the line is through.
bool MergeLine::work() {
    const auto end = Clock::now() + StepTime;
    do {
        if (!current_ && !beginNext()) return false;
        try {
            if (current_->work(dictionary_)) endCurrent();
        } catch (const std::bad_alloc&) {
            endCurrent();  // its words do not fit in memory; the dictionary is as it was
        }
    } while (Clock::now() < end);
    return current_ || !waiting_.empty();
}

std::int32_t MergeLine::percent() {
    const double files = done_ + 1 + static_cast<double>(waiting_.size());
    const double done = (done_ + (current_ ? current_->fraction() : 0)) / files;
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
