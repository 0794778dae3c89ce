#include "support/random_player.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <iostream>

namespace {

unsigned FromEnvironment(const char* name, unsigned otherwise) {
    const char* given = std::getenv(name);
    return given == nullptr ? otherwise : static_cast<unsigned>(std::strtoul(given, nullptr, 10));
}

}  // namespace

RandomPlayer::RandomPlayer() {
    const unsigned seed = FromEnvironment("QUORLE_SEED", std::random_device()());
    std::cout << "QUORLE_SEED=" << seed << std::endl;
    random_.seed(seed);
}

void RandomPlayer::can(const std::string& name, int weight, const std::function<void()>& action) {
    for (int i = 0; i < weight; ++i) actions_.push_back({name, action});
}

void RandomPlayer::play(int actions) {
    constexpr std::size_t Remembered = 300;
    std::string done;
    for (unsigned i = FromEnvironment("QUORLE_ACTIONS", static_cast<unsigned>(actions)); i > 0;
         --i) {
        const Action& action = oneOf(actions_);
        done += " " + action.name;
        if (done.size() > Remembered) done.erase(0, done.size() - Remembered);
        SCOPED_TRACE(std::to_string(i) + " actions before the end, after ..." + done);
        EXPECT_NO_THROW({
            action.act();
            for (const auto& check : checks_) check();
        });
        if (testing::Test::HasFailure()) return;
    }
}
