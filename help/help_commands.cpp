#include "help/help_commands.h"

#include <QFile>
#include <QTextBrowser>
#include <QUrl>

#include "help/help_window.h"
#include "platform/platform.h"
#include "state/windows.h"

namespace Help {

void Open() {
    ShowPage();
    HelpBrowser& window = Windows::Shared<HelpBrowser>();
    Platform::FloatWindow(window);
    Platform::BringToFront(window);
}

void ShowPage() {
    const std::string page = Platform::ProgramFolder() + "/Quorle.htm";
    Windows::Shared<HelpBrowser>().WebBrowser->setSource(
        QUrl::fromLocalFile(QFile::decodeName(page.c_str())));
}

void Hide() {
    Platform::HideWindow(Windows::Shared<HelpBrowser>());
}

}  // namespace Help
