#pragma once
#include <QWidget>

class QAction;
class QComboBox;
class QLabel;
class QLineEdit;
class QListView;
class QMenu;
class QPushButton;
class QStringListModel;

/// The dictionary editor: the dictionary's words, one two-letter prefix at a time.
/// Owned by the main window.
class DictionaryEditor : public QWidget {
    Q_OBJECT

  public:
    DictionaryEditor();

    QComboBox* StartingLetters = nullptr;
    QListView* WordList = nullptr;
    QStringListModel* Words = nullptr;  ///< what WordList shows
    QLineEdit* NewWord = nullptr;
    QPushButton* Add = nullptr;
    QPushButton* Remove = nullptr;
    QLabel* WordCount = nullptr;
    QMenu* File = nullptr;
    QAction* Clear = nullptr;
    QAction* Merge = nullptr;
    QAction* SaveAs = nullptr;
    QAction* Exit = nullptr;
    bool waits = false;  ///< to be shown: it would take another's keys

  protected:
    void closeEvent(QCloseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

  private:
    void makeMenu();
    void makeLists();
    void makeWordEntry();
    QWidget* client_ = nullptr;  ///< what lies below the menu bar
};
