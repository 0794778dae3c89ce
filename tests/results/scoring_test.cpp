// Points and the lines under the results.
#include "results/scoring.h"

#include <gtest/gtest.h>

using namespace GameResults;

TEST(Scoring, PointsGoByLengthAndLinesRoundDown) {
    std::string points;
    for (std::size_t size = 0; size < 12; ++size) {
        points += std::to_string(Common::WordPoints(std::string(size, 'a'))) + " ";
    }
    EXPECT_EQ(points, "1 1 1 1 1 2 3 5 11 11 11 11 ");
    EXPECT_EQ(WordsLine({1, 1}, {0, 0}), "1 word found");
    EXPECT_EQ(ScoreLine({9, 199}, {9, 200}), "Score is 199 out of 200 (99%)");
    EXPECT_EQ(ScoreLine({1, 1}, {0, 0}), "Score is 1");
    EXPECT_EQ(BadWordsLine(1), "1 word not in dictionary");
}
