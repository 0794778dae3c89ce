#include <gtest/gtest.h>

#include <QApplication>

#include "engine/temp_folder.h"
#include "support/game_fixture.h"

// No test may touch the screen or the home of whoever runs it.
int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    const TempFolder home;
    UseHome(home.path());
    setenv("QT_QPA_PLATFORM", "offscreen", 1);
    unsetenv("QT_SCALE_FACTOR");
    QApplication application(argc, argv);
    QApplication::setQuitOnLastWindowClosed(false);
    return RUN_ALL_TESTS();
}
