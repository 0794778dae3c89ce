#include "results/result_lists.h"

#include <QLabel>
#include <QListWidget>
#include <QSignalBlocker>

#include "entry/check_cubes.h"
#include "platform/layout.h"

namespace {

const QColor PlainColour(255, 192, 128);
const QColor LitColour(128, 255, 128);

}  // namespace

namespace GameResults {

void AddWord(QListWidget& list, const QString& word) {
    auto* item = new QListWidgetItem(word);
    const QFont fitting = Platform::Condensed(list.font(), word, Platform::RowTextWidth(list));
    if (fitting != list.font()) item->setFont(fitting);
    if (fitting.strikeOut()) item->setData(Qt::AccessibleDescriptionRole, "not in dictionary");
    list.addItem(item);
}

QString SelectedWord(const QListWidget& list) {
    const auto selected = list.selectedItems();
    return selected.isEmpty() ? QString() : selected.first()->text();
}

int SelectedIndex(const QListWidget& list) {
    const auto selected = list.selectedItems();
    return selected.isEmpty() ? -1 : list.row(selected.first());
}

void DescribePlaces(QListWidget& list) {
    QListWidgetItem& item = *list.selectedItems().first();
    const QString places = QString::fromStdString(CheckCubes::Places(item.text().toStdString()));
    const bool bad = list.font().strikeOut();
    item.setData(Qt::AccessibleDescriptionRole, bad ? "not in dictionary, " + places : places);
}

// A list selects the neighbour of its current item, selected or not, before the
// item is gone.
void TakeWord(QListWidget& list, int index) {
    const QSignalBlocker quiet(list.selectionModel());
    const QSignalBlocker quietList(list);
    auto selected = list.selectedItems();
    QListWidgetItem* taken = list.takeItem(index);
    selected.removeAll(taken);
    delete taken;
    list.clearSelection();
    for (QListWidgetItem* item : selected) item->setSelected(true);
}

int IndexOf(const QListWidget& list, const QString& word) {
    for (int i = 0; i < list.count(); ++i) {
        if (list.item(i)->text() == word) return i;
    }
    return -1;
}

Tally TallyOf(const QListWidget& list) {
    Tally tally;
    for (int i = 0; i < list.count(); ++i) {
        Count(tally, list.item(i)->text().toStdString());
    }
    return tally;
}

void LightResultCube(QLabel& cube, std::size_t k, bool lit) {
    QPalette palette = cube.palette();
    palette.setColor(QPalette::Window, lit ? LitColour : PlainColour);
    palette.setColor(QPalette::WindowText, Qt::black);
    cube.setPalette(palette);
    cube.setProperty("selected", lit);
    const QString place = QString("Row %1, column %2").arg(k / 4 + 1).arg(k % 4 + 1);
    cube.setAccessibleDescription(lit ? place + ", lit" : place);
}

}  // namespace GameResults
