// Building a word by keys and clicks.
#include <QCoreApplication>
#include <QMouseEvent>

#include "support/boards.h"
#include "support/program_fixture.h"

namespace {

class WordEntry : public PlayedBoard {
  protected:
    // Straight to a tile, for sequences that no single click makes.
    void mouse(QEvent::Type type, int tile, const QPointF& place = {40, 40}) {
        const auto held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, place, place, Qt::LeftButton, held, Qt::NoModifier);
        QCoreApplication::sendEvent(control("Cube" + std::to_string(tile)), &event);
    }

    void replaceAll(const std::string& text) {
        key(Qt::Key_A, Qt::ControlModifier);
        text.empty() ? key(Qt::Key_Delete) : paste(text);
    }
};

TEST_F(WordEntry, TypingLightsTheChainAndTakesTheRestOff) {
    start("CATSBONEWILDHEFY");
    type("coat");
    EXPECT_EQ(litTiles(), (Tiles{0, 1, 2, 5}));
    EXPECT_EQ(warnings(), 0);
    for (const char* wrong : {"z", "S", " ", "1", "c"}) type(wrong);
    type("\xC3\xA9\xF0\x9F\x98\x80");
    EXPECT_EQ(typed(), "coat");
    EXPECT_EQ(warnings(), 5 + 2);
    EXPECT_EQ(litTiles(), (Tiles{0, 1, 2, 5}));
    key(Qt::Key_Backspace);
    EXPECT_EQ(litTiles(), (Tiles{0, 1, 5}));
    key(Qt::Key_Home);
    type("h");  // no h touches c: all but it goes
    EXPECT_EQ(typed(), "h");
    EXPECT_EQ(warnings(), 7 + 3);
    EXPECT_EQ(litTiles(), Tiles{12});
    key(Qt::Key_Backspace);
    EXPECT_EQ(litTiles(), Tiles{});
    State.Sounds = False;
    type("x");
    EXPECT_EQ(warnings(), 10);
}

TEST_F(WordEntry, QuIsOneCube) {
    start("QITAKENSHORDGLUB");
    EXPECT_EQ(letters(), "QuITAKENSHORDGLUB");
    type("q");
    EXPECT_EQ(litTiles(), Tiles{0});
    type("u");
    EXPECT_EQ(litTiles(), Tiles{0});
    type("it");
    EXPECT_EQ(litTiles(), (Tiles{0, 1, 2}));
    key(Qt::Key_Home);
    key(Qt::Key_Right);
    key(Qt::Key_Delete);  // "qit": a q before another letter is nowhere
    EXPECT_EQ(typed(), "q");
    press("Clear");
    click(0);
    EXPECT_EQ(typed(), "qu");
    click(1);
    press("Clear");
    EXPECT_EQ(typed(), "qu");
    EXPECT_EQ(litTiles(), Tiles{0});
    press("Clear");
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(litTiles(), Tiles{});
}

TEST_F(WordEntry, ClicksLightWhatWasClickedAndTheLastOneSubmits) {
    start("CATSCONEWILDHEFY");
    clickTiles({4, 1});
    EXPECT_EQ(typed(), "ca");
    EXPECT_EQ(litTiles(), (Tiles{1, 4}));  // though the trace would take the other c
    click(9);
    EXPECT_EQ(warnings(), 1);
    click(2, Qt::RightButton);
    EXPECT_EQ(typed(), "ca");
    click(2);
    click(2);
    EXPECT_EQ(words(), Words{"cat"});
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(litTiles(), Tiles{});

    type("cat");
    click(2);  // typed, not clicked: no second t, and no submission
    EXPECT_EQ(typed(), "cat");
    EXPECT_EQ(warnings(), 2);
    click(3);  // a click goes on from what was typed, and the trace is lit
    EXPECT_EQ(typed(), "cats");
    EXPECT_EQ(litTiles(), (Tiles{0, 1, 2, 3}));
    replaceAll("");
    mouse(QEvent::MouseButtonPress, 0);
    mouse(QEvent::MouseButtonRelease, 0, {-3, 40});
    EXPECT_EQ(typed(), "");
}

TEST_F(WordEntry, DoubleClickAppendsAndSubmitsOnce) {
    start("CATSBONEWILDHEFY");
    clickTiles({0, 1});
    doubleClick(2);
    EXPECT_EQ(words(), Words{"cat"});
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(warnings(), 0);
    type("cats");
    doubleClick(15);
    EXPECT_EQ(words(), (Words{"cats", "cat"}));
    EXPECT_EQ(warnings(), 2);
    type("coa");
    doubleClick(2);  // the letters typed are no clicks: a second t is tried, and warned of
    EXPECT_EQ(words(), (Words{"coat", "cats", "cat"}));
    EXPECT_EQ(warnings(), 3);

    // Two tiles clicked in a hurry near their border are two clicks.
    click(4);
    mouse(QEvent::MouseButtonPress, 5, {95, 40});
    mouse(QEvent::MouseButtonRelease, 5, {95, 40});
    mouse(QEvent::MouseButtonDblClick, 6, {1, 40});
    mouse(QEvent::MouseButtonRelease, 6, {1, 40});
    EXPECT_EQ(typed(), "bon");
    EXPECT_EQ(litTiles(), (Tiles{4, 5, 6}));
}

