#include "help/help_commands.h"

#include <QFile>
#include <QTextBrowser>
#include <QUrl>

#include "help/help_window.h"
#include "platform/platform.h"
#include "state/windows.h"

namespace Common {

void OpenHelp() {
    ShowHelpPage();
    HelpBrowser& window = Windows::Shared<HelpBrowser>();
    WindowFront::Float(window);
    WindowFront::Bring(window);
}

void ShowHelpPage() {
    const std::string page = Platform::ProgramFolder() + "/Quorle.htm";
    Windows::Shared<HelpBrowser>().WebBrowser->setSource(
        QUrl::fromLocalFile(QFile::decodeName(page.c_str())));
}

void HideHelp() {
    WindowFront::Hide(Windows::Shared<HelpBrowser>());
}

}  // namespace Common
