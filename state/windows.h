#pragma once
// The program's windows: one shared instance of each, made on first use.
#include <QPointer>

#include "platform/window_front.h"

namespace Windows {

/// The shared instance; null while it does not exist. Never creates it.
template <class Window>
inline QPointer<Window> Existing;

/// The shared instance, made on first use. Where the window has a load(), it is
/// run once, after the instance has become the shared one.
template <class Window>
Window& Shared() {
    if (Existing<Window> == nullptr) {
        auto* window = new Window;
        Existing<Window> = window;
        Platform::FollowWindow(window);
        if constexpr (requires { window->load(); }) window->load();
    }
    return *Existing<Window>;
}

template <class Window>
bool IsOpen() {
    return Existing<Window> != nullptr && Existing<Window>->isVisible();
}

/// Forgets the shared instance at once; it is deleted when its events are done.
template <class Window>
void Discard() {
    if (Existing<Window> != nullptr) Existing<Window>->deleteLater();
    Existing<Window>.clear();
}

}  // namespace Windows
