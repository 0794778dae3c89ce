// A player who does anything at any time, in every window. A run can be repeated and made longer:
// its seed is printed, and taken from QUORLE_SEED where set; QUORLE_ACTIONS is the number of
// actions.
#include <algorithm>
#include <iostream>
#include <set>

#include "engine/calls.h"
#include "support/chains.h"
#include "support/program_fixture.h"

namespace {

constexpr const char* Editor = "DictionaryEditor";
constexpr const char* EditorList = "DictionaryEditor/WordList";

/// Where the player acts, if this window or control is on show and can be used; and what.
using Action = std::pair<std::string, std::function<void()>>;

class WildPlayer : public PlayedBoard {
  protected:
    WildPlayer() {
        const QString any = QString::number(std::random_device()());
        const unsigned seed = qEnvironmentVariable("QUORLE_SEED", any).toUInt();
        std::cout << "QUORLE_SEED=" << seed << std::endl;
        random_.seed(seed);
        folder_.write("small", "dog don't \xFF\xFE x" + std::string(3000, 'y') + " tea\r\nseat");
        std::string many;
        Random words;
        for (int i = 0; i < 20'000; ++i) many += Text(words, 2 + words() % 4, "uaqeistrn") + "\n";
        folder_.write("many", many);
        boxes_.otherwise([this](QWidget& box) { answer(box); });
        enterWords();
        useWindows();
    }

    int below(int n) { return static_cast<int>(random_() % static_cast<unsigned>(n)); }
    template <class Container>
    const auto& oneOf(const Container& all) {
        return all[static_cast<std::size_t>(below(static_cast<int>(all.size())))];
    }
    std::string letter() { return {static_cast<char>(oneOf(letters()) | 0x20)}; }
    std::string randomText(int longest) {
        const Words odd{"A", " ", "\xC3\xA9", "\x01", "\n", "\xE2\x80\xAE", "\xF0\x9F\x98\x80"};
        std::string text;
        for (int i = below(longest); i >= 0; --i) text += below(12) == 0 ? oneOf(odd) : letter();
        return text;
    }

    void can(std::size_t weight, const std::string& where, const std::function<void()>& act) {
        const auto go = [=, this] {
            if (!isShown(where) || !control(where)->isEnabled()) return;
            bringToFront(where);
            if (control(where)->focusPolicy() != Qt::NoFocus) control(where)->setFocus();
            act();
        };
        actions_.insert(actions_.end(), weight, {where, go});
    }
    void play(unsigned actions) {
        std::string done;
        while (actions-- > 0 && !HasFailure()) {
            const auto& [where, act] = oneOf(actions_);
            done = (where + " " + done).substr(0, 300);
            SCOPED_TRACE(std::to_string(actions) + " actions before the end, after " + done);
            EXPECT_NO_THROW({
                act();
                check();
            });
        }
    }

    // What may happen while a box is up, and one of its ways to be closed.
    void answer(QWidget& window) {
        auto* box = qobject_cast<QMessageBox*>(&window);
        ASSERT_NE(box, nullptr);
        const bool pause = box->windowTitle() == "Game paused";
        EXPECT_EQ(State.Paused, ToBoolean(pause));
        EXPECT_EQ(isShown("Main") && !isShown("CubeFrame"), pause);
        const std::string before = typed();
        if (below(3) == 0) click(below(16));
        EXPECT_EQ(typed(), before);
        if (below(3) == 0) tick(1 + below(3));
        const Qt::Key keys[] = {Qt::Key_Escape, Qt::Key_Return, Qt::Key_Space};
        if (below(2) == 0) QTest::keyClick(box, keys[below(3)]);
        if (box->isVisible()) QTest::mouseClick(oneOf(box->buttons()), Qt::LeftButton);
    }

    void enterWords() {
        can(30, "NewWord", [this] { type(letter()); });
        can(5, "NewWord", [this] { type(randomText(3)); });
        can(5, "NewWord", [this] { paste(randomText(30)); });
        can(1, "NewWord", [this] { paste(std::string(30'000, "ae\n"[below(3)])); });
        can(4, "NewWord", [this] { replaceAll(State.PickedWord); });
        can(5, "NewWord", [this] { replaceAll(""); });
        for (const auto pressed : {Qt::Key_Backspace, Qt::Key_Home, Qt::Key_Return}) {
            can(4, "NewWord", [=, this] { key(pressed); });
        }
        can(40, "Main", [this] { click(below(16)); });
        can(5, "Main", [this] { doubleClick(below(16)), untraced_ = typed(); });
    }
    void useWindows() {
        for (const char* button :
             {"Clear", "Clear", "Enter", "Enter", "Start", "Main/Dictionary", "Options",
              "AddToDict", "AddToDict", "RemoveFromDict", "ResultsOK", "Remove", "OKButton", "End",
              "Pause", "HelpButton", "SoundsOption", "CancelButton"}) {
            can(2, button, [=, this] { press(button); });
        }
        for (const char* name :
             {"TimeCombo", "MinWordSizeCombo", "WordSizeCombo", "StartingLetters"}) {
            can(2, name, [=, this] {
                auto& box = *control<QComboBox>(name);
                if (box.count() > 0) box.setCurrentIndex(below(box.count()));
            });
        }
        for (const char* list : {"UserWords", "BadWords", "DictWords", EditorList}) {
            can(4, list, [=, this] {
                if (!words(list).empty()) select(list, oneOf(words(list)));
            });
        }
        for (const std::string window : {"Results", "OptionsDialog", "HelpBrowser", Editor}) {
            can(1, window, [=, this] { closeByTitleBar(window); });
        }
        for (const std::string command : {"Merge", "Merge", "SaveAs", "Clear"}) {
            can(1, Editor, [=, this] {
                const std::string path = folder_ / oneOf(Words{"small", "many", "no/file"});
                const auto choose = [path](const auto&) { return path; };
                Platform::ChooseFileToOpen = choose;
                Platform::ChooseFileToSave = choose;
                menu(Editor + ("/" + command));
            });
        }
        can(4, "DictionaryEditor/NewWord", [this] { enter({randomText(5)}); });
        can(20, "Main", [this] { seconds_ += below(4), tick(below(15)); });
        can(1, "Exit", [this] {
            if (below(3) > 0) return;
            press("Exit");
            EXPECT_FALSE(isShown("Main"));
            launch();
        });
    }

    void check() {
        const bool playing = State.TimeRemaining != 0;
        EXPECT_TRUE(State.TimeRemaining >= 0 && State.TimeRemaining <= 300);
        EXPECT_EQ(control<QTimer>("GameClock")->isActive(), playing);
        EXPECT_EQ(control("NewWord")->isEnabled(), playing);
        EXPECT_EQ(text("TimeLeft").empty(), !playing);
        EXPECT_TRUE(playing || typed().empty());
        EXPECT_TRUE(isShown("CubeFrame"));
        checkWord();
        const Words entered = words();
        for (const std::string& word : entered) {
            EXPECT_TRUE(word.size() >= 3 && Lies(letters(), word)) << word;
        }
        EXPECT_EQ(std::set<std::string>(entered.begin(), entered.end()).size(), entered.size());
        if (!isShown(Editor)) return;
        const QString prefix = control<QComboBox>("StartingLetters")->currentText();
        for (const auto& word : words(EditorList)) {
            EXPECT_EQ(word.substr(0, 2), prefix.toLower().toStdString());
        }
    }
    void checkWord() {
        std::string lower = typed();
        std::transform(lower.begin(), lower.end(), lower.begin(), ::tolower);
        if (typed().empty()) {
            EXPECT_EQ(litTiles(), Tiles{});
        } else if (lower == State.PickedWord) {
            untraced_ = typed();
        } else if (typed() != untraced_) {
            // A text that equalled the clicks stays when it is submitted and too short.
            untraced_.clear();
            Tiles first = FirstChain(letters(), typed());
            std::sort(first.begin(), first.end());
            EXPECT_EQ(litTiles(), first) << typed() << " on " << letters();
        }
    }

    std::mt19937 random_;
    std::vector<Action> actions_;
    std::string untraced_;  // the last text on show that was the clicks'
};

TEST_F(WildPlayer, NeverLeavesTheGameInDisorder) {
    play(qEnvironmentVariable("QUORLE_ACTIONS", "1000").toUInt());
    EXPECT_TRUE(QTest::qWaitFor([this] { return !isShown("Progress"); }, 60'000));
    press("Main/Exit");
    endProgram();
    EXPECT_EQ(QApplication::topLevelWidgets().size(), 0);
}

}  // namespace
