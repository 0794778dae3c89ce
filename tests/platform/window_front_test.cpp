// Which window comes to the front, and how windows stand to each other.

#include <QTest>
#include <QWindow>

#include "platform/platform.h"
#include "platform/window_front.h"
#include "support/program_fixture.h"

namespace {

class Fronts : public PlayedBoard {
  protected:
    ~Fronts() override { qunsetenv("I3SOCK"); }
    static void useWayland() {
        Platform::OnWayland = [] { return true; };
    }
};

TEST_F(Fronts, AFrontThatWasOnlyAskedForIsGivenBackToo) {
    press("Options");
    bringToFront("OptionsDialog");
    // A box closes: the front is asked for, and the window hides before it comes.
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

TEST_F(Fronts, OnWaylandAWindowLeftOpenIsShownAnew) {
    useWayland();
    press("Options");
    ASSERT_TRUE(comesToFront("OptionsDialog"));
    bringToFront("Main");
    int shown = 0;
    const auto counted = [&shown](bool visible) { shown += visible; };
    QObject::connect(control("OptionsDialog")->windowHandle(), &QWindow::visibleChanged, counted);
    press("Options");
    EXPECT_TRUE(comesToFront("OptionsDialog"));
    EXPECT_EQ(shown, 1);
}

TEST_F(Fronts, OnWaylandNoWindowResistsBeingMaximised) {
    useWayland();
    relaunch();
    useWayland();
    press("Options");
    press("Dictionary");
    const QWidget* letters = control("StartingLetters");
    const QPoint corner = letters->mapTo(letters->window(), QPoint());
    const QSize large(2000, 1500);
    for (const char* name : {"OptionsDialog", "DictionaryEditor"}) {
        QWidget* window = control(name);
        const QSize least = window->size();
        EXPECT_EQ(window->minimumSize(), least) << name;
        window->windowHandle()->resize(large);
        QTest::qWait(0);
        EXPECT_EQ(window->size(), large) << name;
    }
    EXPECT_EQ(letters->mapTo(letters->window(), QPoint()), corner);
    boxes_.expectModal([](QWidget& box) {
        QTest::qWait(1);
        const QSize least = box.size();
        box.showMaximized();
        QTest::qWait(1);
        const QSize grown = box.size();
        EXPECT_GT(grown.width(), least.width());
        QCoreApplication::postEvent(&box, new QEvent(QEvent::LayoutRequest));
        QTest::qWait(1);
        EXPECT_EQ(box.size(), grown);
        EXPECT_EQ(box.minimumSize(), least);
        QTest::keyClick(&box, Qt::Key_Return);
    });
    Platform::ShowMessage("Text", "Title");
}

TEST_F(Fronts, WhereWindowsAreTiledTheOthersHaveAnOwner) {
    QWindow* owner = control("Main")->windowHandle();
    press("HelpButton");
    EXPECT_EQ(control("HelpBrowser")->windowHandle()->transientParent(), nullptr);
    qputenv("I3SOCK", "socket");
    press("HelpButton");
    press("End");
    for (const char* name : {"HelpBrowser", "Results"}) {
        EXPECT_EQ(control(name)->windowHandle()->transientParent(), owner) << name;
    }
}

}  // namespace
