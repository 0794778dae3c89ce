#include "game/game_flow.h"

#include <QFrame>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QTableWidget>
#include <QTimer>
#include <cstdlib>

#include "board/dice.h"
#include "board/draw_cubes.h"
#include "game/tell_game.h"
#include "main_window/main_window.h"
#include "platform/layout.h"
#include "platform/platform.h"
#include "results/end_of_game.h"
#include "state/format_time.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

QString TimeText(std::int16_t seconds) {
    return QString::fromStdString(Common::FormatTime(seconds));
}

void FillBoard() {
    const std::string shake = Dice::ShakeCubes();
    for (std::int16_t k = 0; k < CubeCount; ++k) {
        Dice::PutOnBoard(k, shake[static_cast<std::size_t>(k)]);
        Common::DrawCubeNormal(k);
    }
}

void OpenWordEntry(Main& window) {
    window.NewWord->setEnabled(true);
    window.NewWord->clear();
    State.LastTypedText.clear();
    window.NewWord->setFocus();
    State.PickedWord.clear();
    State.PickedCount = 0;
    Platform::SetDefaultButton(&window, window.Enter);
}

void ShowComputerWordCount(QLabel& label) {
    Platform::ShowFitting(label, Platform::LayoutFont(Platform::Typeface::SansSerif, 13.5),
                          QString("Quorle found %1 words").arg(State.ComputerWordCount));
}

// The window in front at the first counted tick is the one the clock needs from
// then on. A dialog in front stands for its window only when that is recorded.
bool ClockMayCount() {
    const std::int32_t inFront = Platform::WindowInFront();
    if (State.ClockWindow != 0) return inFront == State.ClockWindow;
    State.ClockWindow = std::abs(inFront);
    return true;
}

}  // namespace

namespace Common {

void StartGame() {
    Main& window = Windows::Shared<Main>();
    window.WordList->setRowCount(0);
    window.PlayerWordLabel->clear();
    FillBoard();
    OpenWordEntry(window);
    SolveBoard();
    ShowComputerWordCount(*window.DefinedWordCount);
    window.update();
    State.TimeRemaining = State.TimeLimit;
    window.SetTimeLabels("Time Remaining", TimeText(State.TimeLimit));
    window.GameClock->start();
    Game::TellNewBoard();
}

void PauseGame() {
    Main& window = Windows::Shared<Main>();
    State.Paused = True;
    window.CubeFrame->hide();
    Platform::ShowMessage("Hit OK when ready to resume.", "Game paused");
    window.CubeFrame->show();
    window.update();
    State.Paused = False;
}

void StopGame() {
    State.TimeRemaining = 0;
    EndGame("Game over");
}

void ClockTick() {
    if (State.Paused || !ClockMayCount()) return;
    --State.TimeRemaining;
    Windows::Shared<Main>().TimeLeft->setText(TimeText(State.TimeRemaining));
    Game::TellTimeLeft();
    if (State.TimeRemaining == 0) EndGame("Time is up");
}

}  // namespace Common
