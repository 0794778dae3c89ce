#include "help/page_viewer.h"

#include <QAccessible>
#include <QEvent>
#include <QFile>
#include <QScrollBar>
#include <QTextCursor>

#include "platform/platform.h"

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
    // A screen reader reads by the caret's lines; without one the arrow keys scroll.
    if (QAccessible::isActive()) {
        setTextInteractionFlags(textInteractionFlags() | Qt::TextSelectableByKeyboard);
    }
}

QVariant PageViewer::loadResource(int type, const QUrl& name) {
    QVariant content = QTextBrowser::loadResource(type, name);
    if (type != QTextDocument::HtmlResource || !content.toByteArray().isEmpty()) return content;
    return NotFoundPage(name.isLocalFile() ? name.toLocalFile() : name.toString());
}

// Tab selects the next link.
bool PageViewer::focusNextPrevChild(bool next) {
    const bool stayed = QTextBrowser::focusNextPrevChild(next);
    const QTextCursor link = textCursor();
    if (stayed && link.hasSelection()) {
        Platform::Tell("link " + link.selectedText().toStdString());
    }
    return stayed;
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
