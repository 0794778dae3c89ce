#include "dictionary/progress_window.h"

#include <QEvent>
#include <QLabel>
#include <QTimer>
#include <QWindow>

#include "dictionary/merge.h"
#include "main_window/main_window.h"
#include "platform/layout.h"
#include "platform/platform.h"
#include "state/windows.h"

using namespace Platform;

namespace {

constexpr int ClientWidth = 4200;
constexpr int ClientHeight = 900;
constexpr int StepInterval = 10;  // milliseconds
constexpr TwipsRect BarPlace{120, 600, 3975, 135};
const QColor BarColour(0, 0, 192);
const QColor TrackColour(Qt::white);  // in a dark window the bar would not be seen

void Fill(QLabel& label, const QColor& colour) {
    QPalette colours = label.palette();
    colours.setColor(QPalette::Window, colour);
    label.setPalette(colours);
    label.setAutoFillBackground(true);
}

// On Wayland every window gets the focus when it is shown, but no tool tip.
Qt::WindowType Kind() {
    return OnWayland() ? Qt::ToolTip : Qt::Window;
}

}  // namespace

Progress::Progress() {
    setObjectName("Progress");
    setWindowTitle("Quorle Progress");
    setWindowFlags(Kind() | Qt::FramelessWindowHint | Qt::WindowDoesNotAcceptFocus);
    setAttribute(Qt::WA_ShowWithoutActivating);
    setFixedSize(Twips(ClientWidth), Twips(ClientHeight));
    setFrameStyle(QFrame::Box | QFrame::Plain);
    ProgressLabel = MakeLabel(this, "ProgressLabel", {480, 120, 3255, 375},
                              LayoutFont(Typeface::SansSerif, 13.5));
    track_ = MakeLabel(this, "ProgressTrack", BarPlace, PlainFont());
    ProgressIndicator = MakeLabel(this, "ProgressIndicator", BarPlace, PlainFont());
    colourBar();
    DictionaryTimer = new QTimer(this);
    DictionaryTimer->setObjectName("DictionaryTimer");
    DictionaryTimer->setInterval(StepInterval);
    connect(DictionaryTimer, &QTimer::timeout, this, [] { Dictionary::MergeStep(); });
}

void Progress::Display() {
    const Main& main = Windows::Shared<Main>();
    move(main.frameGeometry().center() - rect().center());
    if (OnWayland()) {
        winId();
        windowHandle()->setTransientParent(main.windowHandle());
    }
    show();
    raise();
}

void Progress::HideDisplay() {
    hide();
}

void Progress::colourBar() {
    Fill(*track_, TrackColour);
    Fill(*ProgressIndicator, BarColour);
}

// Some desktops give every control a new palette when their colours change.
void Progress::changeEvent(QEvent* event) {
    QFrame::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) QTimer::singleShot(0, this, &Progress::colourBar);
}
