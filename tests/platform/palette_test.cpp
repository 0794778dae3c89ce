// Colours: the desktop's, kept legible, and our own, which stay when those change.
#include "platform/legible_style.h"
#include "support/program_fixture.h"

namespace {

using Palettes = RunningGame;

// The lightest grey that is legible on white is 118, by the usual tables.
TEST_F(Palettes, TextsAreMovedFromTheirBackgroundNoFurtherThanNeeded) {
    for (const auto& [text, background] : {std::pair(QPalette::Text, QPalette::Base),
                                           {QPalette::Highlight, QPalette::HighlightedText}}) {
        for (const int grey : {118, 140}) {
            QPalette palette(Qt::black, Qt::white);
            palette.setColor(text, QColor(grey, grey, grey));
            palette.setColor(background, Qt::white);
            LegibleStyle().polish(palette);
            EXPECT_EQ(palette.color(background), QColor(Qt::white));
            EXPECT_LE(palette.color(text).red(), 118);
            EXPECT_GE(palette.color(text).red(), grey == 118 ? 118 : 110);
        }
    }
}

TEST_F(Palettes, ADesktopThatTurnsDarkChangesTilesAndPicturesButNoColourOfOurs) {
    press("End");
    select("DictWords", "cat");
    const auto pixel = [this](const char* name, int place) {
        return control(name)->grab().toImage().pixelColor(place, place);
    };
    const auto goSign = [this] {
        const QIcon icon = control<QAbstractButton>("Start")->icon();
        return icon.pixmap(16).toImage().pixelColor(8, 8).lightness();
    };
    const int lightGoSign = goSign();
    const QPalette before = QApplication::palette();
    const QPalette dark(QColor(50, 54, 58), QColor(40, 44, 48));
    QApplication::setPalette(dark);
    for (QWidget* widget : QApplication::allWidgets()) widget->setPalette(dark);
    QCoreApplication::processEvents();
    QApplication::setPalette(before);
    EXPECT_EQ(pixel("Cube0", 0), QColor(40, 44, 48));
    EXPECT_GT(goSign(), lightGoSign);
    EXPECT_EQ(pixel("ResultCubes0", 3), QColor(128, 255, 128));
    EXPECT_EQ(pixel("ResultCubes3", 3), QColor(255, 192, 128));
}

}  // namespace
