#include "support/program_fixture.h"

namespace {

class Help : public PlayedBoard {
  protected:
    QTextBrowser& viewer() { return *control<QTextBrowser>("WebBrowser"); }

    /// The page shown after a menu command.
    std::string after(const std::string& command) {
        menu("HelpBrowser/" + command);
        return viewer().source().fileName().toStdString();
    }
};

TEST_F(Help, WalksThroughTheHistoryThatTheTitleBarDrops) {
    folder_.write("program/Quorle.htm", "<p><a href=\"more.htm\">more</a> <p>Help");
    folder_.write("program/more.htm", "<p>More");
    press("HelpButton");
    bringToFront("HelpBrowser");
    EXPECT_EQ(after("Back"), "Quorle.htm");
    viewer().setFocus();
    key(Qt::Key_Tab);
    EXPECT_EQ(told_, Words{"link more"});
    key(Qt::Key_Return);  // follows the link
    EXPECT_EQ(viewer().toPlainText(), "More");
    EXPECT_EQ(after("Back"), "Quorle.htm");
    EXPECT_EQ(after("Forward"), "more.htm");
    EXPECT_EQ(after("Contents"), "Quorle.htm");
    after("Exit");
    EXPECT_FALSE(isShown("HelpBrowser"));
    press("HelpButton");
    EXPECT_EQ(after("Back"), "more.htm");
    press("HelpButton");  // an open one, too, begins with the contents
    EXPECT_EQ(after("Back"), "more.htm");
    closeByTitleBar("HelpBrowser");
    press("HelpButton");
    EXPECT_EQ(after("Back"), "Quorle.htm");
}

TEST_F(Help, ThePageShipsWithItsPicture) {
    std::filesystem::copy(QUORLE_HELP, folder_ / "program");
    press("HelpButton");
    EXPECT_TRUE(viewer().toHtml().contains("src=\"Quorle.png\""));
    const auto picture =
        viewer().loadResource(QTextDocument::ImageResource, QUrl("Quorle.png")).toByteArray();
    EXPECT_EQ(QImage::fromData(picture).size(), QSize(385, 385));
}

TEST_F(Help, AMissingPageIsToldInItsPlace) {
    press("HelpButton");
    EXPECT_TRUE(viewer().toPlainText().contains("Quorle.htm"));
}

}  // namespace
