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
        boxes_.expectModal([=](QWidget& dialog) {
            auto* edit = dialog.findChild<QLineEdit*>();
            edit->setText(QString::fromStdString(name));
            QTest::keyClick(edit, Qt::Key_Return);
        });
    }
};

TEST_F(Dialogs, OnlyItsButtonsAnswerAQuestionAndTheFrontComesBack) {
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
        boxes_.expectModal([answer](QWidget& box) {
            const QRect owner = box.parentWidget()->frameGeometry();
            EXPECT_LT((box.frameGeometry().center() - owner.center()).manhattanLength(), 40);
            QTest::keyClick(&box, Qt::Key_Escape);
            EXPECT_FALSE(box.close());
            EXPECT_TRUE(box.isVisible());
            dynamic_cast<QMessageBox&>(box).button(answer)->click();
        });
        EXPECT_EQ(Platform::AskYesNo("Sure?", "Quorle"), answer == QMessageBox::Yes);
        EXPECT_TRUE(comesToFront("Main"));
    }
}

TEST_F(Dialogs, ASavedFileGetsASuffixAndIsReplacedOnlyWhenAllowed) {
    const std::string folder = folder_.path();
    for (const auto& [typed, saved] : {std::pair("words", "/words.txt"), {"a.list", "/a.list"}}) {
        expectNameTyped(typed);
        EXPECT_EQ(Platform::ChooseFileToSave(folder), folder + saved);
    }
    folder_.write("words.txt", "cat\n");
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
        expectNameTyped("words");
        boxes_.expect("words.txt already exists. Do you want to replace it?", answer);
        EXPECT_EQ(Platform::ChooseFileToSave(folder).empty(), answer == QMessageBox::No);
    }
    expectNameTyped("words.txt");
    EXPECT_EQ(Platform::ChooseFileToOpen(folder), folder + "/words.txt");
    boxes_.expectModal([](QWidget& dialog) { QTest::keyClick(&dialog, Qt::Key_Escape); });
    EXPECT_EQ(Platform::ChooseFileToOpen(folder), "");
}

}  // namespace
