#include "support/program_fixture.h"

#include <QAbstractItemView>
#include <QAction>
#include <QApplication>
#include <QClipboard>
#include <QTest>
#include <QTimer>
#include <QTimerEvent>
#include <stdexcept>

#include "app/main_window_events.h"
#include "app/shutdown.h"
#include "main_window/main_window.h"
#include "platform/platform.h"
#include "state/windows.h"

namespace {

// A desktop brings a window that is clicked to the front; there is none here.
void Activate(QWidget& window) {
    QCoreApplication::processEvents();  // what the program still does about its windows
    window.activateWindow();
    if (!QTest::qWaitForWindowActive(&window)) throw std::logic_error("not in front");
}

QWidget* Focus() {
    const auto given = [] { return QApplication::focusWidget() != nullptr; };
    if (!QTest::qWaitFor(given, 2000)) throw std::logic_error("nothing has the focus");
    return QApplication::focusWidget();
}

}  // namespace

ProgramFixture::~ProgramFixture() {
    boxes_.verify();
    endProgram();
}

void ProgramFixture::endProgram() {
    App::DestroyWindows();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void ProgramFixture::relaunch() {
    endProgram();
    resetProcess();
    launch();
}

void ProgramFixture::launch() {
    Platform::UseDesktop();
    useTestDesktop();
    Main& window = App::LoadMainWindow();
    EXPECT_EQ(clock().interval(), 1000);
    clock().setInterval(3'600'000);
    window.show();
    bringToFront("Main");
}

void ProgramFixture::start(const std::string& board) {
    shakeNext(board);
    press("Start");
}

void ProgramFixture::clickOn(const QWidget& widget, const QPoint& place, Qt::MouseButton button) {
    QWidget* window = widget.window();
    if (QApplication::activeModalWidget() == nullptr) Activate(*window);
    QTest::mouseClick(window->windowHandle(), button, {}, widget.mapTo(window, place));
}

void ProgramFixture::press(const std::string& button) {
    clickOn(*control(button), control(button)->rect().center(), Qt::LeftButton);
}

void ProgramFixture::type(const std::string& text) {
    for (const char32_t letter : QString::fromStdString(text).toStdU32String()) {
        QTest::sendKeyEvent(QTest::Click, Focus(), Qt::Key_unknown, QString::fromUcs4(&letter, 1),
                            Qt::NoModifier);
    }
}

void ProgramFixture::key(Qt::Key key, Qt::KeyboardModifiers modifiers) {
    QTest::keyClick(Focus(), key, modifiers);
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

void ProgramFixture::click(int tile, Qt::MouseButton button) {
    const QWidget& clicked = *control("Cube" + std::to_string(tile));
    clickOn(clicked, clicked.rect().center(), button);
}

void ProgramFixture::clickTiles(const Tiles& tiles) {
    for (const int tile : tiles) click(tile);
}

void ProgramFixture::doubleClick(int tile) {
    QWidget* clicked = control("Cube" + std::to_string(tile));
    const QPoint place = clicked->mapTo(clicked->window(), clicked->rect().center());
    QTest::mouseDClick(clicked->window()->windowHandle(), Qt::LeftButton, {}, place);
}

void ProgramFixture::select(const std::string& list, const std::string& word) {
    QAbstractItemView& shown = view(list);
    const auto found = shown.model()->match(shown.model()->index(0, 0), Qt::DisplayRole,
                                            QString::fromStdString(word), 1, Qt::MatchExactly);
    if (found.isEmpty()) throw std::logic_error(list + " has no " + word);
    shown.scrollTo(found.first());
    clickOn(*shown.viewport(), shown.visualRect(found.first()).center(), Qt::LeftButton);
}

void ProgramFixture::menu(const std::string& command) {
    const auto slash = command.find('/');
    const auto name = QString::fromStdString(command.substr(slash + 1));
    control(command.substr(0, slash))->findChild<QAction*>(name)->trigger();
}

void ProgramFixture::bringToFront(const std::string& window) {
    Activate(*control(window)->window());
}

bool ProgramFixture::comesToFront(const std::string& window) {
    return QTest::qWaitForWindowActive(control(window), 2000);
}

void ProgramFixture::closeByTitleBar(const std::string& window) {
    control(window)->close();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void ProgramFixture::tick(int times) {
    for (int i = 0; i < times && clock().isActive(); ++i) {
        QTimerEvent event(clock().timerId());
        QCoreApplication::sendEvent(&clock(), &event);
    }
}

QTimer& ProgramFixture::clock() {
    auto* found = control("Main")->findChild<QTimer*>("GameClock");
    if (found == nullptr) throw std::logic_error("no clock");
    return *found;
}

QWidget* ProgramFixture::find(const std::string& name) {
    const auto slash = name.find('/');
    const QString window =
        QString::fromStdString(slash == name.npos ? "Main" : name.substr(0, slash));
    const QString wanted = QString::fromStdString(name.substr(slash + 1));
    QWidget* elsewhere = nullptr;
    for (QWidget* top : QApplication::topLevelWidgets()) {
        if (top->objectName() == wanted) return top;
        auto* found = top->findChild<QWidget*>(wanted);
        if (found == nullptr) continue;
        if (top->objectName() == window) return found;
        if (slash == name.npos) elsewhere = found;
    }
    return elsewhere;
}

QWidget* ProgramFixture::control(const std::string& name) {
    QWidget* found = find(name);
    if (found == nullptr) throw std::logic_error("no control " + name);
    return found;
}

bool ProgramFixture::isShown(const std::string& window) {
    const QWidget* found = find(window);
    return found != nullptr && found->isVisible();
}

std::string ProgramFixture::text(const std::string& name) {
    const QVariant text = control(name)->property("text");
    if (!text.isValid()) throw std::logic_error("no text on " + name);
    return text.toString().toStdString();
}

std::string ProgramFixture::entry() {
    std::string all = typed() + " [";
    for (const int tile : litTiles()) all += std::to_string(tile) + " ";
    if (all.back() == ' ') all.pop_back();
    return all + "] " + std::to_string(warnings_);
}

std::string ProgramFixture::summary() {
    return text("WordsLabel") + "; " + text("ScoreLabel") + "; " + text("BadWordsLabel");
}

std::string ProgramFixture::letters(const std::string& tiles) {
    std::string all;
    for (int k = 0; k < CubeCount; ++k) {
        const QString letter = control(tiles + std::to_string(k))->accessibleName();
        all += letter.isEmpty() ? "." : letter.toStdString();
    }
    return all;
}

Words ProgramFixture::words(const std::string& list, bool struckOnly) {
    const QAbstractItemModel& model = *view(list).model();
    Words all;
    for (int row = 0; row < model.rowCount(); ++row) {
        const QModelIndex cell = model.index(row, 0);
        if (struckOnly && !cell.data(Qt::FontRole).value<QFont>().strikeOut()) continue;
        all.push_back(cell.data().toString().toStdString());
    }
    return all;
}

QAbstractItemView& ProgramFixture::view(const std::string& list) {
    auto* found = qobject_cast<QAbstractItemView*>(control(list));
    if (found == nullptr) throw std::logic_error("no list " + list);
    return *found;
}

Tiles ProgramFixture::lit(const std::string& tiles) {
    Tiles found;
    for (int k = 0; k < CubeCount; ++k) {
        if (control(tiles + std::to_string(k))->property("selected").toBool()) found.push_back(k);
    }
    return found;
}
