#pragma once
#include <QTextBrowser>

/// Shows HTML pages: links to files in itself, others in the desktop's browser.
/// Where a page cannot be read it says so in its place.
class PageViewer : public QTextBrowser {
    Q_OBJECT

  public:
    explicit PageViewer(QWidget* parent);

    QVariant loadResource(int type, const QUrl& name) override;

  protected:
    void changeEvent(QEvent* event) override;
    bool focusNextPrevChild(bool next) override;

  private:
    void setLinkColour();
};
