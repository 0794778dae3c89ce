#include "options/options_window.h"

#include <QCheckBox>
#include <QCloseEvent>
#include <QComboBox>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>

#include "options/options_commands.h"
#include "platform/layout.h"
#include "platform/screen_reader.h"
#include "platform/window_size.h"

using namespace Platform;

namespace {

constexpr int ClientWidth = 402;
constexpr int ClientHeight = 256;
constexpr double LabelPoints = 12;

QPushButton* MakeButton(OptionsDialog* window, const char* name, const char* caption,
                        TwipsRect place) {
    auto* button = new QPushButton(caption, window);
    SetUp(button, name, place, PlainFont());
    button->setFocusPolicy(Qt::TabFocus);
    button->installEventFilter(window);
    return button;
}

QComboBox* MakeBox(QWidget* window, const char* name, TwipsRect place, const char* toolTip) {
    auto* box = new QComboBox(window);
    SetUp(box, name, place, PlainFont());
    box->setToolTip(toolTip);
    return box;
}

QLabel* MakeCaption(QWidget* window, const char* name, TwipsRect place, const char* caption,
                    QWidget* box) {
    QLabel* label = MakeLabel(window, name, place, LayoutFont(Typeface::SansSerif, LabelPoints));
    label->setText(caption);
    label->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    label->setBuddy(box);
    return label;
}

// Typed text selects the entry of exactly that text, or none. To select none
// empties the box, so the text and its caret are put back.
void SelectTyped(QComboBox& box, const QString& text) {
    const int entry = box.findText(text, Qt::MatchExactly | Qt::MatchCaseSensitive);
    if (entry == box.currentIndex()) return;
    const QSignalBlocker quiet(box);
    const int caret = box.lineEdit()->cursorPosition();
    box.setCurrentIndex(entry);
    box.setEditText(text);
    box.lineEdit()->setCursorPosition(caret);
}

}  // namespace

OptionsDialog::OptionsDialog() {
    setObjectName("OptionsDialog");
    setWindowTitle("Options");
    setWindowFlags(Qt::Window | Qt::WindowTitleHint | Qt::WindowSystemMenuHint |
                   Qt::WindowCloseButtonHint);
    SetOnlySize(*this, {ClientWidth, ClientHeight});
    makeButtons();
    makeBoxes();
    makeLabels();
    setTabOrders();
    OKButton->setFocus();
}

void OptionsDialog::load() {
    Common::LoadOptions();
}

void OptionsDialog::makeButtons() {
    OKButton = MakeButton(this, "OKButton", "OK", Pixels(312, 8, 81, 25));
    CancelButton = MakeButton(this, "CancelButton", "Cancel", Pixels(312, 40, 81, 25));
    connect(OKButton, &QPushButton::clicked, this, [] { Common::ApplyOptions(); });
    connect(CancelButton, &QPushButton::clicked, this, [] { Common::CancelOptions(); });
}

void OptionsDialog::makeBoxes() {
    TimeCombo = MakeBox(this, "TimeCombo", Pixels(144, 8, 137, 21), "Time limit for each game");
    MinWordSizeCombo = MakeBox(this, "MinWordSizeCombo", Pixels(144, 48, 137, 21),
                               "Shortest word allowed in a game");
    WordSizeCombo = MakeBox(this, "WordSizeCombo", Pixels(144, 88, 137, 21),
                            "Largest word stored in dictionary and allowed in game");
    for (QComboBox* box : {MinWordSizeCombo, WordSizeCombo}) {
        TellValueOf(box, box->toolTip());
    }
    SoundsOption = new QCheckBox(this);
    SetUp(SoundsOption, "SoundsOption", Pixels(144, 128, 17, 25), PlainFont());
    SoundsOption->setToolTip("Controls game sounds");
    TimeCombo->setEditable(true);
    TimeCombo->setCompleter(nullptr);
    TimeCombo->lineEdit()->setAccessibleName("Game Time");
    TimeCombo->setInsertPolicy(QComboBox::NoInsert);
    connect(TimeCombo, &QComboBox::editTextChanged, this,
            [this](const QString& text) { SelectTyped(*TimeCombo, text); });
}

void OptionsDialog::makeLabels() {
    TimeLabel = MakeCaption(this, "TimeLabel", Pixels(8, 8, 113, 25), "Game Time", TimeCombo);
    MinWordSizeLabel = MakeCaption(this, "MinWordSizeLabel", Pixels(8, 48, 121, 25),
                                   "Min Word Size", MinWordSizeCombo);
    WordSizeLabel =
        MakeCaption(this, "WordSizeLabel", Pixels(8, 88, 121, 25), "Max Word Size", WordSizeCombo);
    SoundsLabel =
        MakeCaption(this, "SoundsLabel", Pixels(0, 128, 129, 25), "Play Sounds", SoundsOption);
}

void OptionsDialog::setTabOrders() {
    setTabOrder(OKButton, CancelButton);
    setTabOrder(CancelButton, TimeCombo);
    setTabOrder(TimeCombo, WordSizeCombo);
    setTabOrder(WordSizeCombo, SoundsOption);
    setTabOrder(SoundsOption, MinWordSizeCombo);
}

void OptionsDialog::closeEvent(QCloseEvent* event) {
    Common::CancelOptions();
    event->accept();
}

// Return presses no button here, not even the focused one, which some desktops
// would have it do.
bool OptionsDialog::eventFilter(QObject* receiver, QEvent* event) {
    if (event->type() != QEvent::KeyPress) return QWidget::eventFilter(receiver, event);
    const int key = static_cast<QKeyEvent*>(event)->key();
    return key == Qt::Key_Return || key == Qt::Key_Enter;
}
