#include <QAction>
#include <QFile>
#include <QRegularExpression>
#include <QSet>
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

TEST_F(Help, WalksThroughTheHistory) {
    press("HelpButton");
    bringToFront("HelpBrowser");
    EXPECT_EQ(page(), "Quorle.htm");
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
}

TEST_F(Help, ExitKeepsTheHistoryAndTheTitleBarDropsIt) {
    press("HelpButton");
    bringToFront("HelpBrowser");
    followLink();
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

TEST_F(Help, TheViewerFillsTheWindowAtAnySize) {
    press("HelpButton");
    QWidget* window = control("HelpBrowser");
    EXPECT_EQ(viewer().size(), QSize(567, 412));
    window->resize(700, 300);
    EXPECT_EQ(viewer().width(), 700);
    EXPECT_EQ(viewer().geometry().bottom(), window->rect().bottom());
    EXPECT_EQ(viewer().geometry().top(), window->findChild<QWidget*>("MenuBar")->height());
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

// Every link leads to a place on the page, and every picture is in the page.
TEST_F(Help, ThePageOfTheProgramIsWhole) {
    QFile file(HELP_PAGE);
    ASSERT_TRUE(file.open(QFile::ReadOnly));
    const QByteArray html = file.readAll();
    write("Quorle.htm", html);
    press("HelpButton");
    EXPECT_EQ(viewer().documentTitle(), "Quorle Help");
    QSet<QString> places;
    int links = 0;
    for (auto found = QRegularExpression("name=\"(\\w+)\"").globalMatch(html); found.hasNext();) {
        places += found.next().captured(1);
    }
    for (auto found = QRegularExpression("href=\"(.*?)\"").globalMatch(html); found.hasNext();) {
        const QString target = found.next().captured(1);
        EXPECT_TRUE(target.startsWith('#') && places.contains(target.mid(1)))
            << target.toStdString();
        ++links;
    }
    EXPECT_GT(links, 10);
    const auto picture = QRegularExpression("src=\"data:image/png;base64,(.*?)\"").match(html);
    EXPECT_FALSE(QImage::fromData(QByteArray::fromBase64(picture.captured(1).toLatin1())).isNull());
}

}  // namespace
