#include <QApplication>
#include <QIcon>
#include <QScreen>

#include "game/main_window.h"
#include "game/windows.h"
#include "platform/platform.h"

namespace {

void CentreOnScreen(QWidget& window) {
    const QRect screen = window.screen()->availableGeometry();
    window.move(screen.center() - QRect(QPoint(0, 0), window.size()).center());
}

}  // namespace

int main(int argc, char** argv) {
    QApplication application(argc, argv);
    QApplication::setApplicationName("quorle");
    QApplication::setDesktopFileName("quorle");
    // Hiding the last window shown must not end the program; closing Main does.
    QApplication::setQuitOnLastWindowClosed(false);
    Platform::UseDesktop();
    Main& window = Windows::Shared<Main>();
    CentreOnScreen(window);
    window.show();
    const int result = QApplication::exec();
    Windows::DestroyAll();
    return result;
}
