// Boxes and file dialogs as the platform layer shows them.

#include <QAbstractButton>
#include <QLineEdit>
#include <QTest>

#include "platform/platform.h"
#include "support/program_fixture.h"

namespace {

class Dialogs : public PlayedBoard {
  protected:
    void expectNameTyped(const std::string& name) {
        boxes_.expectModal([=](QWidget& window) {
            EXPECT_EQ(window.objectName(), "CommonDialog");
            auto* edit = window.findChild<QLineEdit*>();
            ASSERT_NE(edit, nullptr);
            edit->setText(QString::fromStdString(name));
            QTest::keyClick(edit, Qt::Key_Return);
        });
    }
};

TEST_F(Dialogs, OnlyItsButtonsAnswerAQuestionAndTheFrontComesBack) {
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
        boxes_.expectModal([answer](QWidget& box) {
            EXPECT_EQ(box.parentWidget()->objectName(), "Main");
            EXPECT_LT((box.frameGeometry().center() - box.parentWidget()->frameGeometry().center())
                          .manhattanLength(),
                      40);
            QTest::keyClick(&box, Qt::Key_Escape);
            EXPECT_FALSE(box.close());
            EXPECT_TRUE(box.isVisible());
            dynamic_cast<QMessageBox&>(box).button(answer)->click();
        });
        EXPECT_EQ(Platform::AskYesNo("Sure?", "Quorle"), answer == QMessageBox::Yes);
        EXPECT_TRUE(comesToFront("Main"));
        EXPECT_EQ(Platform::WindowInFront(), 1);
    }
    boxes_.expectModal([](QWidget& box) { QTest::keyClick(&box, Qt::Key_Escape); });
    Platform::ShowMessage("Done.", "Quorle");
}

TEST_F(Dialogs, ASavedFileGetsASuffixAndIsReplacedOnlyWhenAllowed) {
    const std::string folder = folder_.path();
    expectNameTyped("words");
    EXPECT_EQ(Platform::ChooseFileToSave(folder), folder + "/words.txt");
    folder_.write("words.txt", "cat\n");
    expectNameTyped("words");
    boxes_.expectQuestion("words.txt already exists. Do you want to replace it?", QMessageBox::No);
    EXPECT_EQ(Platform::ChooseFileToSave(folder), "");
    expectNameTyped("words");
    boxes_.expectQuestion("words.txt already exists. Do you want to replace it?", QMessageBox::Yes);
    EXPECT_EQ(Platform::ChooseFileToSave(folder), folder + "/words.txt");
    expectNameTyped("words.list");
    EXPECT_EQ(Platform::ChooseFileToSave(folder), folder + "/words.list");
    boxes_.expectModal([](QWidget& dialog) { QTest::keyClick(&dialog, Qt::Key_Escape); });
    EXPECT_EQ(Platform::ChooseFileToOpen(folder), "");
    expectNameTyped("words.txt");
    EXPECT_EQ(Platform::ChooseFileToOpen(folder), folder + "/words.txt");
}

}  // namespace
