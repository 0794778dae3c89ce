// What a screen reader finds in the windows.
#include <QAbstractButton>
#include <QAccessible>
#include <QLabel>
#include <QMenuBar>
#include <QTest>
#include <set>

#include "support/program_fixture.h"

namespace {

class Accessibility : public PlayedBoard {
  protected:
    Accessibility() { start("CATSBONEWILDHEFY"); }
    static QAccessibleInterface& told(QWidget* control) {
        return *QAccessible::queryAccessibleInterface(control);
    }
    /// A control's own name, or that of the label beside it.
    static std::string name(QWidget* control) {
        const auto labels = told(control).relations(QAccessible::Label);
        const auto& named = labels.isEmpty() ? told(control) : *labels.first().first;
        return named.text(QAccessible::Name).toStdString();
    }
    static void walk(QAccessibleInterface& node, std::set<QObject*>& reached) {
        reached.insert(node.object());
        for (int i = 0; i < node.childCount(); ++i) walk(*node.child(i), reached);
    }
    std::string description(const std::string& of) {
        return told(control(of)).text(QAccessible::Description).toStdString();
    }
    /// The rows of a list or grid, each with its description.
    Words rows(const std::string& list) {
        auto& table = *told(control(list)).tableInterface();
        Words all;
        for (int row = 0; row < table.rowCount(); ++row) {
            const auto& cell = *table.cellAt(row, 0);
            all.push_back(
                (cell.text(QAccessible::Name) + cell.text(QAccessible::Description)).toStdString());
        }
        return all;
    }
};

TEST_F(Accessibility, WhatCanBeUsedOrReadIsReachedFromItsWindowAndHasANameAndARole) {
    for (const char* opens : {"Options", "Dictionary", "HelpButton", "End"}) press(opens);
    for (const char* window :
         {"Main", "OptionsDialog", "DictionaryEditor", "HelpBrowser", "Results"}) {
        EXPECT_EQ(told(control(window)).role(), QAccessible::Window) << window;
        EXPECT_EQ(told(control(window)).text(QAccessible::Name), control(window)->windowTitle());
        std::set<QObject*> reached;
        walk(told(control(window)), reached);
        for (auto* widget : control(window)->findChildren<QWidget*>()) {
            const auto* label = qobject_cast<QLabel*>(widget);
            const bool read = label != nullptr && !label->text().isEmpty();
            const bool used = widget->focusPolicy() != Qt::NoFocus && widget->isVisible() &&
                              qobject_cast<QMenuBar*>(widget) == nullptr;
            if (widget->window() != control(window) || !(read || used)) continue;
            SCOPED_TRACE(std::string(window) + " " + widget->objectName().toStdString());
            EXPECT_TRUE(reached.contains(widget));
            EXPECT_NE(name(widget), "");
            EXPECT_NE(told(widget).role(), QAccessible::Client);
        }
    }
}

TEST_F(Accessibility, ATileTellsItsLetterItsPlaceAndWhetherItIsLit) {
    auto& tile = told(control("Cube5"));
    EXPECT_EQ(name(control("Cube5")), "O");
    EXPECT_EQ(description("Cube5"), "Row 2, column 2");
    EXPECT_FALSE(tile.state().checked);
    tile.actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    EXPECT_TRUE(tile.state().checked);
    EXPECT_EQ(typed(), "o");
}

TEST_F(Accessibility, LabelsListsAndOptionsAreReadAsTheyStand) {
    for (const char* word : {"cat", "sta"}) {
        type(word);
        key(Qt::Key_Return);
    }
    EXPECT_EQ(rows("WordList"), (Words{"stanot in dictionary", "cat"}));
    tick();
    EXPECT_EQ(name(control("TimeLeft")), "2:59");
    EXPECT_EQ(name(control("PlayerWordLabel")), "2 words entered");
    EXPECT_EQ(name(control("DefinedWordCount")), "Quorle found 7 words");
    press("End");
    EXPECT_EQ(name(control("WordsLabel")), "1 word found out of 7 (14%)");
    EXPECT_EQ(rows("BadWords"), Words{"stanot in dictionary"});
    select("UserWords", "cat");
    EXPECT_EQ(name(control("ResultCubes1")), "A");
    EXPECT_EQ(description("ResultCubes1"), "Row 1, column 2, lit");
    EXPECT_EQ(description("ResultCubes7"), "Row 2, column 4");
    press("Options");
    EXPECT_EQ(name(control("TimeCombo")), "Game Time");
    EXPECT_EQ(name(control("SoundsOption")), "Play Sounds");
    press("Dictionary");
    EXPECT_TRUE(
        QString::fromStdString(description("StartingLetters")).endsWith("Starting letters"));
    EXPECT_EQ(rows("DictionaryEditor/WordList"), Words{"bone"});
}

TEST_F(Accessibility, ToolbarButtonsHaveShortcutsAndArePressedWithoutWaiting) {
    for (auto* button : control("ToolBar")->findChildren<QAbstractButton*>()) {
        EXPECT_FALSE(button->shortcut().isEmpty()) << button->objectName().toStdString();
    }
    bool shown = false;
    boxes_.expect("Game paused", "Hit OK when ready to resume.", QMessageBox::Ok, QMessageBox::Ok,
                  [&shown] { shown = true; });
    told(control("Pause")).actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    EXPECT_FALSE(shown);  // a reader that waited could not read the box
    EXPECT_TRUE(QTest::qWaitFor([&shown] { return shown; }));
}

TEST_F(Accessibility, AnArrowKeySelectsTheOnlyWordOfAList) {
    type("sta");
    key(Qt::Key_Return);
    press("End");
    control("BadWords")->setFocus();
    EXPECT_EQ(litResults(), Tiles{});
    key(Qt::Key_Down);
    EXPECT_EQ(litResults(), (Tiles{1, 2, 3}));
}

}  // namespace
