#include "dictionary/merge.h"

#include <quorle/word_engine.h>

#include <QLabel>
#include <QLineEdit>
#include <QTimer>

#include "dictionary/editor_window.h"
#include "dictionary/listing.h"
#include "dictionary/progress_window.h"
#include "platform/layout.h"
#include "platform/platform.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

constexpr std::int32_t Complete = 100;
constexpr const char* NextStep = "dummy";

// Words may come in at any step: each file's at its end, others still in line.
std::int32_t Read(const char* path) {
    const std::int32_t before = cNumberOfWords();
    const std::int32_t percent = cReadTextFile(path);
    if (cNumberOfWords() != before) State.DictionaryChanged = True;
    return percent;
}

void SetBarWidth(QLabel& bar, double twips) {
    bar.resize(Platform::Twips(qRound(twips)), bar.height());
}

void ShowProgress(Progress& window, std::int32_t percent) {
    SetBarWidth(*window.ProgressIndicator, State.ProgressFullWidth * percent / 100.0);
    window.repaint();
}

void ShowProgressWindow(Progress& window) {
    window.ProgressLabel->setText("Merging words...");
    window.Display();
    if (State.ProgressFullWidth == 0) {
        const int width = window.ProgressIndicator->width() * Platform::TwipsPerPixel;
        State.ProgressFullWidth = static_cast<std::int16_t>(width);
    }
}

// A screen reader starts where the next word would be typed.
void TellMerged() {
    const DictionaryEditor& editor = Windows::Shared<DictionaryEditor>();
    editor.NewWord->setFocus();
    Platform::Tell("merged. " + editor.WordCount->text().toStdString());
}

void FinishMerge(Progress& window) {
    SetBarWidth(*window.ProgressIndicator, 0);
    Dictionary::ListStartingLetters(True);
    window.HideDisplay();
    Dictionary::ShowEditor();
    Dictionary::ListWords();
    State.DictionaryChanged = True;
    TellMerged();
}

}  // namespace

namespace Dictionary {

void StartMerge() {
    const std::string path = Platform::ChooseFileToOpen(Platform::ProgramFolder());
    if (path.empty()) return;
    const std::int32_t percent = Read(path.c_str());
    if (percent >= Complete) {
        ListStartingLetters(True);
        ListWords();
        State.DictionaryChanged = True;
        TellMerged();
        return;
    }
    Platform::HideWindow(Windows::Shared<DictionaryEditor>());
    Progress& window = Windows::Shared<Progress>();
    Platform::Tell("merging");
    ShowProgressWindow(window);
    ShowProgress(window, percent);
    window.DictionaryTimer->start();
}

void MergeStep() {
    Progress& window = Windows::Shared<Progress>();
    window.DictionaryTimer->stop();
    const std::int32_t percent = Read(NextStep);
    if (percent >= Complete) return FinishMerge(window);
    ShowProgress(window, percent);
    window.DictionaryTimer->start();
}

void StopMerge() {
    if (Windows::Existing<Progress> != nullptr)
        Windows::Existing<Progress>->DictionaryTimer->stop();
}

}  // namespace Dictionary