TEST_F(WordEntry, ClearTakesBackTheLastClickOrLetter) {
    start("CATSBONEWILDHEFY");
    press("Clear");
    EXPECT_EQ(typed(), "");
    clickTiles({0, 1, 2});
    press("Clear");
    EXPECT_EQ(typed(), "ca");
    EXPECT_EQ(litTiles(), (Tiles{0, 1}));
    click(1);                  // in step again, and clicked last
    EXPECT_EQ(typed(), "ca");  // too short, so it stays
    press("Clear");
    press("Clear");
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(litTiles(), Tiles{});
    EXPECT_EQ(State.PickedCount, 0);
    type("tone");
    press("Clear");
    EXPECT_EQ(typed(), "ton");
    EXPECT_EQ(litTiles(), (Tiles{2, 5, 6}));
    EXPECT_EQ(warnings(), 0);
}

TEST_F(WordEntry, ClicksStayInTheirSlots) {
    start("QITAKENSHORDGLUB");
    click(0);
    type("i");
    press("Clear");  // the click on the first cube is undone: its letters are all there is
    EXPECT_EQ(State.PickedCount, 0);
    type("i");
    press("Clear");
    EXPECT_EQ(State.PickedCount, 0);
    EXPECT_EQ(typed(), "qu");

    start("CATSBONEWILDHEFY");
    for (int i = 0; i < 17; ++i) {
        click(i % 16);
        replaceAll("");
    }
    EXPECT_EQ(State.PickedCount, 17);
    EXPECT_EQ(warnings(), 0);
    const std::string picked = State.PickedWord;
    click(1);
    EXPECT_EQ(warnings(), 1);
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(State.PickedCount, 17);
    EXPECT_EQ(State.PickedWord, picked);
    EXPECT_EQ(litTiles(), Tiles{});
}

TEST_F(WordEntry, TextThatEqualsTheClicksStaysUntilSubmission) {
    start("CATSBONEWILDHEFY");
    click(2);
    replaceAll("T");
    EXPECT_EQ(typed(), "T");
    EXPECT_EQ(litTiles(), Tiles{2});
    click(7);  // "Te" does not trace
    EXPECT_EQ(typed(), "T");
    replaceAll("");
    clickTiles({2});
    replaceAll("");
    clickTiles({2});
    replaceAll("ttt");
    EXPECT_EQ(typed(), "ttt");
    key(Qt::Key_Return);
    EXPECT_EQ(typed(), "");
    EXPECT_EQ(words(), Words{});
    EXPECT_EQ(State.PickedCount, 0);
}

// The typing rule as it stands: the text is cut by one letter, and the rule runs
// again inside itself for the shorter text.
struct Rule {
    const std::string& board;
    std::string text, last, picked;
    Tiles lit;
    int warnings = 0;

    void run() {
        if (!last.empty() && text.empty()) {
            lit.clear();
            return;
        }
        last = text;
        if (picked == toLower(text)) return;
        std::vector<Chain> chains;
        while (!text.empty() && (chains = ChainsOf(board, text)).empty()) {
            ++warnings;
            text.pop_back();
            run();
        }
        lit = text.empty() ? Tiles{} : chains.front();
        std::sort(lit.begin(), lit.end());
    }

    static std::string toLower(std::string word) {
        std::transform(word.begin(), word.end(), word.begin(), ::tolower);
        return word;
    }
};

TEST_F(WordEntry, EveryChangeEndsAsTheNestedRuleDoes) {
    const std::string board = "QITAKENSHORDGLUB";
    start(board);
    const auto below = [this](int n) { return static_cast<int>(randomness_() % unsigned(n)); };
    for (int i = 0; i < 400; ++i) {
        if (below(2) == 0) click(below(16));
        std::string text = typed().substr(0, static_cast<std::size_t>(below(3)));
        for (int length = below(6); length > 0; --length) {
            text += "qitaekenoI"[below(10)];
            if (text.back() == 'q') text += "u";
        }
        if (below(6) == 0) text = State.PickedWord.substr(0, 12);
        if (text == typed()) continue;
        Rule rule{board, text, State.LastTypedText, State.PickedWord, litTiles(), warnings()};
        SCOPED_TRACE("\"" + text + "\" with \"" + rule.picked + "\" clicked");
        rule.run();
        replaceAll(text);
        ASSERT_EQ(typed(), rule.text);
        ASSERT_EQ(State.LastTypedText, rule.last);
        ASSERT_EQ(State.PickedWord, rule.picked);
        ASSERT_EQ(litTiles(), rule.lit);
        ASSERT_EQ(warnings(), rule.warnings);
    }
}

}  // namespace
