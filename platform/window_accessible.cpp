#include "platform/window_accessible.h"

#include <QAccessibleWidget>
#include <QWidget>

namespace {

// The toolkit's own windows are dialogs, menus and tips.
QAccessibleInterface* MakeInterface(const QString&, QObject* object) {
    auto* widget = qobject_cast<QWidget*>(object);
    if (widget == nullptr || widget->windowType() != Qt::Window) return nullptr;
    return new QAccessibleWidget(widget, QAccessible::Window);
}

}  // namespace

void MakeWindowsAccessible() {
    QAccessible::installFactory(MakeInterface);
}
