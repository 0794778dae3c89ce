#include "platform/window_accessible.h"

#include <QAccessibleWidget>
#include <QKeySequence>
#include <QToolButton>

namespace {

// The toolkit has a tool button pressed before it answers: when a box opens, a
// reader would wait for the answer and could not read the box.
class ToolButtonAccessible : public QAccessibleWidget {
  public:
    explicit ToolButtonAccessible(QToolButton* button)
        : QAccessibleWidget(button, QAccessible::Button), button_(button) {}

    QStringList actionNames() const override { return {pressAction(), setFocusAction()}; }

    QStringList keyBindingsForAction(const QString& name) const override {
        if (name != pressAction()) return {};
        // Mnemonic, path in menus, accelerator: readers tell these apart by their places.
        return {"", "", button_->shortcut().toString(QKeySequence::NativeText)};
    }

    void doAction(const QString& name) override {
        if (name != pressAction()) return QAccessibleWidget::doAction(name);
        button_->animateClick();
    }

  private:
    QToolButton* button_;
};

// The toolkit's own windows are dialogs, menus and tips.
bool IsOurs(const QWidget* window) {
    return window->windowType() == Qt::Window;
}

QAccessibleInterface* MakeInterface(const QString&, QObject* object) {
    auto* widget = qobject_cast<QWidget*>(object);
    if (widget == nullptr || !IsOurs(widget->window())) return nullptr;
    if (widget->isWindow()) return new QAccessibleWidget(widget, QAccessible::Window);
    auto* button = qobject_cast<QToolButton*>(object);
    return button == nullptr ? nullptr : new ToolButtonAccessible(button);
}

}  // namespace

void Platform::MakeWindowsAccessible() {
    QAccessible::installFactory(MakeInterface);
}
