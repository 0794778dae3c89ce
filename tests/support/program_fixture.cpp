#include "support/program_fixture.h"

#include "app/main_window_events.h"
#include "app/shutdown.h"

// Not QTest's own wait: to it a window is active, too, when one that it owns is.
bool ProgramFixture::comesToFront(const QWidget& window) {
    return QTest::qWaitFor([&] { return QApplication::activeWindow() == &window; }, 2000);
}

// A desktop brings a window that is clicked to the front; there is none here. When a
// merge ends meanwhile and shows the editor, the player clicks again.
void ProgramFixture::activate(QWidget& window) {
    QCoreApplication::processEvents();  // what the program still does about its windows
    const bool inFront = QTest::qWaitFor([&] {
        const bool active = QApplication::activeWindow() == &window;
        if (!active) window.activateWindow();
        return active;
    });
    if (!inFront) throw std::logic_error("not in front");
}

void ProgramFixture::clickOn(const QWidget& widget, const QPoint& place) {
    QWidget* window = widget.window();
    if (QApplication::activeModalWidget() == nullptr) activate(*window);
    QTest::mouseClick(window->windowHandle(), Qt::LeftButton, {}, widget.mapTo(window, place));
}

void ProgramFixture::endProgram() {
    App::DestroyWindows();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void ProgramFixture::launch() {
    endProgram();
    resetProcess();
    Platform::UseDesktop();
    useTestDesktop();
    Main& window = App::LoadMainWindow();
    EXPECT_EQ(window.GameClock->interval(), 1000);
    window.GameClock->setInterval(3'600'000);
    window.show();
    bringToFront("Main");
}

void ProgramFixture::start(const std::string& board) {
    for (std::size_t k = 0; k < CubeCount; ++k) State.CubeFaces[k].assign(6, board.at(k));
    draws_.assign(2 * CubeCount, 0);
    press("Start");
}

void ProgramFixture::type(const std::string& text) {
    for (const char32_t letter : QString::fromStdString(text).toStdU32String()) {
        QTest::sendKeyEvent(QTest::Click, QApplication::focusWindow(), Qt::Key_unknown,
                            QString::fromUcs4(&letter, 1), Qt::NoModifier);
    }
}

void ProgramFixture::enter(const Words& entered) {
    for (const std::string& word : entered) {
        type(word);
        key(Qt::Key_Return);
    }
}

void ProgramFixture::replaceAll(const std::string& text) {
    key(Qt::Key_A, Qt::ControlModifier);
    text.empty() ? key(Qt::Key_Delete) : paste(text);
}

void ProgramFixture::paste(const std::string& text) {
    QApplication::clipboard()->setText(QString::fromStdString(text));
    key(Qt::Key_V, Qt::ControlModifier);
}

void ProgramFixture::doubleClick(int tile) {
    QWidget* clicked = control("Cube" + std::to_string(tile));
    const QPoint place = clicked->mapTo(clicked->window(), clicked->rect().center());
    QTest::mouseDClick(clicked->window()->windowHandle(), Qt::LeftButton, {}, place);
}

void ProgramFixture::select(const std::string& list, const std::string& word) {
    auto& shown = *control<QAbstractItemView>(list);
    const auto found = shown.model()->match(shown.model()->index(0, 0), Qt::DisplayRole,
                                            QString::fromStdString(word), 1, Qt::MatchExactly);
    if (found.isEmpty()) throw std::logic_error(list + " has no " + word);
    shown.scrollTo(found.first());
    clickOn(*shown.viewport(), shown.visualRect(found.first()).center());
}

void ProgramFixture::closeByTitleBar(const std::string& window) {
    control(window)->close();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void ProgramFixture::tick(int times) {
    auto& clock = *control<QTimer>("GameClock");
    for (int i = 0; i < times && clock.isActive(); ++i) {
        QMetaObject::invokeMethod(&clock, "timeout");
    }
}

std::string ProgramFixture::entry() {
    std::string lit;
    for (const int tile : litTiles()) lit += (lit.empty() ? "" : " ") + std::to_string(tile);
    return typed() + " [" + lit + "] " + std::to_string(warnings_);
}

std::string ProgramFixture::summary() {
    return text("WordsLabel") + ". " + text("ScoreLabel") + ". " + text("BadWordsLabel");
}

std::string ProgramFixture::letters(const std::string& tiles) {
    std::string all;
    for (int k = 0; k < CubeCount; ++k) {
        all += (text(tiles + std::to_string(k), "accessibleName") + '.')[0];
    }
    return all;
}

Words ProgramFixture::words(const std::string& list, bool struckOnly) {
    const QAbstractItemModel& model = *control<QAbstractItemView>(list)->model();
    Words all;
    for (int row = 0; row < model.rowCount(); ++row) {
        const QModelIndex cell = model.index(row, 0);
        if (struckOnly && !cell.data(Qt::FontRole).value<QFont>().strikeOut()) continue;
        all.push_back(cell.data().toString().toStdString());
    }
    return all;
}

Tiles ProgramFixture::litTiles(const std::string& tiles) {
    Tiles found;
    for (int k = 0; k < CubeCount; ++k) {
        if (control(tiles + std::to_string(k))->property("selected").toBool()) found.push_back(k);
    }
    return found;
}

// No test may touch the screen or the home of whoever runs it.
int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const TempFolder home;
    UseHome(home.path());
    setenv("QT_QPA_PLATFORM", "offscreen", 1);
    unsetenv("QT_SCALE_FACTOR");
    QApplication application(argc, argv);
    QApplication::setQuitOnLastWindowClosed(false);
    return RUN_ALL_TESTS();
}
