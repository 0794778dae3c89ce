#include "platform/list_keys.h"

#include <QAbstractItemView>
#include <QKeyEvent>

namespace {

class ArrowKeys : public QObject {
  public:
    using QObject::QObject;

    bool eventFilter(QObject* receiver, QEvent* event) override {
        if (event->type() != QEvent::KeyPress) return false;
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key != Qt::Key_Up && key != Qt::Key_Down) return false;
        auto* list = static_cast<QAbstractItemView*>(receiver);
        const QModelIndex row = list->currentIndex();
        if (!row.isValid() || list->selectionModel()->hasSelection()) return false;
        list->setCurrentIndex(row);
        return true;
    }
};

}  // namespace

void SelectByArrowKeys(QAbstractItemView* list) {
    list->installEventFilter(new ArrowKeys(list));
}
