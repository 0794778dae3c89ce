#include "entry/word_entry.h"

#include <QLineEdit>

#include "board/draw_cubes.h"
#include "entry/check_cubes.h"
#include "entry/submission.h"
#include "entry/typed_text.h"
#include "main_window/main_window.h"
#include "platform/platform.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

QLineEdit& NewWord() {
    return *Windows::Shared<Main>().NewWord;
}

std::string TypedText() {
    return NewWord().text().toStdString();
}

// The caret is behind the text afterwards.
void SetText(const std::string& text) {
    NewWord().setText(QString::fromStdString(text));
}

bool EndsInQu(const std::string& text) {
    return text.size() >= 2 && Entry::LowerCase(text.substr(text.size() - 2)) == "qu";
}

bool IsLastPicked(std::int16_t k) {
    return State.PickedCount >= 1 &&
           State.PickedCubes[static_cast<std::size_t>(State.PickedCount)] == k;
}

void Pick(std::int16_t k, const std::string& letters, const std::string& word) {
    ++State.PickedCount;
    State.PickedCubes[static_cast<std::size_t>(State.PickedCount)] = k;
    Common::DrawCubeSelected(k);
    State.PickedWord += letters;
    SetText(word);
    NewWord().setFocus();
    NewWord().repaint();
}

void ForgetPicks() {
    State.PickedWord.clear();
    State.PickedCount = 0;
    Common::DrawAllCubesNormal();
}

// With no click left to undo there is no tile to turn either.
void UndoPick(const std::string& shorter) {
    if (!State.PickedWord.starts_with(Entry::LowerCase(shorter))) return;
    State.PickedWord.resize(shorter.size());
    if (State.PickedCount == 0) return;
    Common::DrawCubeNormal(State.PickedCubes[static_cast<std::size_t>(State.PickedCount)]);
    --State.PickedCount;
}

// What is taken off a word, be it many letters of a paste.
void TellTakenOff(const std::string& letters) {
    Platform::Tell(letters + " taken off");
}

}  // namespace

namespace Entry {

// Taking untraceable letters off one by one would run this handler nested in
// itself, once for each. The outcome is worked out first instead, and the text
// set once; the run nested in that finds it traceable.
void WordTyped() {
    const std::string text = TypedText();
    if (text.empty() && !State.LastTypedText.empty()) {
        Common::DrawAllCubesNormal();
        return;
    }
    const TypedCut cut = CutToBoard(text);
    if (!cut.traced) return;
    for (std::size_t i = 0; i < cut.takenOff; ++i) PlayWarning();
    if (cut.takenOff > 0) {
        SetText(text.substr(0, cut.kept));
        TellTakenOff(text.substr(cut.kept));
    }
    Board::DrawTracedPath();
}

void CubeClick(std::int16_t k) {
    if (NewWord().isEnabled()) NewWord().setFocus();
    if (State.TimeRemaining == 0) return;
    const std::string text = TypedText();
    if (LowerCase(text) == State.PickedWord && IsLastPicked(k)) {
        Submit();
        return;
    }
    const std::string letters = LowerCase(State.CubeLetters[static_cast<std::size_t>(k)]);
    const std::string word = text + letters;
    if (State.PickedCount < PickedSlots && CheckCubes::IsOnBoard(word)) {
        Pick(k, letters, word);
    } else {
        PlayWarning();
    }
}

void CubeDoubleClick(std::int16_t k) {
    CubeClick(k);
    Submit();
}

void ClearLetter() {
    const std::string text = TypedText();
    const std::size_t takenOff = EndsInQu(text) ? 2 : 1;
    std::string shorter;
    if (text.size() > takenOff) {
        shorter = text.substr(0, text.size() - takenOff);
        UndoPick(shorter);
    } else if (!text.empty()) {
        ForgetPicks();
    }
    if (!text.empty()) TellTakenOff(text.substr(shorter.size()));
    SetText(shorter);
}

void PlayWarning() {
    if (State.Sounds) Platform::WarningSound();
}

}  // namespace Entry
