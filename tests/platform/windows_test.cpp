// Boxes and file dialogs, which window comes to the front, and how windows stand to each other.
#include "platform/window_front.h"
#include "support/program_fixture.h"

namespace {

using WindowsOfTheDesktop = PlayedBoard;

TEST_F(WindowsOfTheDesktop, OnlyItsButtonsAnswerAQuestionAndTheFrontComesBack) {
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
        boxes_.expect("Sure?", answer, [] {
            QWidget& box = *QApplication::activeModalWidget();
            QTest::keyClick(&box, Qt::Key_Escape);
            EXPECT_FALSE(box.close());
            EXPECT_TRUE(box.isVisible());
        });
        EXPECT_EQ(Platform::AskYesNo("Sure?", "Quorle"), answer == QMessageBox::Yes);
        EXPECT_TRUE(comesToFront("Main"));
    }
}

TEST_F(WindowsOfTheDesktop, ASavedFileGetsASuffixAndIsReplacedOnlyWhenAllowed) {
    const auto expectNameTyped = [this](const std::string& name) {
        boxes_.expectModal([=, this](QWidget& dialog) {
            dialog.findChild<QLineEdit*>()->setText(QString::fromStdString(name));
            key(Qt::Key_Return);
        });
    };
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
}

// A box closes: the front is asked for, and the window hides before it comes.
TEST_F(WindowsOfTheDesktop, AFrontThatWasOnlyAskedForIsGivenBackToo) {
    press("Options");
    QWidget elsewhere;
    elsewhere.show();
    elsewhere.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&elsewhere));
    const QSignalBlocker unanswered(control("OptionsDialog")->windowHandle());
    Platform::GiveFrontBack();
    elsewhere.hide();
    Platform::HideWindow(*control("OptionsDialog"));
    EXPECT_TRUE(comesToFront("Main"));
}

TEST_F(WindowsOfTheDesktop, OnWaylandOneLeftOpenIsShownAnew) {
    Platform::OnWayland = [] { return true; };
    press("Options");
    const QSignalSpy shown(control("OptionsDialog")->windowHandle(), &QWindow::visibleChanged);
    press("Options");
    EXPECT_TRUE(comesToFront("OptionsDialog"));
    EXPECT_EQ(shown.count(), 2);  // after it was hidden
}

TEST_F(WindowsOfTheDesktop, OnWaylandNoneResistsBeingMaximised) {
    Platform::OnWayland = [] { return true; };
    for (const std::string name : {"Options", "Dictionary"}) {
        press(name);
        QWidget& window = *QApplication::activeWindow();
        EXPECT_EQ(window.minimumSize(), window.size()) << name;
        EXPECT_GT(window.maximumWidth(), window.width()) << name;
    }
    const QWidget& letters = *control("StartingLetters");
    const QPoint corner = letters.mapTo(letters.window(), QPoint());
    letters.window()->windowHandle()->resize(2000, 1500);
    EXPECT_TRUE(QTest::qWaitFor([&] { return letters.window()->width() == 2000; }));
    EXPECT_EQ(letters.mapTo(letters.window(), QPoint()), corner);
    boxes_.expectPause([] {
        QWidget& box = *QApplication::activeModalWidget();
        EXPECT_TRUE(QTest::qWaitFor([&] { return box.maximumWidth() > box.width(); }));
        const QSize least = box.size();
        box.showMaximized();
        EXPECT_TRUE(QTest::qWaitFor([&] { return box.width() > least.width(); }));
        QCoreApplication::postEvent(&box, new QEvent(QEvent::LayoutRequest));
        QCoreApplication::processEvents();
        EXPECT_GT(box.width(), least.width());
        EXPECT_EQ(box.minimumSize(), least);
    });
    press("Pause");
}

TEST_F(WindowsOfTheDesktop, WhereTheyAreTiledTheOthersHaveAnOwner) {
    press("HelpButton");
    EXPECT_EQ(control("HelpBrowser")->windowHandle()->transientParent(), nullptr);
    qputenv("I3SOCK", "socket");
    press("HelpButton");
    press("End");
    qunsetenv("I3SOCK");
    for (const char* name : {"HelpBrowser", "Results"}) {
        EXPECT_EQ(control(name)->windowHandle()->transientParent(),
                  control("Main")->windowHandle());
    }
}

}  // namespace
