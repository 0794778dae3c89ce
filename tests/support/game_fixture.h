#pragma once
// A program of its own for each test: fresh state, folders, settings and engine,
// and a desktop that does what the test says. Names no Qt.
#include <gtest/gtest.h>
#include <quorle/word_engine.h>

#include <deque>
#include <random>
#include <string>
#include <vector>

#include "engine/temp_folder.h"
#include "platform/platform.h"
#include "state/game_state.h"

class GameFixture : public testing::Test {
  protected:
    GameFixture();

    /// State and engine as in a new process.
    static void resetProcess();

    /// Writes the program folder's dictionary. The engine then holds it, too.
    void makeDictionary(const std::vector<std::string>& words, int maximum = 16);

    /// How many words it holds now; the engine then holds them.
    int wordsInFile() const;

    /// The settings file's values; an empty text where there is none.
    static void store(const std::string& name, const std::string& text);
    static std::string stored(const std::string& name);

    /// Puts the test's functions behind the platform's names, but those that
    /// show something.
    void useTestDesktop();

    TempFolder folder_;              ///< home, and below it the program folder
    std::deque<float> draws_;        ///< the next numbers of the random source
    std::mt19937 randomness_;        ///< the numbers after those
    int warnings_ = 0;               ///< warning sounds asked for
    std::vector<std::string> told_;  ///< what a screen reader would say
    double seconds_ = 1000;          ///< the steady clock
};

/// Lets the program run in a folder: its home and everything the desktop keeps there.
void UseHome(const std::string& folder);
