#include "dictionary/editor_window.h"

#include <QApplication>
#include <QCloseEvent>
#include <QComboBox>
#include <QLabel>
#include <QLayout>
#include <QLineEdit>
#include <QListView>
#include <QPushButton>
#include <QStringListModel>
#include <QWindow>

#include "dictionary/editor_commands.h"
#include "dictionary/listing.h"
#include "dictionary/merge.h"
#include "main_window/main_window.h"
#include "platform/layout.h"
#include "platform/list_keys.h"
#include "platform/menu_bar.h"
#include "platform/screen_reader.h"
#include "platform/window_size.h"
#include "state/game_rules.h"
#include "state/windows.h"

using namespace Platform;

namespace {

constexpr int ClientWidth = 5910;
constexpr int ClientHeight = 7470;
constexpr int PrefixesInView = 16;

QFont ButtonFont() {
    return LayoutFont(Typeface::SansSerif, 13.5);
}

QPushButton* MakeButton(QWidget* parent, const char* name, TwipsRect place, Qt::Key altKey) {
    auto* button = new QPushButton(name, parent);
    SetUp(button, name, place, ButtonFont());
    button->setFocusPolicy(Qt::TabFocus);
    button->setShortcut(Qt::ALT | altKey);
    return button;
}

// The longest word fits beside the scroll bar, however wide the desktop has it.
QFont FontForWords(const QListView& list) {
    return Condensed(list.font(), QString(LongestWord, 'm'), RowTextWidth(list));
}

}  // namespace

DictionaryEditor::DictionaryEditor()
    : QWidget(&Windows::Shared<Main>(), Qt::Window | Qt::WindowTitleHint |
                                            Qt::WindowSystemMenuHint | Qt::WindowCloseButtonHint),
      client_(new QWidget(this)) {
    setObjectName("DictionaryEditor");
    setWindowTitle("Dictionary Editor");
    client_->setMinimumSize(Twips(ClientWidth), Twips(ClientHeight));
    makeMenu();
    makeLists();
    makeWordEntry();
    // Later, when it is known which of our windows is in front.
    connect(
        qApp, &QGuiApplication::focusWindowChanged, this, [] { Dictionary::ShowWaitingEditor(); },
        Qt::QueuedConnection);
}

void DictionaryEditor::makeMenu() {
    QMenuBar* bar = MakeMenuBar(this);
    File = bar->addMenu("File");
    File->setObjectName("File");
    File->setFont(bar->font());
    const auto addCommand = [this](const char* name, const char* caption, void (*command)()) {
        QAction* action = File->addAction(caption);
        action->setObjectName(name);
        connect(action, &QAction::triggered, this, [command] { command(); });
        return action;
    };
    Clear = addCommand("Clear", "Clear", Dictionary::ClearDictionary);
    Merge = addCommand("Merge", "Merge", Dictionary::StartMerge);
    SaveAs = addCommand("SaveAs", "Save As", Dictionary::SaveAsText);
    Exit = addCommand("Exit", "Exit", Dictionary::LeaveEditor);
    FillBelow(bar, client_);
    SetOnlySize(*layout());
}

void DictionaryEditor::makeLists() {
    StartingLetters = new QComboBox(client_);
    SetUp(StartingLetters, "StartingLetters", {120, 120, 3855, 540}, WordFont());
    TellValueOf(StartingLetters, "Starting letters");
    StartingLetters->setMaxVisibleItems(PrefixesInView);
    connect(StartingLetters, &QComboBox::currentIndexChanged, this,
            [] { Dictionary::ListWords(); });
    // Choosing the same prefix again changes nothing in the box, but the words may be others.
    connect(StartingLetters, &QComboBox::activated, this, [] { Dictionary::ListWords(); });

    WordCount = MakeLabel(client_, "WordCount", {4080, 240, 1815, 255},
                          LayoutFont(Typeface::SansSerif, 12));
    Remove = MakeButton(client_, "Remove", {4320, 720, 1335, 375}, Qt::Key_R);
    connect(Remove, &QPushButton::clicked, this, [] { Dictionary::RemoveSelectedWord(); });

    Words = new QStringListModel(this);
    WordList = new QListView(client_);
    SetUp(WordList, "WordList", {120, 720, 3855, 5730}, WordFont());
    WordList->setFont(FontForWords(*WordList));
    WordList->setAccessibleName("Words");
    WordList->setModel(Words);
    WordList->setUniformItemSizes(true);
    WordList->setEditTriggers(QListView::NoEditTriggers);
    WordList->setSelectionMode(QListView::SingleSelection);
    WordList->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    SelectByArrowKeys(WordList);
    setTabOrder(WordList, Remove);
}

void DictionaryEditor::makeWordEntry() {
    NewWord = new QLineEdit(client_);
    SetUp(NewWord, "NewWord", {120, 6600, 3855, 465}, WordFont());
    NewWord->setAccessibleName("New word");
    Add = MakeButton(client_, "Add", {4320, 6600, 1335, 495}, Qt::Key_A);
    connect(Add, &QPushButton::clicked, this, [] { Dictionary::AddNewWord(); });
}

void DictionaryEditor::closeEvent(QCloseEvent* event) {
    Dictionary::LeaveEditor();
    event->accept();
}

void DictionaryEditor::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Escape) {
        Dictionary::LeaveEditor();
    } else {
        QWidget::keyPressEvent(event);
    }
}
