// Submitting words to the player's list.
#include <quorle/word_engine.h>

#include <QTableWidget>

#include "support/program_fixture.h"

namespace {

using Submission = RunningGame;

TEST_F(Submission, ListsNewestFirstAndStrikesUnknownWords) {
    enter({"cat"});
    EXPECT_EQ(text("PlayerWordLabel"), "1 word entered");
    type("sta");
    key(Qt::Key_Enter, Qt::KeypadModifier);
    type("bone");
    press("Enter");
    enter({"cat"});  // entered already: silently gone
    EXPECT_EQ(words(), (Words{"bone", "sta", "cat"}));
    EXPECT_EQ(words("WordList", true), Words{"sta"});
    EXPECT_EQ(text("PlayerWordLabel"), "3 words entered");
    EXPECT_EQ(entry(), " [] 1");
}

TEST_F(Submission, KeepsTheLimitsOfTheMoment) {
    clickTiles({0, 1});
    key(Qt::Key_Return);
    // the clicks are forgotten by the submission: this is a second a
    EXPECT_EQ(clicking({1}), "ca [0 1] 1");
    cSetMinWordSize(2);
    key(Qt::Key_Return);
    cSetMaxWordSize(3);
    enter({"cats"});
    EXPECT_EQ(words(), Words{"ca"});
    EXPECT_EQ(entry(), " [] 2");
    clickTiles({0, 1, 2});
    replaceAll("CAT");  // in upper case it stays only as what was clicked
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
    auto& list = *control<QTableWidget>("WordList");
    list.scrollToBottom();
    enter({"now"});
    EXPECT_EQ(list.rowAt(0), 0);
    list.setFocus();
    key(Qt::Key_F2);
    type("z");
    EXPECT_EQ(words().front(), "now");
    key(Qt::Key_Tab);
    EXPECT_FALSE(list.hasFocus());
}

}  // namespace
