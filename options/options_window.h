#pragma once
#include <QWidget>

class QCheckBox;
class QComboBox;
class QLabel;
class QPushButton;

/// The options window. The choices on show stay as they are while it is hidden.
class OptionsDialog : public QWidget {
    Q_OBJECT

  public:
    OptionsDialog();

    /// Shows the current settings in the boxes.
    void load();

    QPushButton* OKButton = nullptr;
    QPushButton* CancelButton = nullptr;
    QLabel* TimeLabel = nullptr;
    QComboBox* TimeCombo = nullptr;  ///< also takes typed text
    QLabel* MinWordSizeLabel = nullptr;
    QComboBox* MinWordSizeCombo = nullptr;
    QLabel* WordSizeLabel = nullptr;
    QComboBox* WordSizeCombo = nullptr;
    QLabel* SoundsLabel = nullptr;
    QCheckBox* SoundsOption = nullptr;

  protected:
    void closeEvent(QCloseEvent* event) override;
    bool eventFilter(QObject* receiver, QEvent* event) override;

  private:
    void makeButtons();
    void makeBoxes();
    void makeLabels();
    void setTabOrders();
};
