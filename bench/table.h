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

/// How a row's two timings are compared. Time is the processor's, which other programs on the
/// machine disturb least, or that of the clock where a rival is a program of its own.
enum class Compared { Ratio, Share, ShareByClock };

/// A row of two timings: the rival's time over the engine's, or as a share the other way round.
/// Before each timing `prepare` runs, untimed; `calls` is how many calls one timing makes
/// (0: as many as it takes).
void AddTimings(const Row& row, Compared compared, const std::function<void()>& prepare,
                const std::function<void()>& engine, const std::function<void()>& rival,
                int calls = 0);

/// A row of a figure that is measured at once.
void AddFigure(const Row& row, const std::string& figure);

std::string Rounded(double value, const std::string& unit = "");

/// Runs all timings, interleaved at random, and prints the table.
void RunRows(int argc, char** argv);
