// Building a word by keys and clicks, and submitting it.
#include "support/program_fixture.h"

namespace {

using WordEntry = RunningGame;

TEST_F(WordEntry, TypingLightsTheChainAndTakesTheRestOff) {
    const QImage unlit = control("Cube5")->grab().toImage();
    EXPECT_EQ(typing("coat"), "coat [0 1 2 5] 0");
    EXPECT_NE(control("Cube5")->grab().toImage(), unlit);
    EXPECT_EQ(typing("zS 1c\xC3\xA9\xF0\x9F\x98\x80"), "coat [0 1 2 5] 7");
    key(Qt::Key_Home);
    EXPECT_EQ(typing("h"), "h [12] 11");  // no h touches c: all but it goes
    EXPECT_EQ(control("Cube5")->grab().toImage(), unlit);
    State.Sounds = False;
    type("x");
    key(Qt::Key_Backspace);
    EXPECT_EQ(entry(), " [] 11");
}

TEST_F(WordEntry, QuIsOneCube) {
    start("QITAKENSHORDGLUB");
    EXPECT_EQ(control("Cube0")->accessibleName(), "Qu");
    EXPECT_EQ(typing("q"), "q [0] 0");
    EXPECT_EQ(typing("uit"), "quit [0 1 2] 0");
    key(Qt::Key_Home);
    key(Qt::Key_Right);
    key(Qt::Key_Delete);  // "qit": a q before another letter is nowhere
    EXPECT_EQ(entry(), "q [0] 2");
    press("Clear");
    clickTiles({0, 1});
    EXPECT_EQ(clearing(), "qu [0] 2");
    EXPECT_EQ(clearing(), " [] 2");
}

TEST_F(WordEntry, ClicksLightWhatWasClickedAndTheLastOneSubmits) {
    start("CATSCONEWILDHEFY");
    EXPECT_EQ(clicking({4, 1}), "ca [1 4] 0");  // though the trace would take the other c
    QTest::mouseClick(control("Cube2"), Qt::RightButton);
    EXPECT_EQ(clicking({9}), "ca [1 4] 1");
    clickTiles({2, 2});
    EXPECT_EQ(words(), Words{"cat"});
    EXPECT_EQ(entry(), " [] 1");
    type("cat");
    // typed, not clicked: no second t, and no submission
    EXPECT_EQ(clicking({2}), "cat [0 1 2] 2");
    // a click goes on from what was typed, and the trace is lit
    EXPECT_EQ(clicking({3}), "cats [0 1 2 3] 2");
    replaceAll("");
    QTest::mousePress(control("Cube0"), Qt::LeftButton);
    QTest::mouseRelease(control("Cube0"), Qt::LeftButton, {}, {-3, 40});
    EXPECT_EQ(typed(), "");
}

TEST_F(WordEntry, DoubleClickAppendsAndSubmitsOnce) {
    clickTiles({0, 1});
    doubleClick(2);
    type("coa");
    doubleClick(2);  // the letters typed are no clicks: a second t is tried, and warned of
    EXPECT_EQ(words(), (Words{"coat", "cat"}));
    EXPECT_EQ(entry(), " [] 1");
    // Two tiles clicked in a hurry near their border are two clicks.
    clickTiles({4, 5});
    QTest::mouseEvent(QTest::MouseDClick, control("Cube6"), Qt::LeftButton, {}, {1, 40});
    QTest::mouseRelease(control("Cube6"), Qt::LeftButton, {}, {1, 40});
    EXPECT_EQ(entry(), "bon [4 5 6] 1");
}

TEST_F(WordEntry, ClearTakesBackTheLastClickOrLetter) {
    press("Clear");
    clickTiles({0, 1, 2});
    EXPECT_EQ(clearing(), "ca [0 1] 0");
    // in step again, and clicked last: submitted, but too short
    EXPECT_EQ(clicking({1}), "ca [0 1] 0");
    // the clicks are forgotten by that: this is a second a
    EXPECT_EQ(clicking({1}), "ca [0 1] 1");
    press("Clear");
    EXPECT_EQ(clearing(), " [] 1");
    type("tone");
    EXPECT_EQ(clearing(), "ton [2 5 6] 1");
}

TEST_F(WordEntry, ClicksStayInTheirSlots) {
    for (int i = 0; i < PickedSlots; ++i) {
        click(i % CubeCount);
        replaceAll("");
    }
    EXPECT_EQ(clicking({1}), " [] 1");
    EXPECT_EQ(State.PickedCount, PickedSlots);
}

TEST_F(WordEntry, WordsAreListedNewestFirstAndUnknownOnesStruckThrough) {
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
    enter({"cats", "coat", "con", "bon", "won", "one", "ton", "tone", "ten", "catsenobwildyfeh"});
    auto& list = *control<QTableWidget>("WordList");
    EXPECT_LT(QFontMetrics(list.item(0, 0)->font()).horizontalAdvance(words()[0].data()),
              list.width());
    list.scrollToBottom();
    cSetMinWordSize(2);
    cSetMaxWordSize(3);
    enter({"no", "tons"});
    EXPECT_EQ(list.item(0, 0)->text(), "no");
    EXPECT_EQ(list.rowAt(0), 0);
}

TEST_F(WordEntry, ReturnSubmitsWhereverTheFocusIs) {
    for (const auto& [name, word] :
         {std::pair("Clear", "won"), {"Exit", "ten"}, {"WordList", "cat"}}) {
        type(word);
        control(name)->setFocus();
        key(Qt::Key_Tab);
        EXPECT_FALSE(control(name)->hasFocus());
        key(Qt::Key_Return);
        EXPECT_EQ(words().front(), word);
    }
    type("con");
    press("Clear");  // buttons and tiles leave the focus where it is
    click(6);
    type("e");
    EXPECT_EQ(typed(), "cone");
}

}  // namespace
