#pragma once
#include <QWidget>

class QAction;
class QTextBrowser;

/// The help window: a viewer of HTML pages with four commands on its menu bar.
class HelpBrowser : public QWidget {
    Q_OBJECT

  public:
    HelpBrowser();

    QTextBrowser* WebBrowser = nullptr;
    QAction* Contents = nullptr;
    QAction* Back = nullptr;
    QAction* Forward = nullptr;
    QAction* Exit = nullptr;

  protected:
    void closeEvent(QCloseEvent* event) override;

  private:
    void makeViewer();
    void makeCommands();
};
