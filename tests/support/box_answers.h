#pragma once
// Answers the program's modal windows, each when it is up and only if it is the
// one expected.
#include <QMessageBox>
#include <QTimer>
#include <deque>
#include <functional>
#include <string>

class BoxAnswers {
  public:
    BoxAnswers();

    /// The next modal window is a message box with this title, text and buttons;
    /// `whileUp` runs in front of it, then `answer` is pressed.
    void expect(const std::string& title, const std::string& text,
                QMessageBox::StandardButtons buttons, QMessageBox::StandardButton answer,
                const std::function<void()>& whileUp = {});

    /// The same for a message of the program, and for one of its questions.
    void expectMessage(const std::string& text, const std::function<void()>& whileUp = {}) {
        expect("Quorle", text, QMessageBox::Ok, QMessageBox::Ok, whileUp);
    }
    void expectQuestion(const std::string& text, QMessageBox::StandardButton answer,
                        const std::string& title = "Quorle") {
        expect(title, text, QMessageBox::Yes | QMessageBox::No, answer);
    }

    /// The next modal window is handled by `act`, which has to close it.
    void expectModal(const std::function<void(QWidget&)>& act);

    /// Windows that are not expected are handled by `act` instead of failing the test.
    void otherwise(const std::function<void(QWidget&)>& act) { otherwise_ = act; }

    /// Fails when an expected window has not come.
    void verify();

  private:
    void look();

    QTimer timer_;
    std::deque<std::function<void(QWidget&)>> expected_;
    bool busy_ = false;
    int looksInVain_ = 0;
    std::function<void(QWidget&)> otherwise_;
};
