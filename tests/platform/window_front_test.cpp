// Which window comes to the front, and how windows stand to each other.
#include "platform/window_front.h"

#include <QTest>
#include <QWindow>

#include "platform/platform.h"
#include "support/program_fixture.h"

namespace {

class Fronts : public PlayedBoard {
  protected:
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
    WindowFront::GiveBack();
    elsewhere.hide();
    WindowFront::Hide(*control("OptionsDialog"));
    EXPECT_TRUE(comesToFront("Main"));
}

TEST_F(Fronts, OnWaylandAWindowLeftOpenIsShownAnew) {
    useWayland();
    press("Options");
    int shown = 0;
    QObject::connect(control("OptionsDialog")->windowHandle(), &QWindow::visibleChanged,
                     [&shown](bool visible) { shown += visible; });
    press("Options");
    EXPECT_TRUE(comesToFront("OptionsDialog"));
    EXPECT_EQ(shown, 1);
}

TEST_F(Fronts, OnWaylandNoWindowResistsBeingMaximised) {
    useWayland();
    const QSize large(2000, 1500);
    for (const std::string name : {"Options", "Dictionary"}) {
        press(name);
        QWidget* window = QApplication::activeWindow();
        const QSize least = window->size();
        EXPECT_EQ(window->minimumSize(), least) << name;
        window->windowHandle()->resize(large);
        QTest::qWait(0);
        EXPECT_EQ(window->size(), large) << name;
    }
    boxes_.expectModal([](QWidget& box) {
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
    press("Pause");
}

TEST_F(Fronts, WhereWindowsAreTiledTheOthersHaveAnOwner) {
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
