#pragma once
// The real program, offscreen, used as a player uses it: keys go where the focus
// is, mouse clicks to whatever is on top. Controls go by their names, those of the
// main window first; "Results/ResultsOK" is the one in that window.
#include <QtTest>
#include <QtWidgets>
#include <stdexcept>

#include "main_window/main_window.h"
#include "state/windows.h"
#include "support/box_answers.h"
#include "support/game_fixture.h"

using Tiles = std::vector<int>;
using Words = std::vector<std::string>;

class ProgramFixture : public GameFixture {
  protected:
    ~ProgramFixture() override { endProgram(); }

    /// Starts the program as a new process would, ending one that runs, and shows its main
    /// window, in front. From then on the clock fires only when the test says so.
    void launch();
    static void endProgram();

    // What the player does.
    /// Presses Start; the cubes lie in the board's order and have but one letter each.
    void start(const std::string& board = "CATSBONEWILDHEFY");
    void press(const std::string& name) { clickOn(*control(name), control(name)->rect().center()); }
    void type(const std::string& text);  ///< key by key
    void key(Qt::Key key, Qt::KeyboardModifiers with = {}) {
        QTest::keyClick(QApplication::focusWindow(), key, with);
    }
    void enter(const Words& words);  ///< types each, and Return
    void paste(const std::string& text);
    void replaceAll(const std::string& text);  ///< selects all, then pastes or deletes
    void click(int tile) { press("Cube" + std::to_string(tile)); }
    void clickTiles(const Tiles& tiles) {
        for (const int tile : tiles) click(tile);
    }
    void doubleClick(int tile);
    void select(const std::string& list, const std::string& word);  ///< by mouse
    void menu(const std::string& command) { control<QAction>(command)->trigger(); }
    void bringToFront(const std::string& name) { activate(*control(name)->window()); }
    void closeByTitleBar(const std::string& window);
    void tick(int times = 1);  ///< the clock fires, if it runs

    // What the player sees.
    bool comesToFront(const std::string& name) { return comesToFront(*control(name)); }  ///< soon
    bool isShown(const std::string& name) {
        return find(name) != nullptr && find(name)->isVisible();
    }
    std::string text(const std::string& name, const char* property = "text") {
        return control(name)->property(property).toString().toStdString();
    }
    std::string description(const std::string& of) { return text(of, "accessibleDescription"); }
    std::string lastTold() { return told_.empty() ? "nothing" : told_.back(); }
    std::string typed() { return text("NewWord"); }
    Tiles litTiles(const std::string& tiles = "Cube");
    Tiles litResults() { return litTiles("ResultCubes"); }
    std::string letters(const std::string& tiles = "Cube");  ///< "Q" for Qu, "." for blank
    std::string entry();  ///< the word typed, the tiles lit, the warnings: "cat [0 1 2] 0"
    std::string typing(const std::string& text) { return type(text), entry(); }
    std::string clicking(const Tiles& tiles) { return clickTiles(tiles), entry(); }
    std::string clearing() { return press("Clear"), entry(); }
    std::string summary();  ///< the lines under the results
    Words words(const std::string& list = "WordList", bool struckOnly = false);

    template <class Control = QWidget>
    Control* control(const std::string& name) {  ///< fails the test when missing
        auto* found = find<Control>(name);
        if (found == nullptr) throw std::logic_error("no control " + name);
        return found;
    }

    BoxAnswers boxes_;

  private:
    static bool comesToFront(const QWidget& window);
    static void activate(QWidget& window);
    static void clickOn(const QWidget& widget, const QPoint& place);

    template <class Control = QWidget>
    static Control* find(const std::string& name) {
        const QString path = QString::fromStdString(name);
        const QString window = path.section('/', 0, -2);
        const QString wanted = path.section('/', -1);
        for (QWidget* top :
             QWidgetList{Windows::Existing<Main>} + QApplication::topLevelWidgets()) {
            if (!window.isEmpty() && top->objectName() != window) continue;
            if (top->objectName() == wanted) return qobject_cast<Control*>(top);
            if (auto* found = top->findChild<Control*>(wanted)) return found;
        }
        return nullptr;
    }
};

/// The program in front, on a small dictionary.
class PlayedBoard : public ProgramFixture {
  protected:
    PlayedBoard() {
        makeDictionary({"bone", "cast", "cat", "cats", "coat", "ten", "toe", "tone", "won"});
        launch();
    }
};

/// A game under way on it.
class RunningGame : public PlayedBoard {
  protected:
    RunningGame() { start(); }
};

/// The dictionary editor open on another.
class OpenEditor : public ProgramFixture {
  protected:
    OpenEditor() {
        makeDictionary({"bone", "cab", "cat", "zoo"});
        launch();
        press("Dictionary");
    }
    QComboBox& prefixes() { return *control<QComboBox>("StartingLetters"); }

    /// The prefixes, the selected one and its words, and the count.
    std::string shown() {
        std::string all;
        for (int i = 0; i < prefixes().count(); ++i) {
            all += prefixes().itemText(i).toStdString() + " ";
        }
        all += "| " + prefixes().currentText().toStdString() + ":";
        for (const auto& word : words("DictionaryEditor/WordList")) all += " " + word;
        return all + " | " + text("WordCount");
    }
};
