// Loaded into a program that uses the toolkit: says which style its windows are drawn in,
// below what the program itself has added, and ends it.
#include <QApplication>
#include <QProxyStyle>
#include <QTimer>

static void ReportStyle() {
    QTimer::singleShot(500, [] {
        const QStyle* style = QApplication::style();
        while (const auto* added = qobject_cast<const QProxyStyle*>(style)) {
            style = added->baseStyle();
        }
        qInfo("%s", qPrintable(style->name()));
        std::_Exit(0);
    });
}
Q_COREAPP_STARTUP_FUNCTION(ReportStyle)
