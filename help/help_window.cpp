#include "help/help_window.h"

#include <QAction>
#include <QCloseEvent>

#include "help/help_commands.h"
#include "help/page_viewer.h"
#include "platform/layout.h"
#include "platform/menu_bar.h"
#include "state/windows.h"

using namespace Platform;

namespace {

constexpr int ClientWidth = 8505;
constexpr int ClientHeight = 6180;
constexpr double TextPoints = 10.5;

}  // namespace

HelpBrowser::HelpBrowser() {
    setObjectName("HelpBrowser");
    setWindowTitle("Quorle Help");
    makeViewer();
    makeCommands();
}

void HelpBrowser::makeViewer() {
    WebBrowser = new PageViewer(this);
    SetUp(WebBrowser, "WebBrowser", {0, 0, ClientWidth, ClientHeight},
          LayoutFont(Typeface::SansSerif, TextPoints));
    WebBrowser->setAccessibleName("Help");
    WebBrowser->setFrameStyle(QFrame::NoFrame);
    WebBrowser->setFocus();
}

void HelpBrowser::makeCommands() {
    QMenuBar* bar = MakeMenuBar(this);
    const auto addCommand = [bar](const char* name) {
        QAction* command = bar->addAction(name);
        command->setObjectName(name);
        return command;
    };
    Contents = addCommand("Contents");
    Back = addCommand("Back");
    Forward = addCommand("Forward");
    Exit = addCommand("Exit");
    connect(Contents, &QAction::triggered, this, [] { Help::ShowPage(); });
    connect(Back, &QAction::triggered, WebBrowser, &QTextBrowser::backward);
    connect(Forward, &QAction::triggered, WebBrowser, &QTextBrowser::forward);
    connect(Exit, &QAction::triggered, this, [] { Help::Hide(); });
    FillBelow(bar, WebBrowser);
    resize(Twips(ClientWidth), Twips(ClientHeight) + bar->heightForWidth(Twips(ClientWidth)));
}

// Closed by its title bar the window goes with its history.
void HelpBrowser::closeEvent(QCloseEvent* event) {
    event->accept();
    HideWindow(*this);
    Windows::Discard<HelpBrowser>();
}
