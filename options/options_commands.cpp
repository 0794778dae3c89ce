#include "options/options_commands.h"

#include <quorle/word_engine.h>

#include <QCheckBox>
#include <QComboBox>
#include <optional>

#include "game/format_time.h"
#include "game/game_state.h"
#include "game/main_window.h"
#include "game/settings.h"
#include "game/windows.h"
#include "options/options_window.h"
#include "platform/platform.h"

namespace {

constexpr int SmallestOffered = 3;  // letters
constexpr int LargestOffered = 16;

const QStringList GameTimes{"0:15", "0:30", "1:00", "2:00", "3:00", "4:00", "5:00"};

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
    const QString entry = SelectedEntry(box);
    if (entry.isEmpty()) return std::nullopt;
    return static_cast<std::int16_t>(60 * entry.left(1).toInt() + entry.mid(2).toInt());
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
    cSetMaxWordSize(size);
    cReduceWordSize();
    State.DictionaryChanged = True;
}

}  // namespace

namespace Common {

void ShowOptions() {
    WindowFront::Bring(Windows::Shared<OptionsDialog>());
}

void LoadOptions() {
    OptionsDialog& window = Windows::Shared<OptionsDialog>();
    QStringList sizes;
    for (int size = SmallestOffered; size <= LargestOffered; ++size) sizes += SizeEntry(size);
    Fill(*window.TimeCombo, GameTimes, QString::fromStdString(FormatTime(State.TimeLimit)));
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
    WindowFront::Hide(Windows::Shared<OptionsDialog>());
    Windows::Shared<Main>().update();
}

}  // namespace Common
