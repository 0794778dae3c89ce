#include <QAction>
#include <QFile>
#include <QTextBrowser>

#include "support/program_fixture.h"

namespace {

int Messages = 0;  // written to the terminal by the toolkit

class Help : public ProgramFixture {
  protected:
    Help() {
        write("Quorle.htm", "<title>T</title><p><a href=\"more.htm\">more</a> <p>Help");
        write("more.htm", "<p>More");
        launch();
    }

    void write(const char* name, const QByteArray& page) {
        QFile file(QString::fromStdString(folder_ / "program/") + name);
        EXPECT_TRUE(file.open(QFile::WriteOnly));
        file.write(page);
    }

    QTextBrowser& viewer() { return *qobject_cast<QTextBrowser*>(control("WebBrowser")); }

    std::string page() { return viewer().source().fileName().toStdString(); }

    void command(const char* name) { control("HelpBrowser")->findChild<QAction*>(name)->trigger(); }

    void followLink() {
        viewer().setFocus();
        key(Qt::Key_Tab);
        key(Qt::Key_Return);
    }
};

TEST_F(Help, WalksThroughTheHistoryThatTheTitleBarDrops) {
    press("HelpButton");
    bringToFront("HelpBrowser");
    EXPECT_EQ(viewer().geometry().bottom(), control("HelpBrowser")->rect().bottom());
    command("Back");
    command("Forward");
    EXPECT_EQ(page(), "Quorle.htm");
    followLink();
    EXPECT_EQ(page(), "more.htm");
    EXPECT_EQ(viewer().toPlainText(), "More");
    command("Back");
    EXPECT_EQ(page(), "Quorle.htm");
    command("Forward");
    EXPECT_EQ(page(), "more.htm");
    command("Contents");
    EXPECT_EQ(page(), "Quorle.htm");
    command("Back");
    EXPECT_EQ(page(), "more.htm");
    command("Exit");
    EXPECT_FALSE(isShown("HelpBrowser"));
    press("HelpButton");
    EXPECT_EQ(page(), "Quorle.htm");
    command("Back");
    EXPECT_EQ(page(), "more.htm");
    closeByTitleBar("HelpBrowser");
    press("HelpButton");
    command("Back");
    EXPECT_EQ(page(), "Quorle.htm");
}

TEST_F(Help, AMissingPageIsToldInItsPlaceAlone) {
    write("Quorle.htm", "");
    const auto previous =
        qInstallMessageHandler([](QtMsgType, const QMessageLogContext&, const QString& text) {
            Messages += text.startsWith("This plugin does not support") ? 0 : 1;
        });
    press("HelpButton");
    qInstallMessageHandler(previous);
    EXPECT_TRUE(viewer().toPlainText().contains("Quorle.htm"));
    EXPECT_EQ(Messages, 0);
}

}  // namespace
