#include "platform/list_keys.h"

#include <QAbstractItemView>
#include <QKeyEvent>
#include <QTimer>

namespace {

// A reader says a row when it becomes the current one, so it must not be that before.
void Reach(QAbstractItemView& list, const QModelIndex& row,
           QItemSelectionModel::SelectionFlags selecting) {
    list.selectionModel()->setCurrentIndex({}, QItemSelectionModel::NoUpdate);
    list.selectionModel()->setCurrentIndex(row, selecting);
}

// The reader has said the list by then.
void TellSelected(QAbstractItemView& list) {
    const QModelIndex row = list.currentIndex();
    if (!list.hasFocus() || !list.selectionModel()->isSelected(row)) return;
    Reach(list, row, QItemSelectionModel::NoUpdate);
}

class ArrowKeys : public QObject {
  public:
    using QObject::QObject;

    bool eventFilter(QObject* receiver, QEvent* event) override {
        auto* list = static_cast<QAbstractItemView*>(receiver);
        if (event->type() == QEvent::FocusIn) {
            QTimer::singleShot(0, list, [list] { TellSelected(*list); });
        }
        if (event->type() != QEvent::KeyPress) return false;
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key != Qt::Key_Up && key != Qt::Key_Down) return false;
        const QModelIndex row = list->currentIndex();
        if (!row.isValid() || list->selectionModel()->hasSelection()) return false;
        Reach(*list, row, QItemSelectionModel::ClearAndSelect);
        return true;
    }
};

}  // namespace

void Platform::SelectByArrowKeys(QAbstractItemView* list) {
    list->installEventFilter(new ArrowKeys(list));
}
