// Points and the three lines under the results.
#include "results/scoring.h"

#include <gtest/gtest.h>

namespace {

using namespace GameResults;

TEST(Scoring, PointsGoByLengthAndLinesRoundDown) {
    const std::array<int, 12> points{1, 1, 1, 1, 1, 2, 3, 5, 11, 11, 11, 11};
    for (std::size_t length = 0; length < points.size(); ++length) {
        EXPECT_EQ(Common::WordPoints(std::string(length, 'a')), points[length]) << length;
    }
    EXPECT_EQ(WordsLine({3, 0}, {7, 0}), "3 words found out of 7 (42%)");
    EXPECT_EQ(WordsLine({1, 1}, {0, 0}), "1 word found");
    EXPECT_EQ(ScoreLine({9, 199}, {9, 200}), "Score is 199 out of 200 (99%)");
    EXPECT_EQ(ScoreLine({1, 1}, {0, 0}), "Score is 1");
    EXPECT_EQ(BadWordsLine(1), "1 word not in dictionary");
}

}  // namespace
