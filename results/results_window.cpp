#include "results/results_window.h"

#include <QCloseEvent>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QScreen>
#include <QStyle>
#include <QStyleFactory>
#include <QTimer>

#include "platform/layout.h"
#include "platform/list_keys.h"
#include "results/result_lists.h"
#include "results/results_commands.h"
#include "state/windows.h"

using namespace GameResults;
using namespace Platform;

namespace {

constexpr int ClientWidth = 632;
constexpr int ClientHeight = 562;
constexpr int CubePitch = 32;
constexpr int CubeSide = 33;

QFont HeadingFont() {
    return LayoutFont(Typeface::SansSerif, 13.5);
}
QFont SummaryFont() {
    return LayoutFont(Typeface::SansSerif, 18);
}
QFont ArrowFont() {
    return LayoutFont(Typeface::SansSerif, 24);
}
QFont CubeFont() {
    return LayoutFont(Typeface::Courier, 20.25, true);
}

QListWidget* MakeList(Results* window, const char* name, const char* spokenName, TwipsRect place,
                      const QFont& font) {
    auto* list = new QListWidget(window);
    SetUp(list, name, place, font);
    list->setAccessibleName(spokenName);
    list->setSortingEnabled(true);
    list->setUniformItemSizes(true);
    list->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    SelectByArrowKeys(list);
    const auto showPath = [list] {
        const QString word = SelectedWord(*list);
        if (word.isEmpty()) return;
        Common::ShowResultPath(word);
        DescribePlaces(*list);
    };
    QObject::connect(list, &QListWidget::itemSelectionChanged, window, showPath);
    QObject::connect(list, &QListWidget::itemClicked, window, showPath);
    return list;
}

QPushButton* MakeButton(QWidget* window, const char* name, const char* caption, TwipsRect place,
                        const QFont& font) {
    auto* button = new QPushButton(caption, window);
    SetUp(button, name, place, font);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

void Colour(QPushButton* button, const QColor& background) {
    QPalette palette = button->palette();
    palette.setColor(QPalette::Button, background);
    palette.setColor(QPalette::ButtonText, Qt::black);
    button->setPalette(palette);
}

// Not every desktop's style heeds a button's own colour; this one does.
void UseFusion(QPushButton* button) {
    QStyle* style = QStyleFactory::create("Fusion");
    style->setParent(button);
    button->setStyle(style);
}

}  // namespace

Results::Results() {
    setObjectName("Results");
    setWindowTitle("Gorvat Results");
    resize(ClientWidth, ClientHeight);
    makeLists();
    makeButtons();
    setTabOrders();
    makeBoard();
    makeSummary();
    colourControls();
    SetDefaultButton(this, ResultsOK);
    ResultsOK->setFocus();
}

void Results::makeLists() {
    UserWordsLabel = MakeLabel(this, "UserWordsLabel", Pixels(16, 8, 209, 25), HeadingFont());
    UserWordsLabel->setText("Your Words");
    DictWordsLabel = MakeLabel(this, "DictWordsLabel", Pixels(400, 8, 209, 25), HeadingFont());
    DictWordsLabel->setText("Quorle's Words");
    QFont struck = WordFont();
    struck.setStrikeOut(true);
    UserWords = MakeList(this, "UserWords", "Your words", Pixels(16, 40, 209, 284), WordFont());
    BadWords = MakeList(this, "BadWords", "Not in dictionary", Pixels(16, 328, 209, 85), struck);
    DictWords =
        MakeList(this, "DictWords", "Quorle's words", Pixels(400, 40, 209, 372), WordFont());
}

void Results::makeButtons() {
    ResultsOK = MakeButton(this, "ResultsOK", "OK", Pixels(280, 8, 65, 41), HeadingFont());
    AddToDict = MakeButton(this, "AddToDict", "=>", Pixels(280, 328, 65, 41), ArrowFont());
    RemoveFromDict =
        MakeButton(this, "RemoveFromDict", "<=", Pixels(280, 376, 65, 41), ArrowFont());
    UseFusion(AddToDict);
    UseFusion(RemoveFromDict);
    AddToDict->setAccessibleName("Add to dictionary");
    RemoveFromDict->setAccessibleName("Remove from dictionary");
    ResultsOK->setShortcut(Qt::ALT | Qt::Key_O);
    AddToDict->setShortcut(Qt::ALT | Qt::Key_A);
    RemoveFromDict->setShortcut(Qt::ALT | Qt::Key_R);
    connect(ResultsOK, &QPushButton::clicked, this, [] { Common::CloseResults(); });
    connect(AddToDict, &QPushButton::clicked, this, [] { Common::AcceptBadWord(); });
    connect(RemoveFromDict, &QPushButton::clicked, this, [] { Common::RejectDictWord(); });
}

void Results::setTabOrders() {
    setTabOrder(ResultsOK, UserWords);
    setTabOrder(UserWords, BadWords);
    setTabOrder(BadWords, AddToDict);
    setTabOrder(AddToDict, DictWords);
    setTabOrder(DictWords, RemoveFromDict);
}

void Results::makeBoard() {
    for (int k = 0; k < 16; ++k) {
        const QByteArray name = "ResultCubes" + QByteArray::number(k);
        auto* cube = MakeLabel(
            this, name.constData(),
            Pixels(16 + CubePitch * (k % 4), 424 + CubePitch * (k / 4), CubeSide, CubeSide),
            Condensed(CubeFont(), "Qu", CubeSide - 4));
        cube->setFrameStyle(QFrame::Box | QFrame::Plain);
        cube->setAutoFillBackground(true);
        ResultCubes[static_cast<std::size_t>(k)] = cube;
    }
}

void Results::makeSummary() {
    WordsLabel = MakeLabel(this, "WordsLabel", Pixels(160, 432, 457, 33), SummaryFont());
    ScoreLabel = MakeLabel(this, "ScoreLabel", Pixels(160, 472, 457, 33), SummaryFont());
    BadWordsLabel = MakeLabel(this, "BadWordsLabel", Pixels(160, 512, 457, 33), SummaryFont());
    for (QLabel* line : {WordsLabel, ScoreLabel, BadWordsLabel}) {
        line->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    }
}

void Results::colourControls() {
    Colour(AddToDict, QColor(128, 255, 128));
    Colour(RemoveFromDict, QColor(255, 128, 128));
    for (std::size_t k = 0; k < ResultCubes.size(); ++k) {
        LightResultCube(*ResultCubes[k], k, ResultCubes[k]->property("selected").toBool());
    }
}

void Results::placeBeside(const QWidget& window) {
    if (placed_) return;
    placed_ = true;
    const QRect main = window.frameGeometry();
    const QRect screen = window.screen()->availableGeometry();
    // This window's frame is not known before it is shown; it will be like the other's.
    const QSize frame = main.size() - window.size() + size();
    QPoint corner = main.center() - QRect(QPoint(0, 0), frame).center();
    if (main.right() + frame.width() <= screen.right()) {
        corner = {main.right() + 1, main.top()};
    } else if (main.left() - frame.width() >= screen.left()) {
        corner = {main.left() - frame.width(), main.top()};
    }
    const QPoint last(screen.right() + 1 - frame.width(), screen.bottom() + 1 - frame.height());
    move(qMax(screen.left(), qMin(corner.x(), last.x())),
         qMax(screen.top(), qMin(corner.y(), last.y())));
}

// Closed by its title bar the window goes with all it holds; the next game's end
// makes it anew.
void Results::closeEvent(QCloseEvent* event) {
    event->accept();
    HideWindow(*this);
    Windows::Discard<Results>();
}

// Some desktops give every control a new palette when their colours change, also
// one that has colours of its own; these are given back when all is done.
void Results::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) {
        QTimer::singleShot(0, this, &Results::colourControls);
    }
}
