#include "platform/desktop.h"

#include <QCloseEvent>
#include <QKeyEvent>
#include <QMessageBox>

#include "platform/window_front.h"
#include "platform/window_size.h"

namespace {

// At a question a stray Escape would be taken for a No, so only its buttons answer.
class Question : public QMessageBox {
  public:
    using QMessageBox::QMessageBox;

  protected:
    void closeEvent(QCloseEvent* event) override { event->ignore(); }
    void keyPressEvent(QKeyEvent* event) override {
        if (!event->matches(QKeySequence::Cancel)) QMessageBox::keyPressEvent(event);
    }
};

template <class Box>
QMessageBox::StandardButton Run(const std::string& text, const std::string& title,
                                QMessageBox::StandardButtons buttons) {
    Box box(QMessageBox::NoIcon, QString::fromStdString(title), QString::fromStdString(text),
            buttons, Platform::LatestInFront());
    box.setTextFormat(Qt::PlainText);
    box.setWindowModality(Qt::ApplicationModal);
    Platform::LetGrow(box);
    box.exec();
    const auto pressed = box.standardButton(box.clickedButton());
    box.hide();
    Platform::GiveFrontBack();
    return pressed;
}

}  // namespace

void Platform::ShowMessageBox(const std::string& text, const std::string& title) {
    Run<QMessageBox>(text, title, QMessageBox::Ok);
}

bool Platform::AskInMessageBox(const std::string& text, const std::string& title) {
    return Run<Question>(text, title, QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}
