#include "entry/submission.h"

#include <quorle/word_engine.h>

#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalBlocker>
#include <QTableWidget>

#include "board/draw_cubes.h"
#include "dictionary/dictionary.h"
#include "entry/check_cubes.h"
#include "entry/typed_text.h"
#include "entry/word_entry.h"
#include "main_window/main_window.h"
#include "platform/layout.h"
#include "platform/platform.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

bool IsEntered(const QTableWidget& list, const QString& word) {
    for (int row = 0; row < list.rowCount(); ++row) {
        if (list.item(row, 0)->text() == word) return true;
    }
    return false;
}

void ListWord(Main& window, const std::string& word) {
    QTableWidget& list = *window.WordList;
    const QString text = QString::fromStdString(word);
    list.insertRow(0);
    auto* cell = new QTableWidgetItem(text);
    QFont font = Platform::Condensed(Platform::WordFont(), text, Platform::RowTextWidth(list));
    const bool known = Dictionary::IsInDictionary(word);
    if (!known) {
        font.setStrikeOut(true);
        cell->setData(Qt::AccessibleDescriptionRole, "not in dictionary");
        Entry::PlayWarning();
    }
    cell->setFont(font);
    list.setItem(0, 0, cell);
    {
        // A screen reader would follow the current cell away from the text box.
        const QSignalBlocker quiet(list.selectionModel());
        list.setCurrentCell(0, 0, QItemSelectionModel::NoUpdate);
    }
    list.scrollToTop();
    const int count = list.rowCount();
    window.PlayerWordLabel->setText(count == 1 ? QString("1 word entered")
                                               : QString("%1 words entered").arg(count));
    Platform::Tell((known ? "right. " : "not in dictionary. ") +
                   window.PlayerWordLabel->text().toStdString());
}

void EmptyNewWord(Main& window) {
    window.NewWord->clear();
    Common::DrawAllCubesNormal();
}

}  // namespace

void Entry::Submit() {
    if (State.TimeRemaining == 0) return;
    Main& window = Windows::Shared<Main>();
    const std::string word = LowerCase(window.NewWord->text().toStdString());
    State.PickedWord.clear();
    State.PickedCount = 0;
    const auto length = static_cast<std::int32_t>(word.size());
    if (length < cMinWordSize()) return Platform::Tell("too short");
    if (length > cMaxWordSize()) {
        Platform::Tell("too long");
        EmptyNewWord(window);
        return;
    }
    if (CheckCubes::IsOnBoard(word)) {
        if (IsEntered(*window.WordList, QString::fromStdString(word))) {
            Platform::Tell("already listed");
            EmptyNewWord(window);
            return;
        }
        ListWord(window, word);
    }
    window.NewWord->clear();
    window.NewWord->setFocus();
    Platform::SetDefaultButton(&window, window.Enter);
    Common::DrawAllCubesNormal();
}
