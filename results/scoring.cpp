#include "results/scoring.h"

#include <algorithm>
#include <array>

namespace {

std::string CountedWords(std::int16_t count) {
    return std::to_string(count) + (count == 1 ? " word" : " words");
}

// " out of 7 (42%)", or nothing where there is no whole to compare with.
std::string OutOf(std::int16_t part, std::int16_t whole) {
    if (whole == 0) return {};
    const int percent = 100 * part / whole;
    return " out of " + std::to_string(whole) + " (" + std::to_string(percent) + "%)";
}

}  // namespace

std::int16_t Common::WordPoints(std::string_view word) {
    constexpr std::size_t Shortest = 4;
    constexpr std::array<std::int16_t, 5> Points{1, 2, 3, 5, 11};  // of 4, 5, 6, 7, 8 letters
    const std::size_t length = std::clamp<std::size_t>(word.size(), Shortest, 8);
    return Points[length - Shortest];
}

namespace GameResults {

void Count(Tally& tally, std::string_view word) {
    const auto add = [](std::int16_t sum, std::int16_t more) {
        return static_cast<std::int16_t>(std::min(sum + more, INT16_MAX));
    };
    tally.words = add(tally.words, 1);
    tally.points = add(tally.points, Common::WordPoints(word));
}

std::string WordsLine(const Tally& player, const Tally& computer) {
    return CountedWords(player.words) + " found" + OutOf(player.words, computer.words);
}

std::string ScoreLine(const Tally& player, const Tally& computer) {
    return "Score is " + std::to_string(player.points) + OutOf(player.points, computer.points);
}

std::string BadWordsLine(std::int16_t words) {
    return CountedWords(words) + " not in dictionary";
}

}  // namespace GameResults
