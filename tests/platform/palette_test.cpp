// Colours: the desktop's, kept legible, and our own, which stay when those change.
#include "platform/legible_style.h"
#include "support/program_fixture.h"

namespace {

using Palettes = RunningGame;

// As some are: a large mark; a box too low for a frame has none, nor an arrow or margins.
struct RoomyStyle : QProxyStyle {
    RoomyStyle() : QProxyStyle("Fusion") {}
    int pixelMetric(PixelMetric, const QStyleOption*, const QWidget*) const override { return 30; }
    QRect subControlRect(ComplexControl, const QStyleOptionComplex* option, SubControl,
                         const QWidget*) const override {
        return option->rect.adjusted(0, 0, -30, 0);
    }
    void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                            QPainter* painter, const QWidget* widget) const override {
        if (qstyleoption_cast<const QStyleOptionComboBox*>(option)->editable) return;
        QProxyStyle::drawComplexControl(control, option, painter, widget);
    }
};

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

TEST_F(Palettes, WhatTheDesktopWouldHaveLargerIsDrawnWhole) {
    press("Options");
    LegibleStyle style(new RoomyStyle);
    for (const char* name : {"TimeCombo", "SoundsOption"}) {
        QWidget* small = control(name);
        small->setStyle(&style);
        small->setProperty("checked", false);
        const QImage picture = small->grab().toImage();
        const QColor edge = picture.pixelColor(small->width() - 1, small->height() / 2);
        EXPECT_LT(edge.lightness(), small->palette().color(QPalette::Window).lightness()) << name;
    }
    EXPECT_GT(control("TimeCombo")->findChild<QLineEdit*>()->x(), 0);
}

TEST_F(Palettes, AnEmptyListShowsThatItHasTheFocus) {
    LegibleStyle style;
    press("End");
    QWidget& list = *control("UserWords");
    list.setStyle(&style);
    list.setFocus();
    EXPECT_TRUE(comesToFront("Results"));
    EXPECT_EQ(list.grab().toImage().pixelColor(0, 9), list.palette().color(QPalette::Highlight));
}

TEST_F(Palettes, ADesktopThatTurnsDarkChangesTilesAndPicturesButNoColourOfOurs) {
    press("End");
    select("DictWords", "cat");
    const auto pixel = [this](const char* name, int place) {
        return control(name)->grab().toImage().pixelColor(place, place);
    };
    const int goSign = pixel("Start", 15).lightness();
    const QPalette before = QApplication::palette();
    const QPalette dark(QColor(50, 54, 58), QColor(40, 44, 48));
    QApplication::setPalette(dark);
    for (QWidget* widget : QApplication::allWidgets()) widget->setPalette(dark);
    QCoreApplication::processEvents();
    QApplication::setPalette(before);
    EXPECT_EQ(pixel("Cube0", 0), QColor(40, 44, 48));
    EXPECT_GT(pixel("Start", 15).lightness(), goSign);
    EXPECT_EQ(pixel("ResultCubes0", 3), QColor(128, 255, 128));
    EXPECT_EQ(pixel("ResultCubes3", 3), QColor(255, 192, 128));
}

}  // namespace
