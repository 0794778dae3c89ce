#include "app/main_window_events.h"

#include <QLineEdit>
#include <QPushButton>
#include <QShortcut>
#include <QTimer>
#include <QToolButton>

#include "app/shutdown.h"
#include "app/start_up.h"
#include "dictionary/editor_commands.h"
#include "entry/submission.h"
#include "entry/word_entry.h"
#include "game/game_flow.h"
#include "game/tell_game.h"
#include "help/help_commands.h"
#include "main_window/cube_tile.h"
#include "main_window/main_window.h"
#include "options/options_commands.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

void ConnectTile(const CubeTile& tile, std::int16_t k) {
    QObject::connect(&tile, &CubeTile::clicked, [k] { Entry::CubeClick(k); });
    QObject::connect(&tile, &CubeTile::doubleClicked, [k] { Entry::CubeDoubleClick(k); });
}

void ConnectEvents(const Main& window) {
    const auto on = [](const auto* sender, auto event, void (*procedure)()) {
        QObject::connect(sender, event, procedure);
    };
    on(window.Start, &QToolButton::clicked, Common::StartGame);
    on(window.Pause, &QToolButton::clicked, Common::PauseGame);
    on(window.End, &QToolButton::clicked, Common::StopGame);
    on(window.Options, &QToolButton::clicked, Common::ShowOptions);
    on(window.Dictionary, &QToolButton::clicked, Dictionary::OpenEditor);
    on(window.HelpButton, &QToolButton::clicked, Help::Open);
    on(window.Exit, &QToolButton::clicked, Common::ExitProgram);
    on(window.NewWord, &QLineEdit::textChanged, Entry::WordTyped);
    on(window.Enter, &QPushButton::clicked, Entry::Submit);
    on(window.Clear, &QPushButton::clicked, Entry::ClearLetter);
    on(window.GameClock, &QTimer::timeout, Common::ClockTick);
    on(window.TellKey, &QShortcut::activated, Game::TellGame);
    on(&window, &Main::closing, Common::ExitProgram);
    for (std::int16_t k = 0; k < CubeCount; ++k) {
        ConnectTile(*window.Cube[static_cast<std::size_t>(k)], k);
    }
}

}  // namespace

Main& App::LoadMainWindow() {
    Main& window = Windows::Shared<Main>();
    ConnectEvents(window);
    Common::StartUp();
    return window;
}
