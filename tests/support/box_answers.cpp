#include "support/box_answers.h"

#include <QTest>
#include <QtWidgets>

BoxAnswers::BoxAnswers() {
    otherwise_ = [](QWidget& window) {
        ADD_FAILURE() << "unexpected: " << window.property("text").toString().toStdString();
    };
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { look(); });
    timer_.start(2);
}

void BoxAnswers::expect(const std::string& text, QMessageBox::StandardButton answer,
                        const std::function<void()>& whileUp, const std::string& title) {
    expectModal([=](QWidget& window) {
        auto* box = qobject_cast<QMessageBox*>(&window);
        ASSERT_NE(box, nullptr);
        EXPECT_EQ(box->windowTitle().toStdString(), title);
        EXPECT_EQ(box->text().toStdString(), text);
        EXPECT_EQ(box->buttons().size(), answer == QMessageBox::Ok ? 1 : 2);
        if (whileUp) whileUp();
        ASSERT_NE(box->button(answer), nullptr);
        QTest::mouseClick(box->button(answer), Qt::LeftButton);
    });
}

// What a test leaves open would hold it for ever, so it is closed, also what no key
// and no title bar closes.
void BoxAnswers::look() {
    QWidget* window = QApplication::activeModalWidget();
    if (window == nullptr || window == inHand_) return;
    timer_.start();  // or it would not go off while a box that opens over this one waits
    QWidget* below = std::exchange(inHand_, window);
    EXPECT_TRUE(QTest::qWaitFor([=] { return window->isActiveWindow(); }))
        << "not in front: " << window->windowTitle().toStdString();
    Act act = otherwise_;
    if (!expected_.empty()) {
        act = expected_.front();
        expected_.pop_front();
    }
    act(*window);
    if (QApplication::activeModalWidget() == window) {
        dynamic_cast<QDialog&>(*window).done(QDialog::Rejected);
    }
    inHand_ = below;
}
