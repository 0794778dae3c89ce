#include "options/options_commands.h"

#include <quorle/word_engine.h>

#include <QCheckBox>
#include <QComboBox>
#include <optional>

#include "dictionary/dictionary.h"
#include "main_window/main_window.h"
#include "options/options_window.h"
#include "options/settings.h"
#include "platform/platform.h"
#include "state/format_time.h"
#include "state/game_state.h"
#include "state/windows.h"

namespace {

QString TimeEntry(std::int16_t seconds) {
    return QString::fromStdString(Common::FormatTime(seconds));
}

QString SizeEntry(std::int32_t letters) {
    return QString("%1 letters").arg(letters);
}

void Fill(QComboBox& box, const QStringList& entries, const QString& selected) {
    box.clear();
    box.addItems(entries);
    box.setCurrentIndex(box.findText(selected, Qt::MatchExactly | Qt::MatchCaseSensitive));
}

QString SelectedEntry(const QComboBox& box) {
    return box.itemText(box.currentIndex());
}

std::optional<std::int16_t> SelectedSeconds(const QComboBox& box) {
    if (box.currentIndex() < 0) return std::nullopt;
    return GameTimes[static_cast<std::size_t>(box.currentIndex())];
}

std::optional<std::int16_t> SelectedLetters(const QComboBox& box) {
    const QString entry = SelectedEntry(box);
    if (entry.isEmpty()) return std::nullopt;
    return entry.left(2).trimmed().toShort();
}

bool MayStopGame() {
    return Platform::AskYesNo(
        "Changing the minimum word size now will stop the current game.  Are you sure you want to "
        "do this?",
        Platform::ProgramTitle);
}

// A game that has to stop ends at the clock's next counted tick.
void ApplyMinWordSize(std::int16_t size) {
    if (size != cMinWordSize() && State.TimeRemaining != 0) {
        if (!MayStopGame()) return Common::LoadOptions();
        State.TimeRemaining = 1;
    }
    cSetMinWordSize(size);
}

void ApplyMaxWordSize(std::int16_t size) {
    if (cMaxWordSize() <= size) {
        cSetMaxWordSize(size);
        return;
    }
    const bool remove =
        Platform::AskYesNo("Are you sure you want to remove words longer than " +
                               std::to_string(size) + " letters from the dictionary?",
                           Platform::ProgramTitle);
    if (!remove) return Common::LoadOptions();
    Dictionary::ShortenDictionary(size);
}

}  // namespace

namespace Common {

void ShowOptions() {
    Platform::BringToFront(Windows::Shared<OptionsDialog>());
}

void LoadOptions() {
    OptionsDialog& window = Windows::Shared<OptionsDialog>();
    QStringList times;
    for (const std::int16_t seconds : GameTimes) times += TimeEntry(seconds);
    QStringList sizes;
    for (int size = UsualShortestWord; size <= LongestWord; ++size) sizes += SizeEntry(size);
    Fill(*window.TimeCombo, times, TimeEntry(State.TimeLimit));
    Fill(*window.MinWordSizeCombo, sizes, SizeEntry(cMinWordSize()));
    Fill(*window.WordSizeCombo, sizes, SizeEntry(cMaxWordSize()));
    window.SoundsOption->setChecked(State.Sounds);
}

// Each box is read when its turn comes: a No puts every box back to the current
// settings, and what follows then changes nothing.
void ApplyOptions() {
    const OptionsDialog& window = Windows::Shared<OptionsDialog>();
    if (const auto seconds = SelectedSeconds(*window.TimeCombo)) State.TimeLimit = *seconds;
    if (const auto size = SelectedLetters(*window.MinWordSizeCombo)) ApplyMinWordSize(*size);
    if (const auto size = SelectedLetters(*window.WordSizeCombo)) ApplyMaxWordSize(*size);
    State.Sounds = ToBoolean(window.SoundsOption->isChecked());
    SaveSettings();
    CancelOptions();
}

void CancelOptions() {
    Platform::HideWindow(Windows::Shared<OptionsDialog>());
    Windows::Shared<Main>().update();
}

}  // namespace Common
