#pragma once
// Plays at random, and looks after each action whether all is as it must be. A
// run can be repeated and made longer: its seed is printed, and taken from
// QUORLE_SEED where set; QUORLE_ACTIONS is the number of actions.
#include <functional>
#include <random>
#include <string>
#include <vector>

class RandomPlayer {
  public:
    RandomPlayer();

    /// A random number from 0 to n - 1.
    int below(int n) { return static_cast<int>(random_() % static_cast<unsigned>(n)); }

    template <class Container>
    const auto& oneOf(const Container& container) {
        return container[static_cast<std::size_t>(below(static_cast<int>(container.size())))];
    }

    /// Something to do, `weight` times as often as what has the weight 1.
    void can(const std::string& name, int weight, const std::function<void()>& action);

    /// Something that holds after every action; fails the test where it does not.
    void expects(const std::function<void()>& check) { checks_.push_back(check); }

    /// Does so many things, or fewer: the first failure ends it and tells what led there.
    void play(int actions);

  private:
    struct Action {
        std::string name;
        std::function<void()> act;
    };

    std::mt19937 random_;
    std::vector<Action> actions_;
    std::vector<std::function<void()>> checks_;
};
