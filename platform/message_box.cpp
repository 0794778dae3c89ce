#include "platform/message_box.h"

#include <QMessageBox>

#include "platform/window_front.h"

namespace {

QMessageBox::StandardButton Run(const std::string& text, const std::string& title,
                                QMessageBox::StandardButtons buttons,
                                QMessageBox::StandardButton escape) {
    QMessageBox box(QMessageBox::NoIcon, QString::fromStdString(title),
                    QString::fromStdString(text), buttons, WindowFront::Latest());
    box.setTextFormat(Qt::PlainText);
    box.setWindowModality(Qt::ApplicationModal);
    box.setEscapeButton(escape);
    box.exec();
    const auto pressed = box.standardButton(box.clickedButton());
    box.hide();
    WindowFront::GiveBack();
    return pressed;
}

}  // namespace

namespace MessageBox {

void Show(const std::string& text, const std::string& title) {
    Run(text, title, QMessageBox::Ok, QMessageBox::Ok);
}

bool Ask(const std::string& text, const std::string& title) {
    return Run(text, title, QMessageBox::Yes | QMessageBox::No, QMessageBox::No) ==
           QMessageBox::Yes;
}

}  // namespace MessageBox
