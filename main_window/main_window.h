#pragma once
#include <QWidget>
#include <array>

class CubeTile;
class QFrame;
class QLabel;
class QLineEdit;
class QPushButton;
class QShortcut;
class QTableWidget;
class QTimer;
class QToolButton;

/// The main window: toolbar, board, word entry, the player's words and the clock.
class Main : public QWidget {
    Q_OBJECT

  public:
    Main();

    /// Captions of TimeRemLabel and TimeLeft.
    void SetTimeLabels(const QString& caption, const QString& value);

    QWidget* ToolBar = nullptr;
    QToolButton* Start = nullptr;
    QToolButton* Pause = nullptr;
    QToolButton* End = nullptr;
    QToolButton* Options = nullptr;
    QToolButton* Dictionary = nullptr;
    QToolButton* HelpButton = nullptr;
    QToolButton* Exit = nullptr;

    QFrame* CubeFrame = nullptr;
    std::array<CubeTile*, 16> Cube{};

    QLineEdit* NewWord = nullptr;
    QPushButton* Enter = nullptr;
    QPushButton* Clear = nullptr;
    QLabel* TimeRemLabel = nullptr;
    QLabel* TimeLeft = nullptr;
    QTableWidget* WordList = nullptr;  ///< one column, newest word in row 0
    QLabel* PlayerWordLabel = nullptr;
    QLabel* DefinedWordCount = nullptr;
    QTimer* GameClock = nullptr;
    QShortcut* TellKey = nullptr;  ///< asks a screen reader for time, words and board

  signals:
    /// The window is about to close, whoever asked for it; the program ends with it.
    void closing();

  protected:
    void closeEvent(QCloseEvent* event) override;
    void changeEvent(QEvent* event) override;

  private:
    void makeToolBar();
    void makeBoard();
    void makeWordEntry();
    void makeLabels();
    void makeWordList();
    QToolButton* makeToolButton(const char* name, int left, const char* toolTip, Qt::Key altKey);
    void setPictures();
};
