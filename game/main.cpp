#include <QApplication>
#include <QIcon>
#include <QScreen>

#include "game/main_window.h"
#include "game/windows.h"
#include "platform/platform.h"
#include "platform/session_end.h"

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
    QIcon icon;
    for (const char* size : {"48", "128"}) icon.addFile(QString(":/quorle-%1.png").arg(size));
    QApplication::setWindowIcon(icon);
    Platform::UseDesktop();
    Main& window = Windows::Shared<Main>();
    CentreOnScreen(window);
    FollowSessionEnd([&window] { window.close(); });
    window.show();
    const int result = QApplication::exec();
    Windows::DestroyAll();
    return result;
}
