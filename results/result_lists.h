#pragma once
// The sorted word lists and the small board of the results window.
#include <QString>

#include "results/scoring.h"

class QLabel;
class QListWidget;

namespace GameResults {

/// Adds a word in its alphabetical place.
void AddWord(QListWidget& list, const QString& word);

/// The word selected, and its index; an empty text and -1 when none is.
QString SelectedWord(const QListWidget& list);
int SelectedIndex(const QListWidget& list);

/// Takes the word at `index` out. The word selected stays so; where it was this one,
/// none is afterwards.
void TakeWord(QListWidget& list, int index);

/// Lets a screen reader say where the selected word lies on the board.
void DescribePlaces(QListWidget& list);

/// The first index of a word, -1 when it is not listed.
int IndexOf(const QListWidget& list, const QString& word);

/// Words and points of a list.
Tally TallyOf(const QListWidget& list);

/// Gives cube `k` (0..15) of the small board its lit or its plain colour, and its
/// property `selected`; its accessible description tells place and look.
void LightResultCube(QLabel& cube, std::size_t k, bool lit);

}  // namespace GameResults
