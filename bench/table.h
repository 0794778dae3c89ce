#pragma once
// The benchmark's rows, and the one table that they end in.
#include <functional>
#include <string>

/// A row compares the engine with a rival, or a figure of it with a bound.
struct Row {
    std::string what;
    std::string against;
    std::string goal;
    std::string aim;
};

/// A row of two timings: the rival's time for one call over the engine's. Before each timing
/// `prepare` runs, untimed; `calls` is how many calls one timing makes (0: as many as it takes).
void AddRatio(const Row& row, const std::function<void()>& prepare,
              const std::function<void()>& engine, const std::function<void()>& rival,
              int calls = 0);

/// The same, as the engine's time over the rival's.
void AddShare(const Row& row, const std::function<void()>& prepare,
              const std::function<void()>& engine, const std::function<void()>& rival,
              int calls = 0);

/// A row of a figure that is measured at once.
void AddFigure(const Row& row, const std::string& figure);

std::string Rounded(double value, const std::string& unit = "");

/// Runs all timings, interleaved at random, and prints the table.
void RunRows(int argc, char** argv);
