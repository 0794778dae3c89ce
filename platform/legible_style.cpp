#include "platform/legible_style.h"

#include <QPainter>
#include <QStyleOption>
#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

namespace {

constexpr double Legible = 4.5;
constexpr int Steps = 20;
constexpr int SparedHeight = 8;  // more than this no style can do without
constexpr QMargins TextMargins(4, 2, 0, 2);
constexpr std::array Pairs{std::pair{QPalette::WindowText, QPalette::Window},
                           std::pair{QPalette::Text, QPalette::Base},
                           std::pair{QPalette::ButtonText, QPalette::Button},
                           std::pair{QPalette::HighlightedText, QPalette::Highlight}};

double Linear(double part) {
    return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
}

double Luminance(const QColor& colour) {
    return 0.2126 * Linear(colour.redF()) + 0.7152 * Linear(colour.greenF()) +
           0.0722 * Linear(colour.blueF());
}

double Contrast(const QColor& one, const QColor& other) {
    const auto [dark, light] = std::minmax({Luminance(one), Luminance(other)});
    return (light + 0.05) / (dark + 0.05);
}

// The colour, moved towards black or white no further than contrast demands.
QColor MovedFrom(const QColor& other, const QColor& colour, double end) {
    QColor moved = colour;
    for (int step = 1; step <= Steps && Contrast(moved, other) < Legible; ++step) {
        const double share = static_cast<double>(step) / Steps;
        const auto mix = [=](double part) {
            return static_cast<float>(part + (end - part) * share);
        };
        moved.setRgbF(mix(colour.redF()), mix(colour.greenF()), mix(colour.blueF()));
    }
    return moved;
}

// Where a text goes, 1 for white: further from its background; selected text so
// that selections, in whose colour the focus is drawn, stand out from the window.
double TextEnd(const QPalette& palette, QPalette::ColorGroup group, QPalette::ColorRole text,
               QPalette::ColorRole background) {
    const bool selected = text == QPalette::HighlightedText;
    const QColor dark = palette.color(group, selected ? QPalette::WindowText : background);
    const QColor light = palette.color(group, selected ? QPalette::Window : text);
    return Luminance(light) > Luminance(dark) ? 1 : 0;
}

}  // namespace

// The text moves first: a background is best left as the desktop has it.
void LegibleStyle::polish(QPalette& palette) {
    QProxyStyle::polish(palette);
    for (const auto group : {QPalette::Active, QPalette::Inactive}) {
        for (const auto& [textRole, backgroundRole] : Pairs) {
            const QColor text = palette.color(group, textRole);
            const QColor background = palette.color(group, backgroundRole);
            if (Contrast(text, background) >= Legible) continue;
            const double end = TextEnd(palette, group, textRole, backgroundRole);
            const QColor clearText = MovedFrom(background, text, end);
            palette.setColor(group, textRole, clearText);
            palette.setColor(group, backgroundRole, MovedFrom(clearText, background, 1 - end));
        }
    }
}

// Most styles show a list's focus on its current row, and an empty list has none;
// and Fusion marks a menu bar's item only while its menu is open.
void LegibleStyle::drawControl(ControlElement element, const QStyleOption* option,
                               QPainter* painter, const QWidget* widget) const {
    const auto* item = qstyleoption_cast<const QStyleOptionMenuItem*>(option);
    if (element == CE_MenuBarItem && item != nullptr && item->state.testFlag(State_Selected)) {
        QStyleOptionMenuItem marked(*item);
        marked.state |= State_Sunken;
        return QProxyStyle::drawControl(element, &marked, painter, widget);
    }
    QProxyStyle::drawControl(element, option, painter, widget);
    const auto* frame = qstyleoption_cast<const QStyleOptionFrame*>(option);
    if (element == CE_ShapedFrame && frame != nullptr && frame->frameShape != QFrame::NoFrame &&
        frame->state.testFlag(State_HasFocus)) {
        painter->setPen(option->palette.color(QPalette::Highlight));
        painter->drawRect(option->rect.adjusted(0, 0, -1, -1));
    }
}

// Some styles leave out the frame and the arrow of a low box that can be typed in,
// but not those of another.
void LegibleStyle::drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                                      QPainter* painter, const QWidget* widget) const {
    const auto* box = qstyleoption_cast<const QStyleOptionComboBox*>(option);
    if (box == nullptr || widget == nullptr ||
        widget->sizeHint().height() - widget->height() <= SparedHeight) {
        return QProxyStyle::drawComplexControl(control, option, painter, widget);
    }
    QStyleOptionComboBox low(*box);
    low.editable = false;
    QProxyStyle::drawComplexControl(control, &low, painter, widget);
}

// A mark of a fixed size is scaled to its box, which would cut it off.
void LegibleStyle::drawPrimitive(PrimitiveElement element, const QStyleOption* option,
                                 QPainter* painter, const QWidget* widget) const {
    const bool cut = element == PE_IndicatorCheckBox && widget != nullptr &&
                     option->rect.right() > widget->rect().right();
    if (!cut) return QProxyStyle::drawPrimitive(element, option, painter, widget);
    const double share = static_cast<double>(widget->width()) / (option->rect.right() + 1);
    painter->save();
    painter->translate(0, option->rect.center().y() * (1 - share));
    painter->scale(share, share);
    QProxyStyle::drawPrimitive(element, option, painter, widget);
    painter->restore();
}

// Some draw the text of a low box upon its frame.
QRect LegibleStyle::subControlRect(ComplexControl control, const QStyleOptionComplex* option,
                                   SubControl part, const QWidget* widget) const {
    const QRect place = QProxyStyle::subControlRect(control, option, part, widget);
    const bool upon = control == CC_ComboBox && part == SC_ComboBoxEditField &&
                      place.left() == option->rect.left();
    return upon ? place.marginsRemoved(TextMargins) : place;
}
