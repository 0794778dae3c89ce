#include "platform/layout.h"

#include <dlfcn.h>

#include <QAbstractButton>
#include <QAbstractScrollArea>
#include <QApplication>
#include <QFontMetrics>
#include <QKeyEvent>
#include <QLabel>
#include <QMenuBar>
#include <QStyle>
#include <QVariant>
#include <cmath>

namespace {

constexpr double PixelsPerPoint = 96.0 / 72.0;
constexpr int PlainFontPixels = 11;
constexpr int CellPadding = 8;
constexpr const char* DefaultButtonProperty = "defaultButton";

QFont FontOf(Platform::Typeface typeface, int pixels, bool bold) {
    QFont font;
    // The Liberation fonts are as wide as Arial and Courier New, and part of every
    // installation: first, they make the windows the same everywhere.
    switch (typeface) {
        case Platform::Typeface::SansSerif:
            font.setFamilies({"Liberation Sans", "sans-serif"});
            break;
        case Platform::Typeface::Arial:
            font.setFamilies({"Liberation Sans", "Arial", "sans-serif"});
            break;
        case Platform::Typeface::Courier:
            font.setFamilies({"Liberation Mono", "Courier New", "monospace"});
            font.setStyleHint(QFont::TypeWriter);
            break;
    }
    // Our texts are ASCII; looking for fonts that fill gaps would delay the start.
    font.setStyleStrategy(QFont::NoFontMerging);
    font.setPixelSize(pixels);
    font.setBold(bold);
    return font;
}

// The filter sees a key before any control does: a shortcut would depend on the
// toolkit's idea of the active window, and lists and buttons take Return.
class ReturnKeys : public QObject {
  public:
    using QObject::QObject;

    bool eventFilter(QObject* receiver, QEvent* event) override {
        if (event->type() != QEvent::KeyPress || !receiver->isWidgetType()) return false;
        const auto* key = static_cast<QKeyEvent*>(event);
        if (key->key() != Qt::Key_Return && key->key() != Qt::Key_Enter) return false;
        if (qobject_cast<QMenuBar*>(receiver) != nullptr) return false;  // opens a menu
        if ((key->modifiers() & ~Qt::KeypadModifier) != Qt::NoModifier) return false;
        const QWidget* window = static_cast<QWidget*>(receiver)->window();
        auto* button = window->property(DefaultButtonProperty).value<QAbstractButton*>();
        if (button == nullptr) return false;
        button->click();
        return true;
    }
};

}  // namespace

namespace Platform {

// The toolkit's own way asks for the application first; where it has no fontconfig, nothing is
// done.
void ReadFontList() {
    if (void* read = dlsym(RTLD_DEFAULT, "FcInit")) reinterpret_cast<int (*)()>(read)();
}

QFont LayoutFont(Typeface typeface, double points, bool bold) {
    return FontOf(typeface, static_cast<int>(std::lround(points * PixelsPerPoint)), bold);
}

QFont WordFont() {
    return LayoutFont(Typeface::Courier, 18, true);
}

QFont PlainFont() {
    return FontOf(Typeface::SansSerif, PlainFontPixels, false);
}

void SetUp(QWidget* control, const char* name, TwipsRect place, const QFont& font) {
    control->setObjectName(name);
    control->setGeometry(Twips(place.left), Twips(place.top), Twips(place.width),
                         Twips(place.height));
    control->setFont(font);
}

QLabel* MakeLabel(QWidget* parent, const char* name, TwipsRect place, const QFont& font) {
    auto* label = new QLabel(parent);
    SetUp(label, name, place, font);
    label->setAlignment(Qt::AlignCenter);
    label->setTextFormat(Qt::PlainText);
    return label;
}

void SetDefaultButton(QWidget* window, QAbstractButton* button) {
    static ReturnKeys* const keys = [] {
        auto* filter = new ReturnKeys(qApp);
        qApp->installEventFilter(filter);
        return filter;
    }();
    Q_UNUSED(keys)
    window->setProperty(DefaultButtonProperty, QVariant::fromValue(button));
}

QFont Condensed(QFont font, const QString& text, int width) {
    const int natural = QFontMetrics(font).horizontalAdvance(text);
    if (natural > width) font.setStretch(QFont::Unstretched * width / natural);
    return font;
}

void ShowFitting(QLabel& label, const QFont& font, const QString& text) {
    label.setFont(Condensed(font, text, label.width()));
    label.setText(text);
}

int RowTextWidth(const QAbstractScrollArea& list) {
    const int scrollBar = list.style()->pixelMetric(QStyle::PM_ScrollBarExtent);
    return list.width() - 2 * list.frameWidth() - scrollBar - CellPadding;
}

}  // namespace Platform
