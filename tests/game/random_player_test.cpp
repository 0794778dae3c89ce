// A player who does anything at any time, in every window.
#include <quorle/word_engine.h>

#include <QAbstractButton>
#include <QApplication>
#include <QComboBox>
#include <QLineEdit>
#include <QSignalSpy>
#include <QTest>
#include <QTextBrowser>
#include <QTimer>
#include <algorithm>
#include <iostream>
#include <set>

#include "engine/random_words.h"
#include "platform/platform.h"
#include "results/scoring.h"
#include "support/boards.h"
#include "support/program_fixture.h"
#include "support/random_player.h"

namespace {

class WildPlayer : public PlayedBoard {
  protected:
    WildPlayer() {
        folder_.write("program/Quorle.htm", "<p><a href=\"more.htm\">more</a> <p>Help");
        folder_.write("program/more.htm", "<p><a href=\"Quorle.htm\">less</a>");
        folder_.write("small",
                      "dog owl don't \xFF\xFE x" + std::string(3000, 'y') + " tea\r\nseat");
        std::string many;
        for (const auto& word : RandomWords(1).words(20'000, 9, 5)) many += word + "\n";
        folder_.write("many", many);
        boxes_.otherwise([this](QWidget& box) { answer(box); });
        enterWords();
        playGames();
        readResults();
        editTheDictionary();
        useOtherWindows();
        player_.expects([this] { checkGame(); });
        player_.expects([this] { checkWord(); });
        player_.expects([this] { checkWordList(); });
        player_.expects([this] { checkResults(); });
        relaunch();
    }

    // What may happen while a box is up, and one of its ways to be closed.
    void answer(QWidget& window) {
        auto* box = qobject_cast<QMessageBox*>(&window);
        ASSERT_NE(box, nullptr);
        const bool pause = box->windowTitle() == "Game paused";
        EXPECT_EQ(State.Paused, ToBoolean(pause));
        EXPECT_EQ(isShown("Main") && !isShown("CubeFrame"), pause);
        const std::string before = typed();
        if (player_.below(3) == 0) click(player_.below(16));
        EXPECT_EQ(typed(), before);
        if (player_.below(3) == 0) countedTicks(1 + player_.below(3));
        const Qt::Key keys[] = {Qt::Key_Escape, Qt::Key_Return, Qt::Key_Space};
        if (player_.below(2) == 0) return QTest::keyClick(box, keys[player_.below(3)]);
        QTest::mouseClick(player_.oneOf(box->buttons()), Qt::LeftButton);
    }
    void countedTicks(int times) {
        const int before = State.TimeRemaining;
        tick(times);
        if (State.TimeRemaining < before) ticks_ += before - State.TimeRemaining;
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
            text += player_.below(12) == 0
                        ? player_.oneOf(Words{"A", " ", ".", "z", "\xC3\xA9", "\x01", "\n", "\t",
                                              "\xD7\xA9", "\xE2\x80\xAE", "\xF0\x9F\x98\x80"})
                        : std::string(1, static_cast<char>(letter | 0x20));
        }
        return text;
    }
    void in(const std::string& window, const std::function<void()>& act) {
        if (!isShown(window)) return;
        bringToFront(window);
        act();
    }
    void atNewWord(const std::string& name, int weight, const std::function<void()>& act) {
        player_.can(name, weight, [this, act] {
            bringToFront("Main");
            if (!control("NewWord")->isEnabled()) return;
            control("NewWord")->setFocus();
            act();
        });
    }

    void enterWords() {
        atNewWord("letter", 30, [this] { typeLetter(); });
        atNewWord("type", 5, [this] { type(randomText(3)); });
        atNewWord("paste", 5, [this] { paste(randomText(30)); });
        atNewWord("flood", 1, [this] { paste(std::string(30'000, "ae\n"[player_.below(3)])); });
        atNewWord("again", 4, [this] { replaceAll(State.PickedWord); });
        atNewWord("empty", 5, [this] { replaceAll(""); });
        atNewWord("back", 5, [this] { key(Qt::Key_Backspace); });
        atNewWord("home", 2, [this] { key(Qt::Key_Home); });
        atNewWord("storm", 1, [this] {
            const std::string letter = randomText(1);
            for (int i = 0; i < 100; ++i)
                player_.below(9) == 0 ? key(Qt::Key_Return) : type(letter);
        });
        player_.can("click", 40, [this] { click(player_.below(16)); });
        player_.can("double", 5, [this] { doubleClick(player_.below(16)); });
        player_.can("Clear", 10, [this] { press("Clear"); });
        player_.can("Enter", 8, [this] { press("Enter"); });
        atNewWord("Return", 4, [this] { key(Qt::Key_Return); });
    }
    /// What lies on the board is lit by its first chain, unless it was clicked.
    void typeLetter() {
        const QSignalSpy changes(qobject_cast<QLineEdit*>(control("NewWord")),
                                 &QLineEdit::textChanged);
        type(std::string(1, static_cast<char>(player_.oneOf(board()) | 0x20)));
        if (changes.isEmpty() || typed().empty() || typed() == State.PickedWord) return;
        const std::vector<Chain> chains = ChainsOf(board(), typed());
        if (chains.empty()) return;  // for checkWord
        Tiles first = chains.front();
        std::sort(first.begin(), first.end());
        EXPECT_EQ(litTiles(), first) << typed() << " on " << board();
    }
    void playGames() {
        player_.can("Start", 3, [this] { press("Start"); });
        player_.can("End", 1, [this] { press("End"); });
        player_.can("Pause", 1, [this] { press("Pause"); });
        player_.can("tick", 12, [this] {
            if (player_.below(3) > 0) bringToFront("Main");
            countedTicks(player_.below(15));
        });
        player_.can("hurry", 1, [this] {
            for (int i = 0; i < 15; ++i) press(player_.oneOf(Words{"Start", "End", "Pause"}));
        });
        player_.can("sleep", 1, [this] { seconds_ += 10'000; });
        player_.can("Exit", 1, [this] {
            if (player_.below(3) > 0) return;
            press("Exit");
            EXPECT_FALSE(isShown("Main"));
            relaunch();
        });
    }
    void readResults() {
        const Words lists{"UserWords", "BadWords", "DictWords"};
        const auto act = [this](const std::string& name, int weight, const auto& action) {
            player_.can(name, weight, [this, action] { in("Results", action); });
        };
        act("select", 12, [this, lists] {
            const std::string list = player_.oneOf(lists);
            if (!words(list).empty()) select(list, player_.oneOf(words(list)));
        });
        act("accept", 5, [this] { press("AddToDict"); });
        act("reject", 5, [this] { press("RemoveFromDict"); });
        act("OK", 3, [this] {
            seconds_ += player_.below(4);
            press("ResultsOK");
        });
        act("discard", 1, [this] { closeByTitleBar("Results"); });
    }
    void editTheDictionary() {
        const auto act = [this](const std::string& name, int weight, const auto& action) {
            player_.can(name, weight, [this, action] {
                in("DictionaryEditor", [this, action] {
                    action();
                    if (isShown("DictionaryEditor")) checkEditor();
                });
            });
        };
        Platform::ChooseFileToOpen = [](const auto&) { return ""; };
        player_.can("Dictionary", 2, [this] { press("Main/Dictionary"); });
        act("add", 4, [this] {
            control("DictionaryEditor/NewWord")->setFocus();
            enter({randomText(5)});
        });
        act("prefix", 4, [this] {
            auto& box = *qobject_cast<QComboBox*>(control("StartingLetters"));
            if (box.count() > 0) box.setCurrentIndex(player_.below(box.count()));
        });
        act("remove", 4, [this] {
            const Words listed = words("DictionaryEditor/WordList");
            if (!listed.empty()) select("DictionaryEditor/WordList", player_.oneOf(listed));
            press("Remove");
            EXPECT_EQ(text("WordCount"), std::to_string(cNumberOfWords()) + " words");
        });
        act("clear", 1, [this] { menu("DictionaryEditor/Clear"); });
        act("merge", 2, [this] {
            const Words names{"small", "many", "missing", "program"};
            const std::string path = player_.below(5) == 0 ? "" : folder_ / player_.oneOf(names);
            Platform::ChooseFileToOpen = [path](const auto&) { return path; };
            menu("DictionaryEditor/Merge");
        });
        act("save", 1, [this] {
            const std::string path = folder_ / player_.oneOf(Words{"saved.txt", "no/folder"});
            Platform::ChooseFileToSave = [path](const auto&) { return path; };
            menu("DictionaryEditor/SaveAs");
        });
        act("leave", 1, [this] {
            player_.below(2) == 0 ? key(Qt::Key_Escape) : closeByTitleBar("DictionaryEditor");
        });
    }
    void checkEditor() {
        const auto& box = *qobject_cast<QComboBox*>(control("StartingLetters"));
        const Words listed = words("DictionaryEditor/WordList");
        EXPECT_TRUE(std::is_sorted(listed.begin(), listed.end()));
        const std::string prefix = box.currentText().toLower().toStdString();
        for (const auto& word : listed) EXPECT_EQ(word.substr(0, 2), prefix);
    }
    void useOtherWindows() {
        player_.can("Options", 2, [this] { press("Options"); });
        player_.can("choose", 4, [this] {
            in("OptionsDialog", [this] {
                auto& box = *qobject_cast<QComboBox*>(control(
                    player_.oneOf(Words{"TimeCombo", "MinWordSizeCombo", "WordSizeCombo"})));
                box.setCurrentIndex(player_.below(box.count() + 1) - 1);
                if (player_.below(3) == 0) press("SoundsOption");
            });
        });
        player_.can("decide", 2, [this] {
            in("OptionsDialog", [this] {
                player_.below(4) == 0 ? closeByTitleBar("OptionsDialog")
                                      : press(player_.oneOf(Words{"OKButton", "CancelButton"}));
            });
        });
        player_.can("Help", 1, [this] { press("HelpButton"); });
        player_.can("read", 3, [this] {
            in("HelpBrowser", [this] {
                const Words commands{"Back", "Forward", "Contents", "Exit", "", ""};
                const std::string& command = player_.oneOf(commands);
                if (!command.empty()) return menu("HelpBrowser/" + command);
                control("WebBrowser")->setFocus();
                key(Qt::Key_Tab);
                key(Qt::Key_Return);
            });
        });
        player_.can("put away", 1,
                    [this] { in("HelpBrowser", [this] { closeByTitleBar("HelpBrowser"); }); });
    }

    void checkGame() {
        const bool playing = State.TimeRemaining != 0;
        EXPECT_TRUE(State.TimeRemaining >= 0 && State.TimeRemaining <= 300);
        EXPECT_EQ(control("Main")->findChild<QTimer*>("GameClock")->isActive(), playing);
        EXPECT_EQ(control("NewWord")->isEnabled(), playing);
        EXPECT_EQ(text("TimeRemLabel") == "Time Remaining", playing);
        EXPECT_EQ(text("TimeLeft").empty(), !playing);
        EXPECT_TRUE(isShown("CubeFrame"));
        EXPECT_EQ(State.Paused, False);
        EXPECT_EQ(QApplication::activeModalWidget(), nullptr);
    }
    void checkWord() {
        ASSERT_TRUE(State.PickedCount >= 0 && State.PickedCount <= PickedSlots);
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
            EXPECT_TRUE(word.size() >= 3 && !ChainsOf(board(), word).empty()) << word;
        }
        const std::string count = std::to_string(entered.size());
        EXPECT_EQ(text("PlayerWordLabel"),
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
        EXPECT_EQ(summary(), Common::WordsLine(tallies[0], tallies[2]) + "; " +
                                 Common::ScoreLine(tallies[0], tallies[2]) + "; " +
                                 Common::BadWordsLine(tallies[1].words));
    }

    RandomPlayer player_;
    std::string untraced_;  // the last text on show that was the clicks'
    int ticks_ = 0;
};

TEST_F(WildPlayer, NeverLeavesTheGameInDisorder) {
    player_.play(1000);
    EXPECT_TRUE(QTest::qWaitFor([this] { return !isShown("Progress"); }, 60'000));
    std::cout << ticks_ << " seconds of games, " << drawn_ / 32 << " games" << std::endl;
    press("Main/Exit");
    endProgram();
    EXPECT_EQ(QApplication::topLevelWidgets().size(), 0);
}

}  // namespace
