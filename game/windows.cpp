#include "game/windows.h"

#include "game/main_window.h"
#include "help/help_window.h"
#include "results/results_window.h"

namespace Windows {

void DestroyAll() {
    delete Existing<Results>;
    delete Existing<HelpBrowser>;
    delete Existing<Main>;
}

}  // namespace Windows
