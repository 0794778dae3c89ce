#pragma once
// Answers the program's modal windows, each when it is up and only if it is the
// one expected.
#include <gtest/gtest.h>

#include <QMessageBox>
#include <QTimer>
#include <deque>
#include <functional>
#include <string>

class BoxAnswers {
  public:
    using Act = std::function<void(QWidget&)>;

    BoxAnswers();
    ~BoxAnswers() { EXPECT_TRUE(expected_.empty()) << "an expected window has not come"; }

    /// The next modal window is a message box with this text, and an OK or a Yes and
    /// a No; `whileUp` runs in front of it, then `answer` is pressed.
    void expect(const std::string& text, QMessageBox::StandardButton answer = QMessageBox::Ok,
                const std::function<void()>& whileUp = {}, const std::string& title = "Quorle");
    void expectPause(const std::function<void()>& whileUp) {
        expect("Hit OK when ready to resume.", QMessageBox::Ok, whileUp, "Game paused");
    }
    void expectSaveQuestion(QMessageBox::StandardButton answer,
                            const std::function<void()>& whileUp = {}) {
        expect("Dictionary has been updated, do you want to save it?", answer, whileUp,
               "Save dictionary?");
    }

    /// The next modal window is handled by `act`, which has to close it.
    void expectModal(const Act& act) { expected_.push_back(act); }

    /// Windows that are not expected are handled by `act` instead of failing the test.
    void otherwise(const Act& act) { otherwise_ = act; }

  private:
    void look();

    QTimer timer_;
    std::deque<Act> expected_;
    Act otherwise_;
    QWidget* inHand_ = nullptr;
};
