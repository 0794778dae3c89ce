#include <QApplication>
#include <QIcon>
#include <QPixmapCache>
#include <QScreen>
#include <QTimer>
#include <chrono>
#include <clocale>
#include <future>

#include "app/main_window_events.h"
#include "app/shutdown.h"
#include "main_window/main_window.h"
#include "main_window/tile_picture.h"
#include "platform/heap.h"
#include "platform/layout.h"
#include "platform/legible_style.h"
#include "platform/platform.h"
#include "platform/session_end.h"
#include "state/windows.h"

namespace {

void CentreOnScreen(QWidget& window) {
    const QRect screen = window.screen()->availableGeometry();
    window.move(screen.center() - QRect(QPoint(0, 0), window.size()).center());
}

// Left until the window is there: reading pictures would delay its first paint
// by a tenth, and the first lit tile is not wanted before the first game.
constexpr std::chrono::milliseconds AfterFirstPaint{100};

constexpr int PictureCache = 1024;  // KiB

void DrawTile(const Main& window, bool selected) {
    MainWindow::TilePicture(selected, QString(), window.devicePixelRatioF(),
                            window.palette().color(QPalette::Window));
}

void FinishWindow() {
    QIcon icon;
    for (const char* size : {"48", "128"}) icon.addFile(QString(":/quorle-%1.png").arg(size));
    QApplication::setWindowIcon(icon);
    DrawTile(Windows::Shared<Main>(), true);
    Platform::TrimHeap();
}

}  // namespace

int main(int argc, char** argv) {
    Platform::PrepareHeap();
    Platform::UseDesktop();
    // Every window made anew has its pictures cached once more; ten times this is Qt's own bound.
    QPixmapCache::setCacheLimit(PictureCache);
    std::setlocale(LC_ALL, "");  // the toolkit would while numbers are read
    std::future<void> fonts = std::async(Platform::ReadFontList);
    QApplication application(argc, argv);
    fonts.wait();
    // Before, there would be no desktop yet whose style could be asked for.
    QApplication::setStyle(new LegibleStyle(QApplication::style()));
    // The texts are English and have their places; mirrored, "=>" would point back.
    QApplication::setLayoutDirection(Qt::LeftToRight);
    QApplication::setApplicationName("quorle");
    QApplication::setDesktopFileName("quorle");
    // Hiding the last window shown must not end the program; closing Main does.
    QApplication::setQuitOnLastWindowClosed(false);
    Main& window = App::LoadMainWindow();
    CentreOnScreen(window);
    Platform::FollowSessionEnd([&window] { window.close(); });
    window.show();
    DrawTile(window, false);  // while the window manager is at work
    QTimer::singleShot(AfterFirstPaint, &window, FinishWindow);
    const int result = QApplication::exec();
    App::DestroyWindows();
    return result;
}
