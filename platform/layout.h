#pragma once
// Places, fonts and keys that the windows share. Layouts are absolute, in twips,
// 15 to a logical pixel; fonts are sized in logical pixels too, so that the
// desktop's font resolution cannot tear text and boxes apart.
#include <QFont>

class QAbstractButton;
class QAbstractScrollArea;
class QLabel;
class QWidget;

namespace Platform {

constexpr int TwipsPerPixel = 15;

/// Logical pixels of a length in twips, to the nearest.
constexpr int Twips(int twips) {
    return (twips + TwipsPerPixel / 2) / TwipsPerPixel;
}

/// A place in twips, from the parent's top left corner.
struct TwipsRect {
    int left;
    int top;
    int width;
    int height;
};

/// The same in pixels, for windows that are laid out in pixels.
constexpr TwipsRect Pixels(int left, int top, int width, int height) {
    return {left * TwipsPerPixel, top * TwipsPerPixel, width * TwipsPerPixel,
            height * TwipsPerPixel};
}

/// Reads which fonts there are, as the first text would. Any thread may, once the locale is set.
void ReadFontList();

enum class Typeface { SansSerif, Arial, Courier };

/// A font of `points` (72 to the inch, the inch being 96 logical pixels).
QFont LayoutFont(Typeface typeface, double points, bool bold = false);

/// The font of words in lists and text boxes.
QFont WordFont();

/// The font of controls that name none.
QFont PlainFont();

/// Names a control, puts it in its place and gives it its font.
void SetUp(QWidget* control, const char* name, TwipsRect place, const QFont& font);

/// A centred label without text.
QLabel* MakeLabel(QWidget* parent, const char* name, TwipsRect place, const QFont& font);

/// Return and the keypad's Enter click `button` wherever the focus is in `window`.
void SetDefaultButton(QWidget* window, QAbstractButton* button);

/// The font made narrower until `text` fits into `width` logical pixels, where it
/// does not by itself.
QFont Condensed(QFont font, const QString& text, int width);

/// Shows a text in a label, in `font` condensed to the label's width.
void ShowFitting(QLabel& label, const QFont& font, const QString& text);

/// The room for text in a list's or grid's row, beside its scroll bar.
int RowTextWidth(const QAbstractScrollArea& list);

}  // namespace Platform
