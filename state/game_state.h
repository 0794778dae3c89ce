#pragma once
// The one set of variables that every game procedure shares.
#include <array>
#include <cstdint>
#include <string>

#include "state/game_rules.h"

/// A 16-bit truth value, true being all bits set. ToBoolean makes one of a
/// bool, which would otherwise be stored as 1.
enum Boolean : std::int16_t { False = 0, True = -1 };
constexpr Boolean ToBoolean(bool value) {
    return value ? True : False;
}

constexpr int BoardSize = 4;     ///< rows and columns of the board
constexpr int CubeCount = 16;    ///< board index = 4 x row + column
constexpr int PickedSlots = 17;  ///< slots 1..17 of PickedCubes

/// A mark for each cell of the board: [row][column], of which 0..3 are used.
using BoardMarks = std::array<std::array<Boolean, BoardSize + 1>, BoardSize + 1>;

struct GameState {
    // The running game.
    std::int16_t TimeRemaining = 0;  ///< seconds; not 0 while a game is under way
    Boolean Paused = False;
    std::int32_t ClockWindow = 0;  ///< number of the window the clock needs in front; 0: none yet
    std::int32_t ComputerWordCount = 0;

    // Settings. The shortest and longest word are the word engine's.
    std::int16_t TimeLimit = UsualGameTime;  ///< seconds
    Boolean Sounds = True;
    std::int16_t MaxWordSizeOption = 0;  ///< as settled at start-up

    // The cubes and the board.
    std::array<std::string, CubeCount> CubeFaces;        ///< six upper-case letters each
    std::array<std::string, CubeCount + 1> CubeLetters;  ///< "R", "Qu", or empty when blank
    std::array<std::array<std::string, BoardSize + 1>, BoardSize + 1> BoardGrid;  ///< "r", "qu"
    BoardMarks TracedPath{};  ///< the chain found
    std::array<std::int16_t, CubeCount + 1>
        CubeDrawState{};  ///< 0 never drawn, 1 normal, 2 selected

    // The word being built.
    std::string PickedWord;  ///< the letters appended by clicks, lower case
    std::array<std::int16_t, PickedSlots + 1>
        PickedCubes{};  ///< board indexes, slots 1..PickedCount
    std::int16_t PickedCount = 0;
    std::string LastTypedText;  ///< UTF-8

    // The dictionary and the other windows.
    Boolean DictionaryChanged = False;  ///< the engine's dictionary differs from Dictionary.dat
    std::int16_t LetterBase = 0;        ///< the code of "a" from start-up on
    double ResultsShownAt = 0;          ///< on the steady clock, seconds
    std::int16_t ProgressFullWidth = 0;
};

extern GameState State;
