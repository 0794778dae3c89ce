// Colours: the desktop's, kept legible, and our own, which stay when those change.
#include <QAbstractButton>
#include <QApplication>
#include <QLineEdit>
#include <QStyleOption>

#include "platform/legible_style.h"
#include "support/program_fixture.h"

namespace {

using Palettes = PlayedBoard;

// As some are: a large mark; a box too low for a frame has none, nor an arrow or margins.
struct RoomyStyle : QProxyStyle {
    RoomyStyle() : QProxyStyle("Fusion") {}
    QSize sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& size,
                           const QWidget* widget) const override {
        return QProxyStyle::sizeFromContents(type, option, size + QSize(0, 20), widget);
    }
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

QColor Polished(QPalette::ColorRole wanted, const QPalette& given) {
    QPalette palette = given;
    LegibleStyle().polish(palette);
    return palette.color(QPalette::Inactive, wanted);
}

// The lightest grey that is legible on white is 118, by the usual tables.
TEST_F(Palettes, TextsAreMovedFromTheirBackgroundNoFurtherThanNeeded) {
    QPalette palette;
    palette.setColor(QPalette::Base, Qt::white);
    palette.setColor(QPalette::Text, QColor(118, 118, 118));
    EXPECT_EQ(Polished(QPalette::Text, palette), QColor(118, 118, 118));
    palette.setColor(QPalette::Text, QColor(140, 140, 140));
    EXPECT_LE(Polished(QPalette::Text, palette).red(), 118);
    EXPECT_GE(Polished(QPalette::Text, palette).red(), 110);
    EXPECT_EQ(Polished(QPalette::Base, palette), QColor(Qt::white));
    palette.setColor(QPalette::HighlightedText, Qt::white);
    palette.setColor(QPalette::Highlight, QColor(140, 140, 140));
    EXPECT_LE(Polished(QPalette::Highlight, palette).red(), 118);
    EXPECT_EQ(Polished(QPalette::HighlightedText, palette), QColor(Qt::white));
    palette.setColor(QPalette::Window, Qt::black);
    palette.setColor(QPalette::WindowText, Qt::white);
    EXPECT_EQ(Polished(QPalette::Highlight, palette), QColor(140, 140, 140));
    EXPECT_LE(Polished(QPalette::HighlightedText, palette).red(), 26);
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

TEST_F(Palettes, ADesktopThatTurnsDarkChangesTilesAndPicturesButNoColourOfOurs) {
    start("CATSBONEWILDHEFY");
    press("End");
    select("DictWords", "cat");
    const auto pixel = [this](const char* name, QPoint place) {
        return control(name)->grab().toImage().pixelColor(place);
    };
    const auto goSign = [this] {
        auto* button = qobject_cast<QAbstractButton*>(control("Start"));
        return button->icon().pixmap(16).toImage().pixelColor(8, 8);
    };
    const QColor lightGoSign = goSign();
    const QColor darkWindow(40, 44, 48);
    const QPalette before = QApplication::palette();
    const QPalette dark(QColor(50, 54, 58), darkWindow);
    QApplication::setPalette(dark);
    for (QWidget* widget : QApplication::allWidgets()) widget->setPalette(dark);
    QCoreApplication::processEvents();
    EXPECT_EQ(pixel("Cube0", {0, 0}), darkWindow);
    EXPECT_GT(goSign().lightness(), lightGoSign.lightness());
    EXPECT_EQ(pixel("ResultCubes0", {3, 3}), QColor(128, 255, 128));
    EXPECT_EQ(pixel("ResultCubes3", {3, 3}), QColor(255, 192, 128));
    EXPECT_EQ(control("AddToDict")->palette().color(QPalette::Button), QColor(128, 255, 128));
    QApplication::setPalette(before);
}

}  // namespace
