#include "support/box_answers.h"

#include <gtest/gtest.h>

#include <QAbstractButton>
#include <QApplication>
#include <QTest>

namespace {

constexpr int LookInterval = 2;  // milliseconds
constexpr int MostLooksInVain = 2500;

std::string TextOf(const QWidget& window) {
    const auto* box = qobject_cast<const QMessageBox*>(&window);
    return (box == nullptr ? window.objectName() : box->text()).toStdString();
}

// Also what no key and no title bar closes.
void Dismiss(QWidget& window) {
    dynamic_cast<QDialog&>(window).done(QDialog::Rejected);
}

}  // namespace

BoxAnswers::BoxAnswers() {
    otherwise_ = [](QWidget& window) { ADD_FAILURE() << "unexpected: " << TextOf(window); };
    timer_.setInterval(LookInterval);
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { look(); });
    timer_.start();
}

void BoxAnswers::expect(const std::string& title, const std::string& text,
                        QMessageBox::StandardButtons buttons, QMessageBox::StandardButton answer,
                        const std::function<void()>& whileUp) {
    expectModal([=](QWidget& window) {
        auto* box = qobject_cast<QMessageBox*>(&window);
        ASSERT_NE(box, nullptr) << "no message box, but " << TextOf(window);
        EXPECT_EQ(box->windowTitle().toStdString(), title);
        EXPECT_EQ(box->text().toStdString(), text);
        EXPECT_EQ(box->standardButtons(), buttons);
        EXPECT_EQ(box->icon(), QMessageBox::NoIcon);
        EXPECT_EQ(box->windowModality(), Qt::ApplicationModal);
        if (whileUp) whileUp();
        ASSERT_NE(box->button(answer), nullptr);
        QTest::mouseClick(box->button(answer), Qt::LeftButton);
    });
}

void BoxAnswers::expectModal(const std::function<void(QWidget&)>& act) {
    expected_.push_back(act);
}

// What a test leaves open would hold it for ever, so it is closed.
void BoxAnswers::look() {
    QWidget* window = QApplication::activeModalWidget();
    if (busy_ || window == nullptr) return;
    if (!window->isActiveWindow()) {
        if (++looksInVain_ < MostLooksInVain) return;
        ADD_FAILURE() << "not in front: " << TextOf(*window);
        Dismiss(*window);
        return;
    }
    looksInVain_ = 0;
    busy_ = true;
    if (expected_.empty()) {
        otherwise_(*window);
    } else {
        const auto act = expected_.front();
        expected_.pop_front();
        act(*window);
    }
    if (QApplication::activeModalWidget() == window) Dismiss(*window);
    busy_ = false;
}

void BoxAnswers::verify() {
    EXPECT_TRUE(expected_.empty()) << expected_.size() << " expected windows have not come";
    expected_.clear();
}
