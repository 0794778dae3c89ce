#include "word_file_runs.h"

#include <algorithm>

RunMerger::RunMerger(std::span<const WordRun> runs) {
    for (const WordRun& run : runs) {
        WordRun::Cursor head(run);
        if (head.next()) heads_.push_back(head);
    }
    for (std::size_t place = heads_.size() / 2; place-- > 0;) sink(place);
}

void RunMerger::sink(std::size_t place) {
    const WordRun::Cursor head = heads_[place];
    for (std::size_t child = 2 * place + 1; child < heads_.size(); child = 2 * place + 1) {
        if (child + 1 < heads_.size() && heads_[child + 1].word() < heads_[child].word()) ++child;
        if (head.word() <= heads_[child].word()) break;
        heads_[place] = heads_[child];
        place = child;
    }
    heads_[place] = head;
}

bool RunMerger::next(PackedWord& word) {
    while (!heads_.empty()) {
        word = heads_.front().word();
        if (!heads_.front().next()) {
            heads_.front() = heads_.back();
            heads_.pop_back();
        }
        if (heads_.size() > 1) sink(0);
        if (word != last_) {
            last_ = word;
            return true;
        }
    }
    return false;
}

void WordRuns::finish() {
    if (chunk_.empty()) return;
    if (!ascending_) {
        std::sort(chunk_.begin(), chunk_.end());
        chunk_.erase(std::unique(chunk_.begin(), chunk_.end()), chunk_.end());
    }
    if (runs_.empty() || runs_.back().last() >= chunk_.front()) runs_.emplace_back();
    for (const PackedWord word : chunk_) runs_.back().append(word);
    chunk_.clear();
    last_ = 0;
    ascending_ = true;
}

bool WordRuns::crowded() const {
    if (merging_ || !spent_.empty()) return true;
    return runs_.size() >= MaxRuns && runs_[runs_.size() - MaxRuns].level == runs_.back().level;
}

void WordRuns::relieve() {
    if (!merging_ && !spent_.empty()) return spent_.pop_back();
    if (!merging_) {
        merger_ = RunMerger(std::span(runs_).last(MaxRuns));
        merged_ = {};
        merged_.level = runs_.back().level + 1;
        merging_ = true;
    }
    PackedWord word = 0;
    for (std::size_t i = 0; i < ChunkSize; ++i) {
        if (merger_.next(word)) {
            merged_.append(word);
        } else {
            return replaceMerged();
        }
    }
}

void WordRuns::replaceMerged() {
    const auto first = runs_.end() - MaxRuns;
    spent_.assign(std::move_iterator(first), std::move_iterator(runs_.end()));
    runs_.erase(first, runs_.end());
    runs_.push_back(std::move(merged_));
    merging_ = false;
}

std::size_t WordRuns::size() const {
    std::size_t all = 0;
    for (const WordRun& run : runs_) all += run.size();
    return all;
}
