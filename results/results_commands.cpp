#include "results/results_commands.h"

#include <QLabel>
#include <QListWidget>
#include <QSignalBlocker>
#include <QTableWidget>
#include <algorithm>

#include "dictionary/dictionary.h"
#include "entry/check_cubes.h"
#include "main_window/main_window.h"
#include "platform/platform.h"
#include "results/end_of_game.h"
#include "results/result_lists.h"
#include "results/results_window.h"
#include "state/game_state.h"
#include "state/windows.h"

using namespace GameResults;

namespace {

constexpr double ShortestShowing = 2;  // seconds

void SelectWord(QListWidget& list, int index) {
    list.setCurrentRow(index, QItemSelectionModel::ClearAndSelect);
}

// A word that the player never entered goes back to the computer's list alone.
void AddWhereEntered(QListWidget& userWords, const QTableWidget& entered, const QString& word) {
    for (int row = 0; row < entered.rowCount(); ++row) {
        if (entered.item(row, 0)->text() == word) AddWord(userWords, word);
    }
}

void TellCorrection(const QString& word, const char* what) {
    Platform::Tell(QString("%1 %2. %3").arg(word, what, SummaryText()).toStdString());
}

}  // namespace

namespace Common {

void ShowResultPath(const QString& word) {
    CheckCubes::IsOnBoard(word.toStdString());
    const Results& results = Windows::Shared<Results>();
    for (std::size_t k = 0; k < CubeCount; ++k) {
        LightResultCube(*results.ResultCubes[k], k, State.TracedPath[k / BoardSize][k % BoardSize]);
    }
}

void AcceptBadWord() {
    Results& results = Windows::Shared<Results>();
    QListWidget& bad = *results.BadWords;
    const int index = SelectedIndex(bad);
    if (index < 0) {
        Platform::ShowMessage("You must select a word in the 'bad' list first",
                              Platform::ProgramTitle);
        return;
    }
    const QString word = SelectedWord(bad);
    Dictionary::AddToDictionary(word.toStdString());
    TakeWord(bad, index);
    if (bad.count() > 0) SelectWord(bad, std::min(index, bad.count() - 1));
    AddWhereEntered(*results.UserWords, *Windows::Shared<Main>().WordList, word);
    AddWord(*results.DictWords, word);
    UpdateResultLabels();
    TellCorrection(word, "added");
}

void RejectDictWord() {
    Results& results = Windows::Shared<Results>();
    const int index = SelectedIndex(*results.DictWords);
    if (index < 0) {
        Platform::ShowMessage("You must select a word in the 'dictionary' list first",
                              Platform::ProgramTitle);
        return;
    }
    const QString word = SelectedWord(*results.DictWords);
    Dictionary::RemoveFromDictionary(word.toStdString());
    const int found = IndexOf(*results.UserWords, word);
    if (found >= 0) TakeWord(*results.UserWords, found);
    AddWord(*results.BadWords, word);
    TakeWord(*results.DictWords, index);
    UpdateResultLabels();
    TellCorrection(word, "removed");
}

void CloseResults() {
    if (Platform::SteadySeconds() - State.ResultsShownAt <= ShortestShowing) return;
    Results& results = Windows::Shared<Results>();
    Platform::HideWindow(results);
    for (QListWidget* list : {results.UserWords, results.BadWords, results.DictWords}) {
        const QSignalBlocker quiet(list);
        list->clear();
    }
    for (QLabel* label : {results.WordsLabel, results.ScoreLabel, results.BadWordsLabel}) {
        label->clear();
    }
    Windows::Shared<Main>().update();
}

}  // namespace Common
