// A player who does anything at any time.
#include <QLineEdit>
#include <QListWidget>
#include <QTimer>
#include <algorithm>
#include <set>

#include "results/scoring.h"
#include "support/boards.h"
#include "support/program_fixture.h"
#include "support/random_player.h"

namespace {

class WildPlayer : public PlayedBoard {
  protected:
    WildPlayer() {
        enterWords();
        playGames();
        readResults();
        player_.expects([this] { checkGame(); });
        player_.expects([this] { checkWord(); });
        player_.expects([this] { checkWordList(); });
        player_.expects([this] { checkResults(); });
    }

    std::string board() {
        std::string all = letters();
        if (const auto qu = all.find("Qu"); qu != all.npos) all.erase(qu + 1, 1);
        return all;
    }
    std::string randomText(int longest) {
        std::string text;
        for (int i = player_.below(longest); i >= 0; --i) {
            const char letter = player_.oneOf(board());
            text += player_.below(12) == 0 ? player_.oneOf(std::string("A .z\xC3\x01"))
                                           : static_cast<char>(letter | 0x20);
        }
        return text;
    }
    void atNewWord(const std::function<void()>& act) {
        bringToFront("Main");
        if (!control("NewWord")->isEnabled()) return;
        control("NewWord")->setFocus();
        act();
    }

    void enterWords() {
        player_.can("type", 30, [this] { atNewWord([this] { type(randomText(2)); }); });
        player_.can("paste", 5, [this] { atNewWord([this] { paste(randomText(30)); }); });
        player_.can("again", 4, [this] {
            atNewWord([this] {
                key(Qt::Key_A, Qt::ControlModifier);
                paste(State.PickedWord);
            });
        });
        player_.can("empty", 5, [this] {
            atNewWord([this] {
                key(Qt::Key_A, Qt::ControlModifier);
                key(Qt::Key_Delete);
            });
        });
        player_.can("back", 5, [this] { atNewWord([this] { key(Qt::Key_Backspace); }); });
        player_.can("home", 2, [this] { atNewWord([this] { key(Qt::Key_Home); }); });
        player_.can("click", 40, [this] { click(player_.below(16)); });
        player_.can("double", 5, [this] { doubleClick(player_.below(16)); });
        player_.can("Clear", 10, [this] { press("Clear"); });
        player_.can("Enter", 8, [this] { press("Enter"); });
        player_.can("Return", 4, [this] { atNewWord([this] { key(Qt::Key_Return); }); });
    }
    void playGames() {
        player_.can("Start", 3, [this] { press("Start"); });
        player_.can("End", 1, [this] { press("End"); });
        player_.can("tick", 10, [this] { tick(player_.below(12)); });
        player_.can("Pause", 1, [this] {
            boxes_.expect("Game paused", "Hit OK when ready to resume.", QMessageBox::Ok,
                          QMessageBox::Ok, [this] {
                              click(player_.below(16));
                              tick();
                          });
            press("Pause");
        });
    }
    void readResults() {
        player_.can("select", 12, [this] { inResults([this] { selectAny(); }); });
        player_.can("accept", 4,
                    [this] { inResults([this] { correct("BadWords", "AddToDict"); }); });
        player_.can("reject", 4,
                    [this] { inResults([this] { correct("DictWords", "RemoveFromDict"); }); });
        player_.can("OK", 2, [this] {
            inResults([this] {
                seconds_ += player_.below(4);
                press("ResultsOK");
            });
        });
        player_.can("discard", 1, [this] { inResults([this] { closeByTitleBar("Results"); }); });
    }
    void inResults(const std::function<void()>& act) {
        if (isShown("Results")) act();
    }
    void selectAny() {
        const std::string list = player_.oneOf(Words{"UserWords", "BadWords", "DictWords"});
        if (!words(list).empty()) select(list, player_.oneOf(words(list)));
    }
    void correct(const std::string& list, const std::string& button) {
        if (qobject_cast<QListWidget*>(control(list))->selectedItems().isEmpty()) {
            const std::string kind = list == "BadWords" ? "bad" : "dictionary";
            boxes_.expect("Quorle", "You must select a word in the '" + kind + "' list first",
                          QMessageBox::Ok, QMessageBox::Ok);
        }
        press(button);
    }

    void checkGame() {
        const bool playing = State.TimeRemaining != 0;
        EXPECT_GE(State.TimeRemaining, 0);
        EXPECT_LE(State.TimeRemaining, State.TimeLimit);
        EXPECT_EQ(control("Main")->findChild<QTimer*>("GameClock")->isActive(), playing);
        EXPECT_EQ(control("NewWord")->isEnabled(), playing);
        EXPECT_EQ(text("TimeRemLabel") == "Time Remaining", playing);
        EXPECT_EQ(text("TimeLeft").empty(), !playing);
        EXPECT_TRUE(isShown("CubeFrame"));
        EXPECT_EQ(State.Paused, False);
        boxes_.verify();
    }
    void checkWord() {
        EXPECT_GE(State.PickedCount, 0);
        ASSERT_LE(State.PickedCount, PickedSlots);
        for (int i = 1; i <= State.PickedCount; ++i) {
            EXPECT_LT(State.PickedCubes[static_cast<std::size_t>(i)], CubeCount);
        }
        std::string lower = typed();
        std::transform(lower.begin(), lower.end(), lower.begin(), ::tolower);
        if (typed().empty()) {
            EXPECT_EQ(litTiles(), Tiles{});
        } else if (lower == State.PickedWord) {
            untraced_ = typed();
        } else if (typed() != untraced_) {
            // A text that equalled the clicks stays when it is submitted and too short.
            untraced_.clear();
            ASSERT_FALSE(ChainsOf(board(), typed()).empty()) << typed() << " on " << board();
        }
        EXPECT_TRUE(State.TimeRemaining != 0 || typed().empty());
    }
    void checkWordList() {
        const Words entered = words();
        EXPECT_EQ(std::set<std::string>(entered.begin(), entered.end()).size(), entered.size());
        for (const std::string& word : entered) {
            EXPECT_GE(word.size(), 3U);
            EXPECT_FALSE(ChainsOf(board(), word).empty()) << word << " on " << board();
        }
        const std::string count = std::to_string(entered.size());
        const std::string shown = text("PlayerWordLabel");
        EXPECT_EQ(shown,
                  entered.empty() ? "" : count + (count == "1" ? " word" : " words") + " entered");
    }
    void checkResults() {
        if (!isShown("Results")) return;
        std::array<Common::Tally, 3> tallies;
        const std::array lists{"UserWords", "BadWords", "DictWords"};
        for (std::size_t i = 0; i < lists.size(); ++i) {
            const Words listed = words(lists[i]);
            EXPECT_TRUE(std::is_sorted(listed.begin(), listed.end())) << lists[i];
            for (const std::string& word : listed) Common::Count(tallies[i], word);
        }
        EXPECT_EQ(text("WordsLabel"), Common::WordsLine(tallies[0], tallies[2]));
        EXPECT_EQ(text("ScoreLabel"), Common::ScoreLine(tallies[0], tallies[2]));
        EXPECT_EQ(text("BadWordsLabel"), Common::BadWordsLine(tallies[1].words));
    }

    RandomPlayer player_;
    std::string untraced_;  // the last text on show that was the clicks'
};

TEST_F(WildPlayer, NeverLeavesTheGameInDisorder) {
    State.TimeLimit = 120;
    player_.play(1000);
}

}  // namespace
