#include "platform/window_front.h"

#include <QApplication>
#include <QEvent>
#include <QList>
#include <QPointer>
#include <QWindow>
#include <algorithm>
#include <array>

namespace {

// A window's number is its place here, from 1. A native window handle would not
// do: it has more bits, and is used again.
constexpr std::array Names{"Main",     "OptionsDialog", "Results", "DictionaryEditor",
                           "Progress", "HelpBrowser"};

QList<QPointer<QWidget>> Followed;  // latest in front first

class ActivationFilter : public QObject {
  public:
    bool eventFilter(QObject* receiver, QEvent* event) override {
        if (event->type() != QEvent::WindowActivate) return false;
        auto* window = static_cast<QWidget*>(receiver);
        Followed.removeAll(window);
        Followed.prepend(window);
        return false;
    }
};

std::int32_t NumberOf(const QWidget* window) {
    const auto* found = std::find_if(Names.begin(), Names.end(), [window](const char* name) {
        return window->objectName() == QLatin1String(name);
    });
    return found == Names.end() ? 0 : static_cast<std::int32_t>(found - Names.begin()) + 1;
}

bool CanBeInFront(const QWidget* window) {
    return window != nullptr && window->isVisible() && !window->isMinimized() &&
           !window->windowFlags().testFlag(Qt::WindowDoesNotAcceptFocus);
}

}  // namespace

namespace WindowFront {

void Follow(QWidget* window) {
    static ActivationFilter filter;
    window->installEventFilter(&filter);
    Followed.removeAll(nullptr);
    Followed.append(window);
}

void Bring(QWidget& window) {
    window.setWindowState(window.windowState() & ~Qt::WindowMinimized);
    window.show();
    window.raise();
    window.activateWindow();
    window.setAttribute(Qt::WA_KeyboardFocusChange);  // shows the focus before the first Tab
}

void Hide(QWidget& window) {
    const bool wasInFront = window.isActiveWindow();
    window.hide();
    // Without a place of its own the window manager would choose another next time.
    if (QWindow* handle = window.windowHandle()) handle->setFramePosition(window.pos());
    if (wasInFront) GiveBack();
}

void GiveBack() {
    if (QWidget* window = Latest()) {
        window->raise();
        window->activateWindow();
    }
}

QWidget* Latest() {
    const auto found = std::find_if(Followed.begin(), Followed.end(), CanBeInFront);
    return found == Followed.end() ? nullptr : found->data();
}

std::int32_t Number() {
    const QWidget* active = QApplication::activeWindow();
    if (active == nullptr) return 0;
    if (const std::int32_t number = NumberOf(active)) return number;
    const QWidget* owner = active->parentWidget();
    return owner == nullptr ? 0 : -NumberOf(owner->window());
}

}  // namespace WindowFront
