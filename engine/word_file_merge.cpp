#include "word_file_merge.h"

#include <algorithm>
#include <chrono>
#include <deque>
#include <memory>
#include <new>
#include <string>

#include "word_file_build.h"
#include "word_file_reader.h"

namespace {

using Clock = std::chrono::steady_clock;

// A piece of work more may follow when the time is up.
constexpr std::chrono::microseconds StepTime{4000};
constexpr double ReadingShare = 0.5;  // of a file's time; the rest is building

/// A file on its way into the dictionary.
struct FileMerge {
    WordFileReader reader;
    std::unique_ptr<MergedDictionary> build;  // once all is read

    bool work();
    double fraction() const;
};

/// Does a piece of the work; true when nothing is left to do.
bool FileMerge::work() {
    if (build) return build->work();
    switch (reader.readOn()) {
        case WordFileReader::Progress::Reading:
            return false;
        case WordFileReader::Progress::Failed:
            return true;
        case WordFileReader::Progress::Done:
            break;
    }
    build = std::make_unique<MergedDictionary>(reader.words());
    return false;
}

double FileMerge::fraction() const {
    return build ? ReadingShare + (1 - ReadingShare) * build->fraction()
                 : ReadingShare * reader.fraction();
}

/// The files asked for since nothing was stepping.
struct Line {
    std::unique_ptr<FileMerge> current;
    std::deque<std::string> waiting;
    int done = 0;
    std::int32_t percent = 0;
};

Line Files;

/// Begins with the next file that can be read; false when there is none.
bool BeginNext() {
    while (!Files.waiting.empty()) {
        auto next = std::make_unique<FileMerge>();
        const bool readable = next->reader.open(Files.waiting.front().c_str());
        Files.waiting.pop_front();
        if (readable) {
            Files.current = std::move(next);
            return true;
        }
        ++Files.done;
    }
    return false;
}

void EndCurrent() {
    Files.current.reset();
    ++Files.done;
}

std::int32_t Percent() {
    const double files = Files.done + 1 + static_cast<double>(Files.waiting.size());
    const double done = (Files.done + (Files.current ? Files.current->fraction() : 0)) / files;
    const auto percent = static_cast<std::int32_t>(100 * done);
    Files.percent = std::clamp(percent, Files.percent, 99);
    return Files.percent;
}

/// Works until the time is up; false when the line is through.
bool Work() {
    const auto end = Clock::now() + StepTime;
    do {
        if (!Files.current && !BeginNext()) return false;
        try {
            if (Files.current->work()) EndCurrent();
        } catch (const std::bad_alloc&) {
            EndCurrent();  // its words do not fit in memory; the dictionary is as it was
        }
    } while (Clock::now() < end);
    return Files.current || !Files.waiting.empty();
}

}  // namespace

std::int32_t MergeStep(const char* path) {
    if (path != nullptr && std::string_view(path) != "dummy") Files.waiting.emplace_back(path);
    if (Work()) return Percent();
    Files = {};
    return 100;
}
