#include "main_window/main_window.h"

#include <QCloseEvent>
#include <QCoreApplication>
#include <QFrame>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QShortcut>
#include <QTableWidget>
#include <QTimer>
#include <QToolButton>

#include "main_window/cube_tile.h"
#include "main_window/tile_accessible.h"
#include "main_window/tile_picture.h"
#include "main_window/toolbar_pictures.h"
#include "platform/layout.h"
#include "platform/platform.h"
#include "platform/window_accessible.h"
#include "platform/window_size.h"

using namespace MainWindow;
using namespace Platform;

namespace {

constexpr int ClientWidth = 9300;
constexpr int ClientHeight = 7710;
constexpr int ToolBarHeight = 480;
constexpr int ToolButtonWidth = 495;
constexpr int ToolButtonHeight = 435;
constexpr int ToolPictureSize = 16;
constexpr int TilePitch = 1440;
constexpr int TileSide = TileSize * TwipsPerPixel;
constexpr int FirstTileTop = 240;
constexpr int ClockInterval = 1000;

QFont MainFont() {
    return LayoutFont(Typeface::SansSerif, 18);
}
QFont SmallerFont() {
    return LayoutFont(Typeface::SansSerif, 13.5);
}

}  // namespace

Main::Main() {
    MakeWindowsAccessible();  // first: the toolkit keeps what it made of a window once
    setObjectName("Main");
    setWindowTitle(ProgramTitle);
    setWindowFlags(Qt::Window | Qt::WindowTitleHint | Qt::WindowSystemMenuHint |
                   Qt::WindowMinimizeButtonHint | Qt::WindowCloseButtonHint);
    SetOnlySize(*this, {Twips(ClientWidth), Twips(ClientHeight)});
    makeToolBar();
    makeBoard();
    makeWordEntry();
    makeLabels();
    makeWordList();
    setPictures();
    SetDefaultButton(this, Enter);
    // A key that text boxes, desktops and screen readers leave alone.
    TellKey = new QShortcut(Qt::Key_F2, this);

    GameClock = new QTimer(this);
    GameClock->setObjectName("GameClock");
    GameClock->setTimerType(Qt::PreciseTimer);
    GameClock->setInterval(ClockInterval);
}

void Main::makeToolBar() {
    ToolBar = new QWidget(this);
    SetUp(ToolBar, "ToolBar", {0, 0, ClientWidth, ToolBarHeight}, MainFont());
    Start = makeToolButton("Start", 0, "Start game", Qt::Key_S);
    Pause = makeToolButton("Pause", 480, "Pause game", Qt::Key_P);
    End = makeToolButton("End", 960, "End game", Qt::Key_E);
    Options = makeToolButton("Options", 1800, "Options", Qt::Key_O);
    Dictionary = makeToolButton("Dictionary", 2280, "Dictionary editor", Qt::Key_D);
    HelpButton = makeToolButton("HelpButton", 3120, "", Qt::Key_H);
    Exit = makeToolButton("Exit", 3960, "Exit game", Qt::Key_X);
    HelpButton->setText("?");  // drops the shortcut
    HelpButton->setShortcut(Qt::ALT | Qt::Key_H);
    HelpButton->setAccessibleName("Help");
}

QToolButton* Main::makeToolButton(const char* name, int left, const char* toolTip, Qt::Key altKey) {
    auto* button = new QToolButton(ToolBar);
    SetUp(button, name, {left, 15, ToolButtonWidth, ToolButtonHeight}, MainFont());
    button->setToolTip(toolTip);
    button->setAccessibleName(toolTip);
    button->setIconSize({ToolPictureSize, ToolPictureSize});
    button->setShortcut(Qt::ALT | altKey);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

void Main::setPictures() {
    Start->setIcon(ToolbarIcon(ToolbarPicture::Start, palette()));
    Pause->setIcon(ToolbarIcon(ToolbarPicture::Pause, palette()));
    End->setIcon(ToolbarIcon(ToolbarPicture::End, palette()));
    Options->setIcon(ToolbarIcon(ToolbarPicture::Options, palette()));
    Dictionary->setIcon(ToolbarIcon(ToolbarPicture::Dictionary, palette()));
    Exit->setIcon(ToolbarIcon(ToolbarPicture::Exit, palette()));
}

void Main::makeBoard() {
    MakeTilesAccessible();
    CubeFrame = new QFrame(this);
    SetUp(CubeFrame, "CubeFrame", {120, 480, 5775, 6015}, MainFont());
    CubeFrame->setAccessibleName("Board");
    for (int k = 0; k < 16; ++k) {
        auto* tile = new CubeTile(CubeFrame);
        const QByteArray name = "Cube" + QByteArray::number(k);
        SetUp(tile, name.constData(),
              {TilePitch * (k % 4), FirstTileTop + TilePitch * (k / 4), TileSide, TileSide},
              LayoutFont(Typeface::Courier, 48));
        tile->setAccessibleDescription(QString("Row %1, column %2").arg(k / 4 + 1).arg(k % 4 + 1));
        Cube[static_cast<std::size_t>(k)] = tile;
    }
}

void Main::makeWordEntry() {
    NewWord = new QLineEdit(this);
    SetUp(NewWord, "NewWord", {120, 6960, 3735, 615}, WordFont());
    NewWord->setEnabled(false);
    NewWord->setAccessibleName("New word");

    Enter = new QPushButton("Enter", this);
    SetUp(Enter, "Enter", {3960, 6960, 975, 615}, SmallerFont());
    Enter->setFocusPolicy(Qt::TabFocus);

    Clear = new QPushButton("Clear", this);
    SetUp(Clear, "Clear", {5040, 6960, 855, 615}, SmallerFont());
    Clear->setFocusPolicy(Qt::TabFocus);
    Clear->setShortcut(Qt::ALT | Qt::Key_C);
}

void Main::makeLabels() {
    TimeRemLabel = MakeLabel(this, "TimeRemLabel", {6120, 600, 3015, 495}, MainFont());
    TimeLeft =
        MakeLabel(this, "TimeLeft", {6240, 1200, 2775, 735}, LayoutFont(Typeface::Arial, 30));
    PlayerWordLabel = MakeLabel(this, "PlayerWordLabel", {6000, 6360, 3255, 495}, SmallerFont());
    DefinedWordCount = MakeLabel(this, "DefinedWordCount", {6120, 6960, 3015, 375}, SmallerFont());
}

void Main::makeWordList() {
    WordList = new QTableWidget(this);
    SetUp(WordList, "WordList", {6120, 2160, 3015, 4095}, WordFont());
    WordList->setAccessibleName("Your words");
    WordList->horizontalHeader()->hide();
    WordList->verticalHeader()->hide();
    WordList->setColumnCount(1);
    WordList->setHorizontalHeaderLabels({"Word"});
    WordList->setEditTriggers(QTableWidget::NoEditTriggers);
    WordList->setSelectionMode(QTableWidget::SingleSelection);
    WordList->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    WordList->setTabKeyNavigation(false);
    WordList->setShowGrid(false);
}

void Main::SetTimeLabels(const QString& caption, const QString& value) {
    TimeRemLabel->setText(caption);
    TimeLeft->setText(value);
}

// A running game is dropped; the window manager, Alt+F4 and Exit all come here.
void Main::closeEvent(QCloseEvent* event) {
    emit closing();
    event->accept();
    QCoreApplication::quit();
}

void Main::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange && Exit != nullptr) setPictures();
}
