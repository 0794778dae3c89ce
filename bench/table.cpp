#include "table.h"

#include <benchmark/benchmark.h>

#include <cstdio>
#include <map>
#include <vector>

namespace {

struct TableRow {
    Row row;
    std::string figure;  // empty: from the timings
    Compared compared = Compared::Ratio;
};

std::vector<TableRow> Rows;

/// The shortest time of each benchmark: what disturbs a machine only adds.
class Shortest : public benchmark::BenchmarkReporter {
  public:
    bool ReportContext(const Context&) override { return true; }
    void ReportRuns(const std::vector<Run>& runs) override {
        for (const Run& run : runs) {
            if (run.run_type != Run::RT_Iteration) continue;
            const bool byClock = !run.run_name.time_type.empty();
            const double time = byClock ? run.GetAdjustedRealTime() : run.GetAdjustedCPUTime();
            const auto [known, isNew] = times_.emplace(run.run_name.function_name, time);
            if (!isNew && time < known->second) known->second = time;
        }
    }
    bool has(const std::string& name) const { return times_.count(name) != 0; }
    double time(const std::string& name) const { return times_.at(name); }

  private:
    std::map<std::string, double> times_;
};

std::string Name(std::size_t row, bool engine) {
    return std::to_string(row) + (engine ? ":engine" : ":rival");
}

std::string Figure(const TableRow& row, std::size_t index, const Shortest& shortest) {
    if (!row.figure.empty()) return row.figure;
    const double engine = shortest.time(Name(index, true));
    const double rival = shortest.time(Name(index, false));
    std::string times = " (" + Rounded(engine / 1000) + " : " + Rounded(rival / 1000) + " µs)";
    return (row.compared == Compared::Ratio ? Rounded(rival / engine) + " ×"
                                            : Rounded(engine / rival)) +
           times;
}

}  // namespace

void AddTimings(const Row& row, Compared compared, const std::function<void()>& prepare,
                const std::function<void()>& engine, const std::function<void()>& rival,
                int calls) {
    for (const bool isEngine : {true, false}) {
        const auto& call = isEngine ? engine : rival;
        const auto timing = [prepare, call](benchmark::State& state) {
            prepare();
            for (auto _ : state) call();
        };
        auto* added = benchmark::RegisterBenchmark(Name(Rows.size(), isEngine).c_str(), timing);
        added->Unit(benchmark::kNanosecond)->Repetitions(5);
        if (compared == Compared::ShareByClock) added->UseRealTime();
        if (calls > 0) {
            added->Iterations(calls);
        } else {
            added->MinTime(0.1);
        }
    }
    Rows.push_back({row, "", compared});
}

void AddFigure(const Row& row, const std::string& figure) {
    Rows.push_back({row, figure, Compared::Ratio});
}

std::string Rounded(double value, const std::string& unit) {
    char text[32];
    std::snprintf(text, sizeof text, "%.3g", value);
    return text + unit;
}

void RunRows(int argc, char** argv) {
    std::vector<char*> arguments(argv, argv + argc);
    char interleave[] = "--benchmark_enable_random_interleaving=true";
    arguments.push_back(interleave);
    int count = static_cast<int>(arguments.size());
    benchmark::Initialize(&count, arguments.data());
    Shortest shortest;
    benchmark::RunSpecifiedBenchmarks(&shortest);
    std::printf("| what | against | figure | goal | aim |\n|---|---|---|---|---|\n");
    for (std::size_t i = 0; i < Rows.size(); ++i) {
        const Row& row = Rows[i].row;
        // A filter may leave timings out.
        if (Rows[i].figure.empty() && !shortest.has(Name(i, true))) continue;
        std::printf("| %s | %s | %s | %s | %s |\n", row.what.c_str(), row.against.c_str(),
                    Figure(Rows[i], i, shortest).c_str(), row.goal.c_str(), row.aim.c_str());
    }
}
