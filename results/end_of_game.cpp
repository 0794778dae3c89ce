#include "results/end_of_game.h"

#include <quorle/word_engine.h>

#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QTableWidget>
#include <QTimer>
#include <array>

#include "dictionary/dictionary.h"
#include "dictionary/listing.h"
#include "main_window/main_window.h"
#include "platform/platform.h"
#include "results/result_lists.h"
#include "results/results_window.h"
#include "results/scoring.h"
#include "state/game_state.h"
#include "state/windows.h"

using namespace GameResults;

namespace {

// One letter a cube in board order, the Qu cube as "q".
std::string BoardString() {
    std::string board;
    for (std::size_t k = 0; k < CubeCount; ++k) {
        board += State.BoardGrid[k / BoardSize][k % BoardSize].substr(0, 1);
    }
    return board;
}

void CloseWordEntry(Main& window) {
    window.GameClock->stop();
    window.NewWord->clear();
    if (window.focusWidget() == window.NewWord) window.WordList->setFocus();
    window.NewWord->setEnabled(false);
}

// The dictionary of this moment decides, not that of the word's submission.
void SortPlayersWords(const QTableWidget& entered, Results& results) {
    for (int row = 0; row < entered.rowCount(); ++row) {
        const QString word = entered.item(row, 0)->text();
        const bool known = Dictionary::IsInDictionary(word.toStdString());
        AddWord(known ? *results.UserWords : *results.BadWords, word);
    }
}

void ListComputerWords(Results& results) {
    results.DictWords->setUpdatesEnabled(false);
    for (std::int32_t i = 0; i < State.ComputerWordCount; ++i) {
        std::array<char, LongestWord> buffer{};
        std::int32_t length = 0;
        cGetDefinedWord(i, buffer.data(), &length);
        AddWord(*results.DictWords, QString::fromLatin1(buffer.data(), length));
    }
    results.DictWords->setUpdatesEnabled(true);
    Common::UpdateResultLabels();
}

void ShowResultBoard(Results& results) {
    for (std::size_t k = 0; k < CubeCount; ++k) {
        const std::string& cell = State.BoardGrid[k / BoardSize][k % BoardSize];
        const QString letter =
            cell == "qu" ? QString("Qu") : QString::fromStdString(cell).toUpper();
        results.ResultCubes[k]->setText(letter);
        results.ResultCubes[k]->setAccessibleName(letter);
        LightResultCube(*results.ResultCubes[k], k, false);
    }
}

}  // namespace

namespace Common {

void SolveBoard() {
    State.ComputerWordCount = cCheckForAllDefinedWords(BoardString().c_str());
}

void EndGame(const char* why) {
    State.TimeRemaining = 0;
    Main& window = Windows::Shared<Main>();
    CloseWordEntry(window);
    window.SetTimeLabels("Game Over", QString());
    Results& results = Windows::Shared<Results>();
    SortPlayersWords(*window.WordList, results);
    ListComputerWords(results);
    State.ResultsShownAt = Platform::SteadySeconds();
    ShowResultBoard(results);
    results.placeBeside(window);
    results.ResultsOK->setAccessibleDescription(why + (". " + SummaryText()));
    results.ResultsOK->setFocus();
    Dictionary::ShowWaitingEditor();
    Platform::FloatWindow(results);
    Platform::BringToFront(results);
    UpdateResultLabels();
}

void UpdateResultLabels() {
    Results& results = Windows::Shared<Results>();
    const Tally player = TallyOf(*results.UserWords);
    const Tally computer = TallyOf(*results.DictWords);
    const Tally bad = TallyOf(*results.BadWords);
    results.WordsLabel->setText(QString::fromStdString(WordsLine(player, computer)));
    results.ScoreLabel->setText(QString::fromStdString(ScoreLine(player, computer)));
    results.BadWordsLabel->setText(QString::fromStdString(BadWordsLine(bad.words)));
    results.update();
}

}  // namespace Common

QString GameResults::SummaryText() {
    const Results& results = Windows::Shared<Results>();
    return results.WordsLabel->text() + ". " + results.ScoreLabel->text() + ". " +
           results.BadWordsLabel->text();
}
