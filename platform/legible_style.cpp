#include "platform/legible_style.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <utility>

namespace {

constexpr double Legible = 4.5;
constexpr int Steps = 20;
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

}  // namespace

// The text moves first: a window's background is best left as the desktop has it.
// Selected text is mostly black or white already; there the background moves.
void LegibleStyle::polish(QPalette& palette) {
    QProxyStyle::polish(palette);
    for (const auto group : {QPalette::Active, QPalette::Inactive}) {
        for (const auto& [textRole, backgroundRole] : Pairs) {
            const QColor text = palette.color(group, textRole);
            const QColor background = palette.color(group, backgroundRole);
            if (Contrast(text, background) >= Legible) continue;
            const double end = Luminance(text) > Luminance(background) ? 1 : 0;
            const QColor clearText = MovedFrom(background, text, end);
            palette.setColor(group, textRole, clearText);
            palette.setColor(group, backgroundRole, MovedFrom(clearText, background, 1 - end));
        }
    }
}
