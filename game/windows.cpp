#include "game/windows.h"

#include "dictionary/editor_window.h"
#include "dictionary/progress_window.h"
#include "game/main_window.h"
#include "help/help_window.h"
#include "options/options_window.h"
#include "results/results_window.h"

namespace Windows {

void DestroyAll() {
    delete Existing<Results>;
    delete Existing<Progress>;
    delete Existing<DictionaryEditor>;
    delete Existing<OptionsDialog>;
    delete Existing<HelpBrowser>;
    delete Existing<Main>;
}

}  // namespace Windows
