#include "platform/screen_reader.h"

#include <QAccessibleWidget>
#include <QComboBox>
#include <QPointer>
#include <QTimer>

#include "platform/desktop.h"
#include "platform/platform.h"
#include "platform/window_front.h"

namespace {

QString Untold;

#if QT_VERSION >= QT_VERSION_CHECK(6, 8, 0)

void Announce(QWidget* window, const QString& text) {
    QAccessibleAnnouncementEvent event(window, text);
    event.setPoliteness(QAccessible::AnnouncementPoliteness::Assertive);
    QAccessible::updateAccessibility(&event);
}

#else

// Readers say a notification when it comes to show, whatever has the focus; without the
// word "notification" before it when it stands in a status bar. Neither is ever seen.
class Notice : public QWidget {
  public:
    explicit Notice(QWidget* parent, QAccessible::Role asked) : QWidget(parent), role(asked) {
        hide();
    }
    const QAccessible::Role role;
};

QAccessibleInterface* MakeInterface(const QString&, QObject* object) {
    auto* notice = dynamic_cast<Notice*>(object);
    return notice == nullptr ? nullptr : new QAccessibleWidget(notice, notice->role);
}

QWidget* MakeStatusBar(QWidget* window) {
    static const bool installed = [] {
        QAccessible::installFactory(MakeInterface);
        return true;
    }();
    Q_UNUSED(installed)
    return new Notice(window, QAccessible::StatusBar);
}

// A reader asks for the text a while later, so each has a notice of its own for some time.
void Announce(QWidget* window, const QString& text) {
    constexpr qsizetype Kept = 8;
    static QPointer<QWidget> statusBar;
    if (statusBar == nullptr) statusBar = MakeStatusBar(window);
    if (statusBar->children().size() >= Kept) delete statusBar->children().first();
    auto* notice = new Notice(statusBar, QAccessible::Notification);
    notice->setAccessibleName(text);
    QAccessibleEvent event(notice, QAccessible::ObjectShow);
    QAccessible::updateAccessibility(&event);
}

#endif

// Later than the focus's own news, which would break it off.
void TellAll() {
    const QString text = Untold;
    Untold.clear();
    if (QWidget* window = Platform::LatestInFront()) Announce(window, text);
}

}  // namespace

void Platform::TellScreenReader(const std::string& text) {
    if (!QAccessible::isActive()) return;
    if (Untold.isEmpty()) {
        QTimer::singleShot(0, TellAll);
    } else {
        Untold += ". ";
    }
    Untold += QString::fromStdString(text);
}

void Platform::TellValueOf(QComboBox* box, const QString& description) {
#if QT_VERSION >= QT_VERSION_CHECK(6, 8, 0)
    box->setAccessibleDescription(description);  // the toolkit tells the value itself
#else
    const auto tell = [box, description](const QString& value) {
        box->setAccessibleDescription(value + ". " + description);
        if (box->hasFocus() && !value.isEmpty()) Tell(value.toStdString());
    };
    tell(box->currentText());
    QObject::connect(box, &QComboBox::currentTextChanged, box, tell);
#endif
}
