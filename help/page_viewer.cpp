#include "help/page_viewer.h"

#include <QEvent>
#include <QFile>
#include <QScrollBar>

namespace {

constexpr int Margin = 12;

QString NotFoundPage(const QString& file) {
    return QString("<h2>Page not found</h2><p>The file %1 is missing or cannot be read.</p>")
        .arg(file.toHtmlEscaped());
}

}  // namespace

PageViewer::PageViewer(QWidget* parent) : QTextBrowser(parent) {
    setOpenExternalLinks(true);
    document()->setDocumentMargin(Margin);
    setLinkColour();
}

QVariant PageViewer::loadResource(int type, const QUrl& name) {
    QVariant content = QTextBrowser::loadResource(type, name);
    if (type != QTextDocument::HtmlResource || !content.toByteArray().isEmpty()) return content;
    return NotFoundPage(name.isLocalFile() ? name.toLocalFile() : name.toString());
}

// Links take the application's link colour, which many dark palettes leave at a
// blue that is hard to read there.
void PageViewer::setLinkColour() {
    const bool dark = palette().color(QPalette::Base).lightness() < 128;
    document()->setDefaultStyleSheet(dark ? "a { color: #8ab4f8 }" : "a { color: #0645ad }");
}

void PageViewer::changeEvent(QEvent* event) {
    QTextBrowser::changeEvent(event);
    if (event->type() != QEvent::PaletteChange || source().isEmpty()) return;
    const int place = verticalScrollBar()->value();
    setLinkColour();
    reload();
    verticalScrollBar()->setValue(place);
}
