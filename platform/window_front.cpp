#include "platform/window_front.h"

#include <QApplication>
#include <QEvent>
#include <QList>
#include <QPointer>
#include <QWindow>
#include <algorithm>
#include <array>

#include "platform/desktop.h"
#include "platform/platform.h"

namespace {

// A window's number is its place here, from 1. A native window handle would not
// do: it has more bits, and is used again.
constexpr std::array Names{"Main",     "OptionsDialog", "Results", "DictionaryEditor",
                           "Progress", "HelpBrowser"};

QList<QPointer<QWidget>> Followed;  // latest in front first

// Activated by us, but not yet by the desktop: the next window may hide before.
QPointer<QWidget> Asked;

class ActivationFilter : public QObject {
  public:
    bool eventFilter(QObject* receiver, QEvent* event) override {
        if (event->type() != QEvent::WindowActivate) return false;
        auto* window = static_cast<QWidget*>(receiver);
        Followed.removeAll(window);
        Followed.prepend(window);
        Asked.clear();
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

void Ask(QWidget& window) {
    if (!window.isActiveWindow()) Asked = &window;
    window.raise();
    window.activateWindow();
}

QWidget* InFront() {
    // A box that has just been opened is not yet the active window.
    if (QWidget* box = QApplication::activeModalWidget()) return box;
    return Asked != nullptr && Asked->isVisible() ? Asked.data() : QApplication::activeWindow();
}

// The native window is told once, when it is made; it looks at each showing.
void SetShownBehind(QWidget& window, bool behind) {
    window.setAttribute(Qt::WA_ShowWithoutActivating, behind);
    if (QWindow* handle = window.windowHandle()) {
        handle->setProperty("_q_showWithoutActivating", behind);
    }
}

}  // namespace

namespace Platform {

void FollowWindow(QWidget* window) {
    static ActivationFilter filter;
    window->installEventFilter(&filter);
    Followed.removeAll(nullptr);
    Followed.append(window);
}

void BringToFront(QWidget& window) {
    // A window shown anew is the only one that every compositor puts in front.
    if (OnWayland() && InFront() != &window) window.hide();
    window.setWindowState(window.windowState() & ~Qt::WindowMinimized);
    SetShownBehind(window, false);
    window.show();
    Ask(window);
    window.setAttribute(Qt::WA_KeyboardFocusChange);  // shows the focus before the first Tab
}

void HideWindow(QWidget& window) {
    const bool wasInFront = window.isActiveWindow() || Asked == &window;
    window.hide();
    // Without a place of its own the window manager would choose another next time.
    if (QWindow* handle = window.windowHandle()) handle->setFramePosition(window.pos());
    if (wasInFront) GiveFrontBack();
}

void GiveFrontBack() {
    if (QWidget* window = LatestInFront()) Ask(*window);
}

void ShowBehind(QWidget& window) {
    QWidget* inFront = InFront();
    SetShownBehind(window, true);
    window.show();
    if (inFront != nullptr) {
        inFront->activateWindow();
    } else {
        QApplication::alert(&window);
    }
}

bool FrontIsOurs() {
    return InFront() != nullptr;
}

bool DesktopTiles() {
    return qEnvironmentVariableIsSet("I3SOCK");
}

void FloatWindow(QWidget& window) {
    const auto main = std::find_if(Followed.begin(), Followed.end(), [](const auto& followed) {
        return followed != nullptr && NumberOf(followed) == 1;
    });
    if (!DesktopTiles() || main == Followed.end()) return;
    if (window.windowType() != Qt::Dialog) window.setWindowFlags(Qt::Dialog);
    window.winId();
    window.windowHandle()->setTransientParent((*main)->windowHandle());
}

QWidget* LatestInFront() {
    const auto found = std::find_if(Followed.begin(), Followed.end(), CanBeInFront);
    return found == Followed.end() ? nullptr : found->data();
}

std::int32_t NumberInFront() {
    const QWidget* active = QApplication::activeWindow();
    if (active == nullptr) return 0;
    if (const std::int32_t number = NumberOf(active)) return number;
    const QWidget* owner = active->parentWidget();
    return owner == nullptr ? 0 : -NumberOf(owner->window());
}

}  // namespace Platform
