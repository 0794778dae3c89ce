// What a screen reader finds in the windows.
#include <set>

#include "support/program_fixture.h"

namespace {

class Accessibility : public RunningGame {
  protected:
    static QAccessibleInterface& told(QWidget* control) {
        return *QAccessible::queryAccessibleInterface(control);
    }
    /// A control's own name, or that of the label beside it.
    static QString name(QWidget* control) {
        const auto labels = told(control).relations(QAccessible::Label);
        const auto& named = labels.isEmpty() ? told(control) : *labels.first().first;
        return named.text(QAccessible::Name);
    }
    static void walk(QAccessibleInterface& node, std::set<QObject*>& reached) {
        reached.insert(node.object());
        for (int i = 0; i < node.childCount(); ++i) walk(*node.child(i), reached);
    }
};

TEST_F(Accessibility, WhatCanBeUsedOrReadIsReachedFromItsWindowAndHasANameAndARole) {
    for (const char* opens : {"Options", "Dictionary", "HelpButton", "End"}) press(opens);
    for (const char* window :
         {"Main", "OptionsDialog", "DictionaryEditor", "HelpBrowser", "Results"}) {
        EXPECT_EQ(told(control(window)).role(), QAccessible::Window) << window;
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
    press("End");
    select("DictWords", "cat");
    EXPECT_EQ(name(control("ResultCubes1")), "A");
    EXPECT_EQ(description("ResultCubes1"), "Row 1, column 2, lit");
    EXPECT_EQ(description("ResultCubes7"), "Row 2, column 4");
}

TEST_F(Accessibility, ButtonsHaveShortcutsAndArePressedWithoutWaiting) {
    for (const char* opens : {"Dictionary", "End"}) press(opens);
    for (const char* name :
         {"Start", "Pause", "End", "Options", "Dictionary", "HelpButton", "Exit", "Clear", "Remove",
          "Add", "ResultsOK", "AddToDict", "RemoveFromDict"}) {
        EXPECT_FALSE(control<QAbstractButton>(name)->shortcut().isEmpty()) << name;
    }
    bool shown = false;
    boxes_.expectPause([&shown] { shown = true; });
    told(control("Pause")).actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    EXPECT_FALSE(shown);  // a reader that waited could not read the box
    EXPECT_TRUE(QTest::qWaitFor([&shown] { return shown; }));
}

}  // namespace
