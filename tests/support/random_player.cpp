#include "support/random_player.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <iostream>

RandomPlayer::RandomPlayer() {
    const char* given = std::getenv("QUORLE_SEED");
    const auto seed = given == nullptr ? std::random_device()()
                                       : static_cast<unsigned>(std::strtoul(given, nullptr, 10));
    std::cout << "QUORLE_SEED=" << seed << std::endl;
    random_.seed(seed);
}

void RandomPlayer::can(const std::string& name, int weight, const std::function<void()>& action) {
    for (int i = 0; i < weight; ++i) actions_.push_back({name, action});
}

void RandomPlayer::play(int actions) {
    constexpr std::size_t Remembered = 300;
    std::string done;
    for (int i = 0; i < actions; ++i) {
        const Action& action = oneOf(actions_);
        done += " " + action.name;
        if (done.size() > Remembered) done.erase(0, done.size() - Remembered);
        SCOPED_TRACE("action " + std::to_string(i) + " of ..." + done);
        action.act();
        for (const auto& check : checks_) check();
        if (testing::Test::HasFailure()) return;
    }
}
