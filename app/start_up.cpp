#include "app/start_up.h"

#include <quorle/word_engine.h>

#include <QTableWidget>

#include "board/dice.h"
#include "board/draw_cubes.h"
#include "dictionary/dictionary.h"
#include "main_window/main_window.h"
#include "options/settings.h"
#include "platform/platform.h"
#include "state/game_state.h"
#include "state/windows.h"

// The dictionary comes before the settings: the stored maximum word size is
// settled with the dictionary's own.
void Common::StartUp() {
    QTableWidget& list = *Windows::Shared<Main>().WordList;
    Dictionary::LoadDictionary();
    Dice::FillCubeFaces();
    for (std::int16_t k = 0; k < CubeCount; ++k) {
        State.CubeLetters[static_cast<std::size_t>(k)].clear();
        DrawCubeNormal(k);
    }
    list.setColumnWidth(0, list.width());
    State.TimeRemaining = 0;
    State.TimeLimit = UsualGameTime;
    State.Paused = False;
    State.Sounds = True;
    LoadSettings();
    State.MaxWordSizeOption = static_cast<std::int16_t>(cMaxWordSize());
    Platform::SeedRandom();
}
