#pragma once
// Points, and the three lines under the results.
#include <cstdint>
#include <string>
#include <string_view>

namespace Common {

/// 1, 2, 3, 5 or 11 points, by the word's length; "qu" counts two letters.
std::int16_t WordPoints(std::string_view word);

}  // namespace Common

namespace GameResults {

/// The number of words in a list and the sum of their points, 32767 at most.
struct Tally {
    std::int16_t words = 0;
    std::int16_t points = 0;
};

/// Counts one more word of the list.
void Count(Tally& tally, std::string_view word);

/// "3 words found out of 7 (42%)".
std::string WordsLine(const Tally& player, const Tally& computer);

/// "Score is 5 out of 17 (29%)".
std::string ScoreLine(const Tally& player, const Tally& computer);

/// "1 word not in dictionary".
std::string BadWordsLine(std::int16_t words);

}  // namespace GameResults
