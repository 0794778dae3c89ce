// Submitting words to the player's list.
#include <quorle/word_engine.h>

#include <QTableWidget>

#include "support/program_fixture.h"

namespace {

class Submission : public PlayedBoard {
  protected:
    Submission() { start("CATSBONEWILDHEFY"); }
};

TEST_F(Submission, ListsNewestFirstAndStrikesUnknownWords) {
    enter({"cat"});
    EXPECT_EQ(text("PlayerWordLabel"), "1 word entered");
    type("sta");
    key(Qt::Key_Enter, Qt::KeypadModifier);
    type("bone");
    press("Enter");
    enter({"cat"});  // entered already: silently gone
    EXPECT_EQ(words(), (Words{"bone", "sta", "cat"}));
    EXPECT_EQ(struck(), Words{"sta"});
    EXPECT_EQ(text("PlayerWordLabel"), "3 words entered");
    EXPECT_EQ(entry(), " [] 1");
}

TEST_F(Submission, KeepsTheLimitsOfTheMoment) {
    clickTiles({0, 1});
    key(Qt::Key_Return);
    EXPECT_EQ(clicking({1}),
              "ca [0 1] 1");  // the clicks are forgotten by the submission: this is a second a
    cSetMinWordSize(2);
    key(Qt::Key_Return);
    cSetMaxWordSize(3);
    enter({"cats"});
    EXPECT_EQ(words(), Words{"ca"});
    EXPECT_EQ(entry(), " [] 2");
    replaceAll("CAT");  // in upper case it stays only as what was clicked
    clickTiles({0, 1, 2});
    replaceAll("CAT");
    key(Qt::Key_Return);
    EXPECT_EQ(words(), (Words{"cat", "ca"}));
}

TEST_F(Submission, ReturnSubmitsWhereverTheFocusIs) {
    for (const auto& [name, word] :
         {std::pair("WordList", "cat"), {"Clear", "won"}, {"Exit", "ten"}}) {
        type(word);
        control(name)->setFocus();
        key(Qt::Key_Return);
        EXPECT_EQ(words().front(), word);
    }
    type("con");
    press("Clear");  // buttons and tiles leave the focus where it is
    click(6);
    type("e");
    key(Qt::Key_Escape);
    EXPECT_EQ(typed(), "cone");
}

TEST_F(Submission, TheListShowsItsTopAndIsReadOnly) {
    enter({"cat", "cats", "coat", "con", "bon", "bone", "won", "one", "ton", "tone", "ten", "net"});
    auto& list = *qobject_cast<QTableWidget*>(control("WordList"));
    list.scrollToBottom();
    enter({"now"});
    EXPECT_EQ(list.rowAt(0), 0);
    EXPECT_GE(list.rowHeight(0), QFontMetrics(list.item(0, 0)->font()).height());
    EXPECT_GE(list.columnWidth(0), list.viewport()->width());
    list.setFocus();
    key(Qt::Key_F2);
    type("z");
    EXPECT_EQ(words().front(), "now");
    key(Qt::Key_Tab);
    EXPECT_FALSE(list.hasFocus());
}

}  // namespace
