// Submitting words to the player's list.
#include <quorle/word_engine.h>

#include <QTableWidget>

#include "support/program_fixture.h"

namespace {

class Submission : public PlayedBoard {};

TEST_F(Submission, ListsNewestFirstAndStrikesUnknownWords) {
    start("CATSBONEWILDHEFY");
    EXPECT_EQ(text("PlayerWordLabel"), "");
    type("cat");
    key(Qt::Key_Return);
    EXPECT_EQ(words(), Words{"cat"});
    EXPECT_EQ(text("PlayerWordLabel"), "1 word entered");
    EXPECT_EQ(warnings(), 0);
    type("sta");
    key(Qt::Key_Enter, Qt::KeypadModifier);
    type("bone");
    press("Enter");
    EXPECT_EQ(words(), (Words{"bone", "sta", "cat"}));
    EXPECT_EQ(struck(), Words{"sta"});
    EXPECT_EQ(text("PlayerWordLabel"), "3 words entered");
    EXPECT_EQ(warnings(), 1);
    type("cat");  // entered already: silently gone
    key(Qt::Key_Return);
    EXPECT_EQ(words().size(), 3U);
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(litTiles(), Tiles{});
    EXPECT_EQ(warnings(), 1);
}

TEST_F(Submission, KeepsTheLimitsOfTheMoment) {
    start("CATSBONEWILDHEFY");
    clickTiles({0, 1});
    key(Qt::Key_Return);
    EXPECT_EQ(typed(), "ca");
    EXPECT_EQ(litTiles(), (Tiles{0, 1}));
    click(1);  // the clicks are forgotten by the submission: this is a second a
    EXPECT_EQ(warnings(), 1);
    cSetMinWordSize(2);
    key(Qt::Key_Return);
    EXPECT_EQ(words(), Words{"ca"});
    cSetMaxWordSize(3);
    type("cats");
    key(Qt::Key_Return);
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(words(), Words{"ca"});
    EXPECT_EQ(warnings(), 2);
    start("QITAKENSHORDGLUB");
    cSetMinWordSize(3);
    click(0);
    key(Qt::Key_Return);
    EXPECT_EQ(typed(), "qu");
    cSetMinWordSize(2);
    key(Qt::Key_Return);
    EXPECT_EQ(words(), Words{"qu"});
}

TEST_F(Submission, ReturnSubmitsWhereverTheFocusIs) {
    start("CATSBONEWILDHEFY");
    for (const auto& [name, word] :
         {std::pair("WordList", "cat"), {"Clear", "won"}, {"Exit", "ten"}}) {
        type(word);
        control(name)->setFocus();
        key(Qt::Key_Return);
        EXPECT_EQ(words().front(), word);
        EXPECT_TRUE(control("NewWord")->hasFocus());
    }
    type("con");
    press("Clear");  // buttons and tiles leave the focus where it is
    click(6);
    type("e");
    EXPECT_EQ(typed(), "cone");
    key(Qt::Key_Escape);
    EXPECT_TRUE(isShown("Main"));
}

TEST_F(Submission, TheListShowsItsTopAndIsReadOnly) {
    start("CATSBONEWILDHEFY");
    auto& list = *qobject_cast<QTableWidget*>(control("WordList"));
    for (const char* word : {"cat", "cats", "coat", "con", "bon", "bone", "won", "one", "ton",
                             "tone", "ten", "net", "tan", "ant"}) {
        type(word);
        key(Qt::Key_Return);
    }
    ASSERT_EQ(list.rowCount(), 14);
    list.scrollToBottom();
    type("now");
    key(Qt::Key_Return);
    EXPECT_EQ(list.rowAt(0), 0);
    EXPECT_EQ(list.currentRow(), 0);
    EXPECT_GE(list.rowHeight(0), QFontMetrics(list.item(0, 0)->font()).height());
    EXPECT_GE(list.columnWidth(0), list.viewport()->width());
    list.setFocus();
    type("z");
    key(Qt::Key_F2);
    type("z");
    EXPECT_EQ(words().front(), "now");
    key(Qt::Key_Tab);
    EXPECT_FALSE(list.hasFocus());
}

}  // namespace
