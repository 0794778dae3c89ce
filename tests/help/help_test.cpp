#include <QImage>
#include <QTextBrowser>

#include "support/program_fixture.h"

namespace {

int Messages = 0;  // written to the terminal by the toolkit

class Help : public ProgramFixture {
  protected:
    Help() {
        folder_.write("program/Quorle.htm", "<p><a href=\"more.htm\">more</a> <p>Help");
        folder_.write("program/more.htm", "<p>More");
        launch();
        press("HelpButton");
    }
    QTextBrowser& viewer() { return *qobject_cast<QTextBrowser*>(control("WebBrowser")); }

    /// The page shown after a menu command.
    std::string after(const std::string& command) {
        menu("HelpBrowser/" + command);
        return viewer().source().fileName().toStdString();
    }
};

TEST_F(Help, WalksThroughTheHistoryThatTheTitleBarDrops) {
    bringToFront("HelpBrowser");
    EXPECT_EQ(viewer().geometry().bottom(), control("HelpBrowser")->rect().bottom());
    EXPECT_EQ(after("Back"), "Quorle.htm");
    EXPECT_EQ(after("Forward"), "Quorle.htm");
    viewer().setFocus();
    key(Qt::Key_Tab);
    key(Qt::Key_Return);  // follows the link
    EXPECT_EQ(viewer().toPlainText(), "More");
    EXPECT_EQ(after("Back"), "Quorle.htm");
    EXPECT_EQ(after("Forward"), "more.htm");
    EXPECT_EQ(after("Contents"), "Quorle.htm");
    EXPECT_EQ(after("Back"), "more.htm");
    after("Exit");
    EXPECT_FALSE(isShown("HelpBrowser"));
    press("HelpButton");
    EXPECT_EQ(after("Back"), "more.htm");
    closeByTitleBar("HelpBrowser");
    press("HelpButton");
    EXPECT_EQ(after("Back"), "Quorle.htm");
}

TEST_F(Help, ThePageShipsWithItsPicture) {
    closeByTitleBar("HelpBrowser");
    for (const char* file : {"Quorle.htm", "Quorle.png"}) {
        std::filesystem::copy_file(std::string(QUORLE_HELP) + file,
                                   folder_ / (std::string("program/") + file),
                                   std::filesystem::copy_options::overwrite_existing);
    }
    press("HelpButton");
    const QTextDocument& page = *viewer().document();
    const QVariant loaded = page.resource(QTextDocument::ImageResource, QUrl("Quorle.png"));
    const QImage picture = loaded.canConvert<QImage>() && !loaded.canConvert<QByteArray>()
                               ? loaded.value<QImage>()
                               : QImage::fromData(loaded.toByteArray());
    EXPECT_EQ(picture.size(), QSize(385, 385));
    EXPECT_TRUE(viewer().toHtml().contains("src=\"Quorle.png\""));
}

TEST_F(Help, AMissingPageIsToldInItsPlaceAlone) {
    closeByTitleBar("HelpBrowser");
    std::filesystem::remove(folder_ / "program/Quorle.htm");
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
