#include "dictionary/listing.h"

#include <quorle/word_engine.h>

#include <QApplication>
#include <QComboBox>
#include <QLabel>
#include <QListView>
#include <QSignalBlocker>
#include <QStringListModel>
#include <array>

#include "dictionary/editor_window.h"
#include "platform/layout.h"
#include "platform/platform.h"
#include "state/windows.h"

namespace {

constexpr std::int32_t Letters = 26;

QString Prefix(std::int32_t first, std::int32_t second) {
    return QString(QChar('A' + first)) + QChar('A' + second);
}

QStringList PrefixesWithWords() {
    QStringList prefixes;
    for (std::int32_t i = 0; i < Letters; ++i) {
        for (std::int32_t j = 0; j < Letters; ++j) {
            if (cDictIndex(i, j) != -1) prefixes += Prefix(i, j);
        }
    }
    return prefixes;
}

std::int32_t LetterIndex(QChar letter) {
    return letter.toLower().unicode() - State.LetterBase;
}

QStringList WordsWith(const QString& prefix) {
    const std::int32_t first = LetterIndex(prefix.front());
    const std::int32_t second = LetterIndex(prefix.back());
    QStringList words;
    if (cDictIndex(first, second) == -1) return words;
    cStartDecodingWords(first, second);
    std::array<char, LongestWord> buffer{};
    while (const std::int16_t length = cDecodeNextWord(buffer.data())) {
        words += QString::fromLatin1(buffer.data(), length);
    }
    words.sort();
    return words;
}

void ShowWordCount(QLabel& label) {
    Platform::ShowFitting(label, Platform::LayoutFont(Platform::Typeface::SansSerif, 12),
                          QString("%1 words").arg(cNumberOfWords()));
}

}  // namespace

namespace Dictionary {

// The refill is done before anything is painted, so an open editor need not hide.
void ListStartingLetters(Boolean ResetSelection) {
    QComboBox& box = *Windows::Shared<DictionaryEditor>().StartingLetters;
    const QString kept = ResetSelection ? QString() : box.currentText();
    {
        const QSignalBlocker quiet(box);
        box.clear();
        box.addItems(PrefixesWithWords());
        box.setCurrentIndex(-1);
    }
    ShowEditor();
    const int index = kept.isEmpty() ? -1 : box.findText(kept, Qt::MatchExactly);
    if (box.count() > 0) box.setCurrentIndex(index < 0 ? 0 : index);
}

void ListWords() {
    const DictionaryEditor& editor = Windows::Shared<DictionaryEditor>();
    ShowWordCount(*editor.WordCount);
    const QString prefix = editor.StartingLetters->currentText();
    editor.Words->setStringList(prefix.isEmpty() ? QStringList() : WordsWith(prefix));
    ShowEditor();
}

void ShowEditor() {
    DictionaryEditor& editor = Windows::Shared<DictionaryEditor>();
    if (editor.isVisible()) return;
    const bool playing = State.TimeRemaining != 0;
    const bool elsewhere = !Platform::FrontIsOurs();
    editor.waits = (playing || elsewhere) && Platform::OnWayland();
    if (editor.waits) return;
    const bool boxIsUp = QApplication::activeModalWidget() != nullptr;
    if (playing || boxIsUp || elsewhere) {
        Platform::ShowBehind(editor);
    } else {
        Platform::BringToFront(editor);
    }
}

void ShowWaitingEditor() {
    if (Windows::Existing<DictionaryEditor> == nullptr) return;
    if (Windows::Existing<DictionaryEditor>->waits) ShowEditor();
}

}  // namespace Dictionary
