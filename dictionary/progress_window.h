#pragma once
#include <QFrame>

class QLabel;
class QTimer;

/// The progress of a merge: a borderless window that takes no focus.
class Progress : public QFrame {
    Q_OBJECT

  public:
    Progress();

    /// Shows it centred over the main window, above its own program's windows.
    void Display();
    void HideDisplay();

    QLabel* ProgressLabel = nullptr;
    QLabel* ProgressIndicator = nullptr;  ///< its width is the bar
    QTimer* DictionaryTimer = nullptr;    ///< runs while a merge waits for its next step

  protected:
    void changeEvent(QEvent* event) override;

  private:
    void colourBar();
    QLabel* track_ = nullptr;  ///< as long as the whole bar
};
