#include "platform/window_size.h"

#include <QEvent>
#include <QLayout>
#include <QTimer>
#include <QWidget>

#include "platform/platform.h"
#include "platform/window_front.h"

namespace {

// A tiling compositor maximises nothing, and floats a window by its only size.
bool MayBeMaximised() {
    return Platform::OnWayland() && !Platform::DesktopTiles();
}

class SizeFilter : public QObject {
  public:
    bool eventFilter(QObject* receiver, QEvent* event) override {
        auto* window = static_cast<QWidget*>(receiver);
        const bool layout = event->type() == QEvent::LayoutRequest;
        if (layout && window->isMaximized()) return true;
        // The window sets its size in answer to this event, so after it.
        if (layout || event->type() == QEvent::Show) {
            QTimer::singleShot(
                0, window, [window] { window->setMaximumSize(QWIDGETSIZE_MAX, QWIDGETSIZE_MAX); });
        }
        return false;
    }
};

}  // namespace

namespace Platform {

void SetOnlySize(QWidget& window, QSize size) {
    window.setMinimumSize(size);
    window.resize(size);
    if (!MayBeMaximised()) window.setMaximumSize(size);
}

void SetOnlySize(QLayout& layout) {
    layout.setSizeConstraint(MayBeMaximised() ? QLayout::SetMinimumSize : QLayout::SetFixedSize);
}

void LetGrow(QWidget& window) {
    if (!MayBeMaximised()) return;
    static SizeFilter filter;
    window.installEventFilter(&filter);
}

}  // namespace Platform
