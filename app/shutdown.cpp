#include "app/shutdown.h"

#include <quorle/word_engine.h>

#include "dictionary/dictionary.h"
#include "dictionary/editor_window.h"
#include "dictionary/merge.h"
#include "dictionary/progress_window.h"
#include "help/help_window.h"
#include "main_window/main_window.h"
#include "options/options_window.h"
#include "options/settings.h"
#include "platform/platform.h"
#include "results/results_window.h"
#include "state/game_state.h"
#include "state/windows.h"

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

void Common::ExitProgram() {
    Dictionary::StopMerge();  // timers run under the question, too
    OfferDictionarySave();
    CloseIfOpen<Progress>();
    CloseIfOpen<OptionsDialog>();
    CloseIfOpen<Results>();
    CloseIfOpen<HelpBrowser>();
    CloseIfOpen<DictionaryEditor>();
    Windows::Shared<Main>().close();
}

void App::DestroyWindows() {
    delete Windows::Existing<Results>;
    delete Windows::Existing<Progress>;
    delete Windows::Existing<DictionaryEditor>;
    delete Windows::Existing<OptionsDialog>;
    delete Windows::Existing<HelpBrowser>;
    delete Windows::Existing<Main>;
}
