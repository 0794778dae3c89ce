#pragma once
// The numbers that the rules name: lengths of words in letters, times in seconds.
#include <array>
#include <cstdint>

constexpr std::int16_t ShortestWord = 2;  ///< that the word engine keeps
constexpr std::int16_t LongestWord = 16;

/// The shortest word of a game where nothing else is set; shorter ones are neither
/// offered as a setting nor added by hand.
constexpr std::int16_t UsualShortestWord = 3;

constexpr std::array<std::int16_t, 7> GameTimes{15, 30, 60, 120, 180, 240, 300};
constexpr std::int16_t UsualGameTime = 180;
