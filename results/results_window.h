#pragma once
#include <QWidget>
#include <array>

class QLabel;
class QListWidget;
class QPushButton;

/// The results of a game: the player's words, the rejected ones, the computer's,
/// the board, and three summary lines.
class Results : public QWidget {
    Q_OBJECT

  public:
    Results();

    /// Before the first showing: beside `window` where the screen has room, else
    /// centred over it, wholly on the screen. Later the player's place is kept.
    void placeBeside(const QWidget& window);

    QListWidget* UserWords = nullptr;
    QListWidget* BadWords = nullptr;
    QListWidget* DictWords = nullptr;
    QPushButton* ResultsOK = nullptr;
    QPushButton* AddToDict = nullptr;
    QPushButton* RemoveFromDict = nullptr;
    std::array<QLabel*, 16> ResultCubes{};
    QLabel* UserWordsLabel = nullptr;
    QLabel* DictWordsLabel = nullptr;
    QLabel* WordsLabel = nullptr;
    QLabel* ScoreLabel = nullptr;
    QLabel* BadWordsLabel = nullptr;

  protected:
    void closeEvent(QCloseEvent* event) override;
    void changeEvent(QEvent* event) override;

  private:
    void makeLists();
    void makeButtons();
    void setTabOrders();
    void makeBoard();
    void makeSummary();
    void colourControls();
    bool placed_ = false;
};
