#include "game/tell_game.h"

#include <QLabel>

#include "main_window/main_window.h"
#include "platform/platform.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

std::string Counted(int count, const char* unit) {
    return std::to_string(count) + ' ' + unit + (count == 1 ? "" : "s");
}

// In words, for readers say every colon.
std::string SpokenTime(std::int16_t seconds) {
    const int minutes = seconds / 60;
    const int rest = seconds % 60;
    if (minutes == 0) return Counted(rest, "second");
    if (rest == 0) return Counted(minutes, "minute");
    return Counted(minutes, "minute") + ' ' + Counted(rest, "second");
}

// Letters apart, or they would be read as words; a pause after each row.
std::string SpokenBoard() {
    std::string rows;
    for (std::size_t k = 0; k < CubeCount; ++k) {
        if (k > 0) rows += k % BoardSize == 0 ? ". " : ", ";
        rows += State.CubeLetters[k];
    }
    return rows;
}

std::string TextOf(const QLabel& label) {
    return label.text().toStdString();
}

}  // namespace

namespace Game {

void TellNewBoard() {
    const Main& window = Windows::Shared<Main>();
    Platform::Tell(SpokenBoard() + ". " + TextOf(*window.DefinedWordCount) + ". " +
                   SpokenTime(State.TimeRemaining));
}

void TellGame() {
    if (State.CubeLetters[0].empty()) return Platform::Tell("No game. Alt S starts one");
    const QLabel& entered = *Windows::Shared<Main>().PlayerWordLabel;
    const bool over = State.TimeRemaining == 0;
    Platform::Tell((over ? "Game over" : SpokenTime(State.TimeRemaining) + " left") + ". " +
                   (entered.text().isEmpty() ? "No words entered" : TextOf(entered)) + ". " +
                   SpokenBoard());
}

void TellTimeLeft() {
    const std::int16_t left = State.TimeRemaining;
    if (left == 60 || left == 30 || left == 10) Platform::Tell(SpokenTime(left) + " left");
}

}  // namespace Game
