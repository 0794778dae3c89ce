#include "game/shutdown.h"

#include <quorle/word_engine.h>

#include "dictionary/dictionary.h"
#include "dictionary/editor_window.h"
#include "dictionary/merge.h"
#include "dictionary/progress_window.h"
#include "game/game_state.h"
#include "game/main_window.h"
#include "game/settings.h"
#include "game/windows.h"
#include "help/help_window.h"
#include "options/options_window.h"
#include "platform/platform.h"
#include "results/results_window.h"

namespace {

void OfferDictionarySave() {
    if (!State.DictionaryChanged) return;
    const bool save = Platform::AskYesNo("Dictionary has been updated, do you want to save it?",
                                         "Save dictionary?");
    if (save) {
        Dictionary::SaveDictionary();
    } else {
        cSetMaxWordSize(State.MaxWordSizeOption);
        Common::SaveSettings();
    }
    State.DictionaryChanged = False;
}

template <class Window>
void CloseIfOpen() {
    if (Windows::IsOpen<Window>()) Windows::Existing<Window>->close();
}

}  // namespace

namespace Common {

void ExitProgram() {
    Dictionary::StopMerge();  // timers run under the question, too
    OfferDictionarySave();
    CloseIfOpen<Progress>();
    CloseIfOpen<OptionsDialog>();
    CloseIfOpen<Results>();
    CloseIfOpen<HelpBrowser>();
    CloseIfOpen<DictionaryEditor>();
    Windows::Shared<Main>().close();
}

}  // namespace Common
