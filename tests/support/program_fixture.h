#pragma once
// The real program, offscreen, used as a player uses it: keys go where the focus
// is, mouse clicks to whatever is on top. Controls go by their names, those of the
// main window first; "Results/ResultsOK" is the one in that window.
#include <QWidget>
#include <string>
#include <vector>

#include "support/box_answers.h"
#include "support/game_fixture.h"

class QAbstractItemView;
class QTimer;

using Tiles = std::vector<int>;
using Words = std::vector<std::string>;

class ProgramFixture : public GameFixture {
  protected:
    ~ProgramFixture() override;

    /// Starts the program and shows its main window, in front.
    /// From then on the clock fires only when the test says so.
    void launch();

    /// The program ends, and starts again as a new process would.
    void relaunch();
    static void endProgram();

    // What the player does.
    void start(const std::string& board);   ///< presses Start
    void press(const std::string& button);  ///< by mouse
    void type(const std::string& text);     ///< key by key
    void key(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
    void enter(const Words& words);  ///< types each, and Return
    void paste(const std::string& text);
    void replaceAll(const std::string& text);  ///< selects all, then pastes or deletes
    void click(int tile, Qt::MouseButton button = Qt::LeftButton);
    void clickTiles(const Tiles& tiles);
    void doubleClick(int tile);
    void select(const std::string& list, const std::string& word);  ///< by mouse
    void menu(const std::string& command);                          ///< "HelpBrowser/Back"
    void bringToFront(const std::string& window);
    void closeByTitleBar(const std::string& window);
    void tick(int times = 1);  ///< the clock fires, if it runs

    // What the player sees.
    QWidget* control(const std::string& name);     ///< fails the test when missing
    bool comesToFront(const std::string& window);  ///< now or soon
    bool isShown(const std::string& window);
    std::string text(const std::string& control);  ///< of a label, box or button
    std::string typed() { return text("NewWord"); }
    Tiles litTiles() { return lit("Cube"); }
    Tiles litResults() { return lit("ResultCubes"); }
    std::string letters(const std::string& tiles = "Cube");  ///< blank tiles: "."
    std::string entry();  ///< the word typed, the tiles lit, the warnings: "cat [0 1 2] 0"
    std::string typing(const std::string& text) { return type(text), entry(); }
    std::string clicking(const Tiles& tiles) { return clickTiles(tiles), entry(); }
    std::string clearing() { return press("Clear"), entry(); }
    std::string summary();  ///< the lines under the results
    Words words(const std::string& list = "WordList", bool struckOnly = false);
    Words struck() { return words("WordList", true); }

    BoxAnswers boxes_;

  private:
    static void clickOn(const QWidget& widget, const QPoint& place, Qt::MouseButton button);
    QWidget* find(const std::string& name);
    QTimer& clock();
    QAbstractItemView& view(const std::string& list);
    Tiles lit(const std::string& tiles);
};

/// The program in front, on a small dictionary.
class PlayedBoard : public ProgramFixture {
  protected:
    PlayedBoard() {
        makeDictionary({"bone", "cast", "cat", "cats", "coat", "ten", "toe", "tone", "won"});
        launch();
    }
};
