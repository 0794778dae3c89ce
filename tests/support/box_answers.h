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

    /// The next modal window is handled by `act`, which has to close it.
    void expectModal(const std::function<void(QWidget&)>& act);

    /// Takes any modal window as it comes, closed as by Escape.
    void dismissAll(bool any) { dismissAll_ = any; }

    /// Fails when an expected window has not come.
    void verify();

  private:
    void look();

    QTimer timer_;
    std::deque<std::function<void(QWidget&)>> expected_;
    bool busy_ = false;
    bool dismissAll_ = false;
};
